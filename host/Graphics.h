// The temporary 2D graphics the plug-in creates for the view's overlay: line, polyline and
// rectangle objects that record every property set on them.
#pragma once

#include <vector>

#include "host/HostObject.h"

// What the overlay and the site placement read from any graphic object.
class CGraphicRecord {
public:
    explicit CGraphicRecord(const char* pszType) : m_pszType(pszType) {}
    virtual ~CGraphicRecord() = default;

    CGraphicSnapshot Snapshot() const { return {m_pszType, m_properties}; }
    const CPropertyList& Properties() const { return m_properties; }

protected:
    CPropertyList m_properties;

private:
    const char* m_pszType;
};

template <typename TInterface>
class CGraphicObject : public CDispatchObject<TInterface>, public CGraphicRecord {
public:
    CGraphicObject(CHostState& state, const char* pszType, const IID& iid)
        : CDispatchObject<TInterface>(state, pszType, iid), CGraphicRecord(pszType) {}

    HRESULT STDMETHODCALLTYPE SetDrawMode(LONG lMode) override { return Set("DrawMode", lMode); }
    HRESULT STDMETHODCALLTYPE SetRedraw(LONG lRedraw) override { return Set("Redraw", lRedraw); }

protected:
    void* GetInterface(REFIID riid) override {
        if (IsEqualIID(riid, IID_IOsrikGraphic2D)) {
            return static_cast<TInterface*>(this);
        }
        return CDispatchObject<TInterface>::GetInterface(riid);
    }

    // Records a property under its setter's name: "LineColor" is stored as "lineColor".
    template <typename TValue>
    HRESULT Set(const char* pszSetter, TValue value) {
        this->TraceCall(std::string("Set") + pszSetter, value);
        std::string name(pszSetter);
        name[0] = char(name[0] - 'A' + 'a');
        m_properties.Set(name, value);
        return S_OK;
    }
};

class CLineObject final : public CGraphicObject<IOsrikLine> {
public:
    explicit CLineObject(CHostState& state) : CGraphicObject(state, "line", IID_IOsrikLine) {}

    HRESULT STDMETHODCALLTYPE SetLineColor(LONG l) override { return Set("LineColor", l); }
    HRESULT STDMETHODCALLTYPE SetLineStyle(LONG l) override { return Set("LineStyle", l); }
    HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT f) override { return Set("LineWidth", f); }
    HRESULT STDMETHODCALLTYPE SetX1(FLOAT f) override { return Set("X1", f); }
    HRESULT STDMETHODCALLTYPE SetX2(FLOAT f) override { return Set("X2", f); }
    HRESULT STDMETHODCALLTYPE SetY1(FLOAT f) override { return Set("Y1", f); }
    HRESULT STDMETHODCALLTYPE SetY2(FLOAT f) override { return Set("Y2", f); }
};

class CPolylineObject final : public CGraphicObject<IOsrikPolyline> {
public:
    explicit CPolylineObject(CHostState& state)
        : CGraphicObject(state, "polyline", IID_IOsrikPolyline) {}

    HRESULT STDMETHODCALLTYPE SetFillColor(LONG l) override { return Set("FillColor", l); }
    HRESULT STDMETHODCALLTYPE SetFillStyle(LONG l) override { return Set("FillStyle", l); }
    HRESULT STDMETHODCALLTYPE SetLineColor(LONG l) override { return Set("LineColor", l); }
    HRESULT STDMETHODCALLTYPE SetLineStyle(LONG l) override { return Set("LineStyle", l); }
    HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT f) override { return Set("LineWidth", f); }
    // Recorded as a truth value; the trace keeps the value passed (-1 for TRUE).
    HRESULT STDMETHODCALLTYPE SetClosed(VARIANT_BOOL b) override {
        TraceCall("SetClosed", LONG(b));
        m_properties.Set("closed", b != 0);
        return S_OK;
    }
    HRESULT STDMETHODCALLTYPE SetAuxColor(LONG l) override { return Set("AuxColor", l); }
    HRESULT STDMETHODCALLTYPE SetAuxStyle(LONG l) override { return Set("AuxStyle", l); }
    HRESULT STDMETHODCALLTYPE SetPoints(LONG lCount, VARIANT vPoints) override;

    std::vector<CPlanPoint> Points() const;
    bool IsClosed() const;
};

class CRectangleObject final : public CGraphicObject<IOsrikRectangle> {
public:
    explicit CRectangleObject(CHostState& state)
        : CGraphicObject(state, "rectangle", IID_IOsrikRectangle) {}

    HRESULT STDMETHODCALLTYPE SetFillColor(LONG l) override { return Set("FillColor", l); }
    HRESULT STDMETHODCALLTYPE SetFillStyle(LONG l) override { return Set("FillStyle", l); }
    HRESULT STDMETHODCALLTYPE SetLineColor(LONG l) override { return Set("LineColor", l); }
    HRESULT STDMETHODCALLTYPE SetLineStyle(LONG l) override { return Set("LineStyle", l); }
    HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT f) override { return Set("LineWidth", f); }
    HRESULT STDMETHODCALLTYPE SetAuxColor(LONG l) override { return Set("AuxColor", l); }
    HRESULT STDMETHODCALLTYPE SetAuxStyle(LONG l) override { return Set("AuxStyle", l); }
    HRESULT STDMETHODCALLTYPE SetHeight(FLOAT f) override { return Set("Height", f); }
    HRESULT STDMETHODCALLTYPE SetX(FLOAT f) override { return Set("X", f); }
    HRESULT STDMETHODCALLTYPE SetAuxValue(LONG l) override { return Set("AuxValue", l); }
    HRESULT STDMETHODCALLTYPE SetY(FLOAT f) override { return Set("Y", f); }
    HRESULT STDMETHODCALLTYPE SetWidth(FLOAT f) override { return Set("Width", f); }
};

// The floats of a VT_ARRAY | VT_R4 VARIANT with one dimension of at least nMin elements, or false.
bool ReadFloatArray(const VARIANT& v, size_t nMin, std::vector<float>& values);
