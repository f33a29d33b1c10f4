// The base of every host object the plug-in can hold: reference counting that tells the host's own
// references from the plug-in's, a name for traces and leak reports, and the IUnknown/IDispatch
// boilerplate. Objects are created with no reference; the creator adds the first one.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "host/HostState.h"
#include "host/Json.h"
#include "host/Text.h"

class CHostObject {
public:
    CHostObject(CHostState& state, std::string_view kind);
    CHostObject(const CHostObject&) = delete;
    CHostObject& operator=(const CHostObject&) = delete;
    virtual ~CHostObject();

    const std::string& Name() const { return m_strName; }
    ULONG Refs() const { return m_lRefs; }
    // References held by anybody but the host itself.
    LONG PluginRefs() const { return LONG(m_lRefs) - m_lHostRefs; }
    ULONG Serial() const { return m_nSerial; }

    // References the host keeps (a container holding an object); untraced.
    void HostAddRef();
    void HostRelease();
    // A reference the host hands out to the plug-in, e.g. in an out parameter; untraced.
    void AddRefForCaller() { ++m_lRefs; }
    // Forgets the references this object holds on other host objects without releasing them; the
    // session's end calls it on every object before deleting them all.
    virtual void Detach() {}

protected:
    ULONG AddRefObject();
    ULONG ReleaseObject();  // deletes the object at zero
    // A Release by the plug-in: one more than it holds is reported and ignored, so that the host's
    // own references stay valid.
    ULONG ReleaseFromCaller();
    CHostState& State() const { return m_state; }
    void RegisterInterface(const void* pInterface) {
        m_state.Register(pInterface, this);
        m_interfaces.push_back(pInterface);
    }

    template <typename... TArgs>
    void TraceCall(std::string_view method, const TArgs&... args) const {
        if (m_state.bTrace) {
            std::string line = m_strName + "." + std::string(method) + "(";
            [[maybe_unused]] const char* pszSep = "";
            ((line += pszSep, line += TraceArg(args), pszSep = ", "), ...);
            m_state.Trace(line + ")");
        }
    }
    // Appends " -> result" to the last trace line.
    void TraceResult(const std::string& result) const;

    static std::string TraceArg(bool bValue) { return bValue ? "true" : "false"; }
    static std::string TraceArg(LONG lValue) { return std::to_string(lValue); }
    static std::string TraceArg(float fValue) { return FormatJsonFloat(fValue); }
    static std::string TraceArg(BSTR bstr) { return QuoteJson(BstrToUtf8(bstr)); }
    static std::string TraceArg(const std::string& text) { return text; }
    std::string TraceObject(const void* pInterface) const;

private:
    CHostState& m_state;
    std::string m_strName;
    ULONG m_nSerial;
    ULONG m_lRefs = 0;
    LONG m_lHostRefs = 0;
    std::vector<const void*> m_interfaces;  // the addresses it is registered under
};

// IUnknown for one interface TInterface; derived classes answer further interfaces in GetInterface.
template <typename TInterface>
class CComObject : public TInterface, public CHostObject {
public:
    CComObject(CHostState& state, std::string_view kind) : CHostObject(state, kind) {
        RegisterInterface(static_cast<TInterface*>(this));
    }

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppvObject) override {
        if (!ppvObject) {
            return E_POINTER;
        }
        *ppvObject = GetInterface(riid);
        TraceCall("QueryInterface", IidName(riid));
        if (!*ppvObject) {
            TraceResult("E_NOINTERFACE");
            return E_NOINTERFACE;
        }
        CHostObject* pTarget = State().Find(*ppvObject);
        pTarget = pTarget ? pTarget : this;  // the answer may be another host object
        pTarget->AddRefForCaller();
        TraceResult(pTarget->Name());
        return S_OK;
    }
    ULONG STDMETHODCALLTYPE AddRef() override {
        TraceCall("AddRef");
        return AddRefObject();
    }
    ULONG STDMETHODCALLTYPE Release() override {
        TraceCall("Release");
        return ReleaseFromCaller();
    }

protected:
    // The interface pointer for riid, without a reference; null if not supported.
    virtual void* GetInterface(REFIID riid) {
        return IsEqualIID(riid, IID_IUnknown) ? static_cast<TInterface*>(this) : nullptr;
    }

    static std::string IidName(REFIID riid);
};

// IUnknown and IDispatch for a host interface: the host's interfaces are called through their
// vtables, so Invoke knows no members.
template <typename TInterface>
class CDispatchObject : public CComObject<TInterface> {
public:
    CDispatchObject(CHostState& state, std::string_view kind, const IID& iid)
        : CComObject<TInterface>(state, kind), m_iid(iid) {}

    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* pctinfo) override {
        if (!pctinfo) {
            return E_POINTER;
        }
        *pctinfo = 0;
        return S_OK;
    }
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT, LCID, ITypeInfo** ppTInfo) override {
        if (ppTInfo) {
            *ppTInfo = nullptr;
        }
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return DISP_E_UNKNOWNNAME;
    }
    HRESULT STDMETHODCALLTYPE Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                                     UINT*) override {
        return DISP_E_MEMBERNOTFOUND;
    }

protected:
    void* GetInterface(REFIID riid) override {
        if (IsEqualIID(riid, IID_IDispatch) || IsEqualIID(riid, m_iid)) {
            return static_cast<TInterface*>(this);
        }
        return CComObject<TInterface>::GetInterface(riid);
    }

private:
    IID m_iid;
};

// A readable name for the interface identifiers the host knows, else the GUID in hex.
std::string HostIidName(REFIID riid);

template <typename TInterface>
std::string CComObject<TInterface>::IidName(REFIID riid) {
    return HostIidName(riid);
}
