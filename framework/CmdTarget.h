// CCmdTarget: an automation object whose IDispatch is driven by a dispatch map.
//
// The object starts with one reference, owned by whoever created it; Release to zero deletes it.
// The dispatch map is a table of methods by dispatch identifier with the types of their parameters;
// Invoke checks the arguments against it and refuses wrong counts or types with the COM error for
// them before any handler runs. No exception leaves Invoke.
#pragma once

#include <span>

#include "platform/Win32.h"

class CCmdTarget;

// The arguments of one dispatch call in declaration order, already type-checked.
class CDispArgs {
public:
    CDispArgs(const DISPPARAMS& params) : m_params(params) {}  // NOLINT

    LONG Long(UINT i) const { return Arg(i).lVal; }
    FLOAT Float(UINT i) const { return Arg(i).fltVal; }
    BOOL Bool(UINT i) const { return Arg(i).boolVal != VARIANT_FALSE; }
    BSTR String(UINT i) const { return Arg(i).bstrVal; }
    IDispatch* Dispatch(UINT i) const { return Arg(i).pdispVal; }

private:
    const VARIANT& Arg(UINT i) const { return m_params.rgvarg[m_params.cArgs - 1 - i]; }
    const DISPPARAMS& m_params;
};

// One method of a dispatch map. Parameter letters: l long, f float, b BOOL, s string, d IDispatch,
// v any VARIANT; upper case for by-reference. A null handler accepts the call and does nothing.
struct CDispatchEntry {
    DISPID id;
    const char* pszParams;
    void (*pfnHandler)(CCmdTarget* pTarget, const CDispArgs& args);
};

class CCmdTarget : public IDispatch {
public:
    CCmdTarget() = default;
    virtual ~CCmdTarget() = default;
    CCmdTarget(const CCmdTarget&) = delete;
    CCmdTarget& operator=(const CCmdTarget&) = delete;

    IDispatch* GetIDispatch(BOOL bAddRef);
    ULONG ExternalAddRef() { return AddRef(); }
    ULONG ExternalRelease() { return Release(); }

    // IUnknown
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppvObject) override;
    ULONG STDMETHODCALLTYPE AddRef() override;
    ULONG STDMETHODCALLTYPE Release() override;

    // IDispatch
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* pctinfo) override;
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT iTInfo, LCID lcid, ITypeInfo** ppTInfo) override;
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID riid, LPOLESTR* rgszNames, UINT cNames,
                                            LCID lcid, DISPID* rgDispId) override;
    HRESULT STDMETHODCALLTYPE Invoke(DISPID dispIdMember, REFIID riid, LCID lcid, WORD wFlags,
                                     DISPPARAMS* pDispParams, VARIANT* pVarResult,
                                     EXCEPINFO* pExcepInfo, UINT* puArgErr) override;

protected:
    virtual std::span<const CDispatchEntry> GetDispatchMap() const { return {}; }
    // Further interfaces answered with this object's IDispatch (an event interface, say).
    virtual bool IsDispatchInterface(REFIID) const { return false; }
    virtual void OnFinalRelease() { delete this; }

private:
    ULONG m_dwRef = 1;
};

// Connects a sink to the source's connection point for `iid`; with bRefCount the connection holds a
// reference to the sink. Returns FALSE when the source has no such connection point or refuses.
BOOL AfxConnectionAdvise(IUnknown* pUnkSrc, REFIID iid, IUnknown* pUnkSink, BOOL bRefCount,
                         DWORD* pdwCookie);
BOOL AfxConnectionUnadvise(IUnknown* pUnkSrc, REFIID iid, IUnknown* pUnkSink, BOOL bRefCount,
                           DWORD dwCookie);
