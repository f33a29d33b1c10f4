// One recording object that can stand for every host object the plug-in meets: view, overlay,
// line, polyline, rectangle, site, object template and placed object. Each call is recorded on the
// host's list as "<name>.<Method> <arguments>". The host owns the objects; their count is the
// references the plug-in holds, which must be 0 after every event.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "core/HostInterfaces.h"

class CRecordingHost;

class CRecordingObject final : public IOsrikView,
                               public IOsrikOverlay,
                               public IOsrikLine,
                               public IOsrikPolyline,
                               public IOsrikRectangle,
                               public IOsrikSite,
                               public IOsrikObjectTemplate,
                               public IOsrikObject3D {
public:
    CRecordingObject(CRecordingHost& host, std::string name)
        : m_host(host), m_name(std::move(name)) {}
    virtual ~CRecordingObject() = default;

    const std::string& Name() const { return m_name; }
    ULONG m_nRefs = 0;       // references the plug-in holds
    float m_fHeight = 2.0f;  // what GetObjectExtents reports in z

    // IUnknown and IDispatch for all the interfaces at once.
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID, void** ppv) override;
    ULONG STDMETHODCALLTYPE AddRef() override { return ++m_nRefs; }
    ULONG STDMETHODCALLTYPE Release() override;
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT*) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                                     UINT*) override {
        return E_NOTIMPL;
    }

    HRESULT STDMETHODCALLTYPE GetOverlay(IOsrikOverlay** ppOverlay) override;
    HRESULT STDMETHODCALLTYPE UpdateView() override { return Record("UpdateView"); }
    HRESULT STDMETHODCALLTYPE AddToOverlay(IOsrikGraphic2D* pObject, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE ClearOverlay() override { return Record("ClearOverlay"); }

    HRESULT STDMETHODCALLTYPE SetDrawMode(LONG l) override { return Record("SetDrawMode", l); }
    HRESULT STDMETHODCALLTYPE SetRedraw(LONG l) override { return Record("SetRedraw", l); }
    HRESULT STDMETHODCALLTYPE SetLineColor(LONG l) override { return Record("SetLineColor", l); }
    HRESULT STDMETHODCALLTYPE SetLineStyle(LONG l) override { return Record("SetLineStyle", l); }
    HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT f) override { return Record("SetLineWidth", f); }
    HRESULT STDMETHODCALLTYPE SetX1(FLOAT f) override { return Record("SetX1", f); }
    HRESULT STDMETHODCALLTYPE SetX2(FLOAT f) override { return Record("SetX2", f); }
    HRESULT STDMETHODCALLTYPE SetY1(FLOAT f) override { return Record("SetY1", f); }
    HRESULT STDMETHODCALLTYPE SetY2(FLOAT f) override { return Record("SetY2", f); }
    HRESULT STDMETHODCALLTYPE SetFillColor(LONG l) override { return Record("SetFillColor", l); }
    HRESULT STDMETHODCALLTYPE SetFillStyle(LONG l) override { return Record("SetFillStyle", l); }
    HRESULT STDMETHODCALLTYPE SetClosed(VARIANT_BOOL b) override { return Record("SetClosed", b); }
    HRESULT STDMETHODCALLTYPE SetAuxColor(LONG l) override { return Record("SetAuxColor", l); }
    HRESULT STDMETHODCALLTYPE SetAuxStyle(LONG l) override { return Record("SetAuxStyle", l); }
    HRESULT STDMETHODCALLTYPE SetPoints(LONG lCount, VARIANT vPoints) override;
    HRESULT STDMETHODCALLTYPE SetHeight(FLOAT f) override { return Record("SetHeight", f); }
    HRESULT STDMETHODCALLTYPE SetX(FLOAT f) override { return Record("SetX", f); }
    HRESULT STDMETHODCALLTYPE SetAuxValue(LONG l) override { return Record("SetAuxValue", l); }
    HRESULT STDMETHODCALLTYPE SetY(FLOAT f) override { return Record("SetY", f); }
    HRESULT STDMETHODCALLTYPE SetWidth(FLOAT f) override { return Record("SetWidth", f); }

    HRESULT STDMETHODCALLTYPE CreateObjectInstance(LONG, LONG, IOsrikObject3D** pp) override;
    HRESULT STDMETHODCALLTYPE SetObjectMode(LONG l) override { return Record("SetObjectMode", l); }
    HRESULT STDMETHODCALLTYPE SetObjectLevel(LONG l) override {
        return Record("SetObjectLevel", l);
    }
    HRESULT STDMETHODCALLTYPE InsertObject(LONG l, LONG*) override {
        return Record("InsertObject", l);
    }
    HRESULT STDMETHODCALLTYPE SetTransformMatrix(VARIANT vMatrix, LONG*) override;
    HRESULT STDMETHODCALLTYPE GetObjectExtents(LONG, FLOAT* pfX, FLOAT* pfY, FLOAT* pfZ) override;

private:
    HRESULT Record(const std::string& method);
    HRESULT Record(const std::string& method, double value);
    static std::string Floats(const VARIANT& v);

    CRecordingHost& m_host;
    std::string m_name;
};
