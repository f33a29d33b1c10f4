#include "host/Svg.h"

#include <algorithm>
#include <cmath>

#include "host/Json.h"

namespace {

constexpr double kSize = 800;
constexpr double kMargin = 40;

float PropertyFloat(const CPropertyList& properties, const char* pszName) {
    const CPropertyList::CValue* pValue = properties.Find(pszName);
    const float* pf = pValue ? std::get_if<float>(pValue) : nullptr;
    return pf ? *pf : 0.0f;
}

std::vector<CPlanPoint> PropertyPoints(const CPropertyList& properties) {
    const CPropertyList::CValue* pValue = properties.Find("points");
    const auto* pPoints = pValue ? std::get_if<std::vector<CPlanPoint>>(pValue) : nullptr;
    return pPoints ? *pPoints : std::vector<CPlanPoint>();
}

bool PropertyClosed(const CPropertyList& properties) {
    const CPropertyList::CValue* pValue = properties.Find("closed");
    const bool* pb = pValue ? std::get_if<bool>(pValue) : nullptr;
    return pb && *pb;
}

// Maps plan metres (y up) to picture pixels (y down), fitted to everything that is drawn.
class CPlanFrame {
public:
    void Include(double x, double y) {
        if (!std::isfinite(x) || !std::isfinite(y)) {
            return;
        }
        m_minX = std::min(m_minX, x), m_maxX = std::max(m_maxX, x);
        m_minY = std::min(m_minY, y), m_maxY = std::max(m_maxY, y);
    }
    void Fit() {
        if (m_minX > m_maxX) {
            m_minX = m_maxX = m_minY = m_maxY = 0;
        }
        const double extent = std::max({m_maxX - m_minX, m_maxY - m_minY, 1e-6});
        m_scale = (kSize - 2 * kMargin) / extent;
    }
    std::string X(double x) const { return Number(kMargin + (x - m_minX) * m_scale); }
    std::string Y(double y) const { return Number(kMargin + (m_maxY - y) * m_scale); }
    std::string Length(double d) const { return Number(d * m_scale); }
    std::string Point(const CPlanPoint& p) const { return X(p.first) + "," + Y(p.second); }

private:
    static std::string Number(double v) {
        return FormatJsonFloat(float(std::round(v * 100) / 100));
    }
    double m_minX = INFINITY, m_maxX = -INFINITY, m_minY = INFINITY, m_maxY = -INFINITY;
    double m_scale = 1;
};

std::string Escape(const std::string& text) {
    std::string out;
    for (const char c : text) {
        out += c == '<' ? "&lt;" : c == '>' ? "&gt;" : c == '&' ? "&amp;" : std::string(1, c);
    }
    return out;
}

void IncludeGraphic(CPlanFrame& frame, const CGraphicSnapshot& g) {
    const CPropertyList& p = g.properties;
    if (g.strType == "line") {
        frame.Include(PropertyFloat(p, "x1"), PropertyFloat(p, "y1"));
        frame.Include(PropertyFloat(p, "x2"), PropertyFloat(p, "y2"));
    } else if (g.strType == "rectangle") {
        const float x = PropertyFloat(p, "x"), y = PropertyFloat(p, "y");
        frame.Include(x, y);
        frame.Include(x + PropertyFloat(p, "width"), y - PropertyFloat(p, "height"));
    } else {
        for (const CPlanPoint& point : PropertyPoints(p)) {
            frame.Include(point.first, point.second);
        }
    }
}

std::string PointList(const CPlanFrame& frame, const std::vector<CPlanPoint>& points) {
    std::string text;
    for (const CPlanPoint& p : points) {
        text += text.empty() ? "" : " ";
        text += frame.Point(p);
    }
    return text;
}

std::string DrawGraphic(const CPlanFrame& frame, const CGraphicSnapshot& g) {
    const CPropertyList& p = g.properties;
    const std::string style = R"( fill="none" stroke="#c00000" stroke-dasharray="4 3"/>)";
    if (g.strType == "line") {
        return "<line x1=\"" + frame.X(PropertyFloat(p, "x1")) + "\" y1=\"" +
               frame.Y(PropertyFloat(p, "y1")) + "\" x2=\"" + frame.X(PropertyFloat(p, "x2")) +
               "\" y2=\"" + frame.Y(PropertyFloat(p, "y2")) + "\"" + style;
    }
    if (g.strType == "rectangle") {
        return "<rect x=\"" + frame.X(PropertyFloat(p, "x")) + "\" y=\"" +
               frame.Y(PropertyFloat(p, "y")) + "\" width=\"" +
               frame.Length(PropertyFloat(p, "width")) + "\" height=\"" +
               frame.Length(PropertyFloat(p, "height")) + "\"" + style;
    }
    const char* pszElement = PropertyClosed(p) ? "polygon" : "polyline";
    return std::string("<") + pszElement + " points=\"" + PointList(frame, PropertyPoints(p)) +
           "\"" + style;
}

}  // namespace

std::string DrawPlan(const CProject& project) {
    CPlanFrame frame;
    for (const CSiteRecord& site : project.sites) {
        for (const CPlanPoint& p : site.outline) {
            frame.Include(p.first, p.second);
        }
    }
    for (const CHeightPoint& p : project.heightPoints) {
        frame.Include(p.fX, p.fY);
    }
    for (const CPlacedObject& o : project.objects) {
        if (o.matrix) {
            frame.Include((*o.matrix)[12], (*o.matrix)[13]);
        }
    }
    const COverlaySnapshot* pOverlay =
        project.overlays.empty() ? nullptr : &project.overlays.back();
    for (const CGraphicSnapshot& g : pOverlay ? *pOverlay : COverlaySnapshot()) {
        IncludeGraphic(frame, g);
    }
    frame.Fit();

    std::string svg =
        "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"800\" height=\"800\" "
        "viewBox=\"0 0 800 800\" font-family=\"sans-serif\" font-size=\"10\">\n"
        "<rect width=\"800\" height=\"800\" fill=\"white\"/>\n";
    for (const CSiteRecord& site : project.sites) {
        const char* pszFill = site.lKind == 2 ? "#d8ecd0" : "none";
        svg += std::string("<") + (site.bClosed ? "polygon" : "polyline") + " points=\"" +
               PointList(frame, site.outline) + "\" fill=\"" + pszFill +
               "\" stroke=\"#2f6f2f\" stroke-width=\"1.5\"/>\n";
    }
    for (const CPlacedObject& o : project.objects) {
        if (o.matrix) {
            svg += "<rect x=\"" + frame.X((*o.matrix)[12]) + "\" y=\"" + frame.Y((*o.matrix)[13]) +
                   "\" width=\"6\" height=\"6\" transform=\"translate(-3,-3)\" fill=\"#8a5a2b\">"
                   "<title>" +
                   Escape(o.strFile) + "</title></rect>\n";
        }
    }
    for (const CHeightPoint& p : project.heightPoints) {
        svg += "<circle cx=\"" + frame.X(p.fX) + "\" cy=\"" + frame.Y(p.fY) +
               "\" r=\"2.5\" fill=\"#1f4e9a\"/><text x=\"" + frame.X(p.fX) + "\" y=\"" +
               frame.Y(p.fY) + "\" dx=\"4\" dy=\"-4\">" + FormatJsonFloat(p.fZ) + "</text>\n";
    }
    for (const CGraphicSnapshot& g : pOverlay ? *pOverlay : COverlaySnapshot()) {
        svg += DrawGraphic(frame, g) + "\n";
    }
    return svg + "</svg>\n";
}
