#include "host/ProjectJson.h"

namespace {

template <typename T, typename F>
CJsonValue Optional(const std::optional<T>& value, F make) {
    return value ? make(*value) : CJsonValue();
}

CJsonValue Int(int64_t n) {
    return CJsonValue::Int(n);
}
CJsonValue Text(const std::string& s) {
    return CJsonValue::String(s);
}
CJsonValue Group(const std::optional<size_t>& group) {
    return Optional(group, [](size_t n) { return CJsonValue::Int(int64_t(n)); });
}

CJsonValue Points(const std::vector<CPlanPoint>& points) {
    CJsonValue array = CJsonValue::Array();
    for (const CPlanPoint& p : points) {
        CJsonValue& pair = array.Add(CJsonValue::Array());
        pair.Add(CJsonValue::Float(p.first));
        pair.Add(CJsonValue::Float(p.second));
    }
    return array;
}

CJsonValue Property(const CPropertyList::CValue& value) {
    if (const auto* pl = std::get_if<LONG>(&value)) {
        return Int(*pl);
    }
    if (const auto* pf = std::get_if<float>(&value)) {
        return CJsonValue::Float(*pf);
    }
    if (const auto* pb = std::get_if<bool>(&value)) {
        return CJsonValue::Bool(*pb);
    }
    return Points(std::get<std::vector<CPlanPoint>>(value));
}

CJsonValue Toolbar(const std::vector<CToolbarElement>& elements) {
    CJsonValue array = CJsonValue::Array();
    for (const CToolbarElement& e : elements) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("handle", Int(e.lHandle));
        o.Set("parent", e.lParent ? Int(e.lParent) : CJsonValue());
        o.Set("kind", Text(e.strKind));
        o.Set("text", Optional(e.text, Text));
        o.Set("bitmap", Optional(e.bitmap, Text));
        o.Set("number", Optional(e.number, Int));
        o.Set("style", Optional(e.style, Int));
    }
    return array;
}

CJsonValue HeightPoints(const std::vector<CHeightPoint>& points) {
    CJsonValue array = CJsonValue::Array();
    for (const CHeightPoint& p : points) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("x", CJsonValue::Float(p.fX));
        o.Set("y", CJsonValue::Float(p.fY));
        o.Set("z", CJsonValue::Float(p.fZ));
        o.Set("group", Group(p.group));
    }
    return array;
}

CJsonValue Sites(const std::vector<CSiteRecord>& sites) {
    CJsonValue array = CJsonValue::Array();
    for (const CSiteRecord& s : sites) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("kind", Int(s.lKind));
        o.Set("outline", Points(s.outline));
        o.Set("closed", CJsonValue::Bool(s.bClosed));
        o.Set("group", Group(s.group));
    }
    return array;
}

CJsonValue Objects(const std::vector<CPlacedObject>& objects) {
    CJsonValue array = CJsonValue::Array();
    for (const CPlacedObject& p : objects) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("file", Text(p.strFile));
        o.Set("matrix", Optional(p.matrix, [](const std::array<float, 16>& m) {
                  CJsonValue values = CJsonValue::Array();
                  for (const float f : m) {
                      values.Add(CJsonValue::Float(f));
                  }
                  return values;
              }));
        o.Set("mode", Optional(p.mode, Int));
        o.Set("level", Optional(p.level, Int));
        o.Set("group", Group(p.group));
    }
    return array;
}

CJsonValue EditGroups(const std::vector<CEditGroupRecord>& groups) {
    CJsonValue array = CJsonValue::Array();
    for (const CEditGroupRecord& g : groups) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("name", Text(g.strName));
        o.Set("state", Text(g.eState == EGroupState::Committed   ? "committed"
                            : g.eState == EGroupState::Cancelled ? "cancelled"
                                                                 : "open"));
    }
    return array;
}

CJsonValue Overlays(const std::vector<COverlaySnapshot>& overlays) {
    CJsonValue array = CJsonValue::Array();
    for (const COverlaySnapshot& snapshot : overlays) {
        CJsonValue& objects = array.Add(CJsonValue::Array());
        for (const CGraphicSnapshot& graphic : snapshot) {
            CJsonValue& o = objects.Add(CJsonValue::Object());
            o.Set("type", Text(graphic.strType));
            for (const auto& [name, value] : graphic.properties.Items()) {
                o.Set(name, Property(value));
            }
        }
    }
    return array;
}

CJsonValue Messages(const std::vector<CMessageRecord>& messages) {
    CJsonValue array = CJsonValue::Array();
    for (const CMessageRecord& m : messages) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("text", Text(m.strText));
        o.Set("caption", Text(m.strCaption));
        o.Set("style", Int(m.uStyle));
        o.Set("answer", Text(m.strAnswer));
    }
    return array;
}

CJsonValue Progress(const std::vector<CProgressRecord>& calls) {
    CJsonValue array = CJsonValue::Array();
    for (const CProgressRecord& p : calls) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("call", Text(p.strCall));
        if (p.text) {
            o.Set("text", Text(*p.text));
        }
        if (p.percent) {
            o.Set("percent", Int(*p.percent));
        }
    }
    return array;
}

CJsonValue Help(const std::vector<CHelpRecord>& calls) {
    CJsonValue array = CJsonValue::Array();
    for (const CHelpRecord& h : calls) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("path", Text(h.strPath));
        o.Set("context", Int(int64_t(h.context)));
    }
    return array;
}

CJsonValue Leaks(const std::vector<CLeakRecord>& leaks) {
    CJsonValue array = CJsonValue::Array();
    for (const CLeakRecord& l : leaks) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("line", Optional(l.line, Int));
        o.Set("event", Text(l.strEvent));
        o.Set("object", Text(l.strObject));
        o.Set("refs", Int(l.lRefs));
    }
    return array;
}

CJsonValue Undelivered(const std::vector<CUndeliveredRecord>& events) {
    CJsonValue array = CJsonValue::Array();
    for (const CUndeliveredRecord& u : events) {
        CJsonValue& o = array.Add(CJsonValue::Object());
        o.Set("line", Int(u.nLine));
        o.Set("event", Text(u.strEvent));
        o.Set("reason", Text(u.strReason));
    }
    return array;
}

}  // namespace

CJsonValue ProjectToJson(const CProject& project, bool bTrace) {
    CJsonValue root = CJsonValue::Object();
    root.Set("connected", CJsonValue::Bool(project.bConnected));
    root.Set("toolbar", Toolbar(project.toolbar));
    root.Set("heightPoints", HeightPoints(project.heightPoints));
    root.Set("sites", Sites(project.sites));
    root.Set("objects", Objects(project.objects));
    root.Set("editGroups", EditGroups(project.editGroups));
    root.Set("overlays", Overlays(project.overlays));
    root.Set("messages", Messages(project.messages));
    root.Set("progress", Progress(project.progress));
    root.Set("help", Help(project.help));
    root.Set("leaks", Leaks(project.leaks));
    root.Set("undelivered", Undelivered(project.undelivered));
    if (bTrace) {
        CJsonValue& trace = root.Set("trace", CJsonValue::Array());
        for (const std::string& line : project.trace) {
            trace.Add(Text(line));
        }
    }
    return root;
}
