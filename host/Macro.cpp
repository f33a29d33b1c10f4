#include "host/Macro.h"

#include "host/Application.h"

HRESULT CMacroObject::SetMessageHooks(MACROIDLEHOOK pfnIdle, MACROMESSAGEHOOK pfnMessage) {
    TraceCall("SetMessageHooks", std::string(pfnIdle ? "idle hook" : "null"),
              std::string(pfnMessage ? "message hook" : "null"));
    State().pfnIdleHook = pfnIdle;
    State().pfnMessageHook = pfnMessage;
    return S_OK;
}

HRESULT CMacroObject::AddButtonEntry(LONG lButton, HBITMAP hBitmap, LONG lStyle, BSTR bstrText,
                                     LONG lNumber, LONG* plEntry) {
    TraceCall("AddButtonEntry", lButton, DescribeBitmap(hBitmap).value_or("null"), lStyle, bstrText,
              lNumber);
    if (!plEntry) {
        return E_POINTER;
    }
    *plEntry = AddElement("entry", lButton, "button", hBitmap, bstrText, lNumber, lStyle);
    TraceResult(std::to_string(*plEntry));
    return *plEntry ? S_OK : E_INVALIDARG;
}

HRESULT CMacroObject::AddToolbarButton(LONG lToolbar, HBITMAP hBitmap, BSTR bstrText, LONG lNumber,
                                       LONG* plButton) {
    TraceCall("AddToolbarButton", lToolbar, DescribeBitmap(hBitmap).value_or("null"), bstrText,
              lNumber);
    if (!plButton) {
        return E_POINTER;
    }
    *plButton = AddElement("button", lToolbar, "toolbar", hBitmap, bstrText, lNumber, std::nullopt);
    TraceResult(std::to_string(*plButton));
    return *plButton ? S_OK : E_INVALIDARG;
}

LONG CMacroObject::AddElement(const char* pszKind, LONG lParent, const char* pszParentKind,
                              HBITMAP hBitmap, BSTR bstrText, LONG lNumber,
                              std::optional<LONG> style) {
    CProject& project = State().project;
    const CToolbarElement* pParent = project.FindToolbarElement(lParent);
    if (!pParent || pParent->strKind != pszParentKind) {
        return 0;
    }
    CToolbarElement element;
    element.lHandle = State().lNextHandle++;
    element.lParent = lParent;
    element.strKind = pszKind;
    element.text = BstrToUtf8(bstrText);
    element.bitmap = DescribeBitmap(hBitmap);
    element.number = lNumber;
    element.style = style;
    project.toolbar.push_back(element);
    return element.lHandle;
}

void* CMacroObject::GetInterface(REFIID riid) {
    // The application answers for IUnknown, so that both objects share one COM identity.
    if (IsEqualIID(riid, IID_IUnknown) || IsEqualIID(riid, IID_IOsrikApplication)) {
        return static_cast<IOsrikApplication*>(&m_app);
    }
    if (IsEqualIID(riid, IID_IConnectionPointContainer)) {
        return static_cast<IConnectionPointContainer*>(&m_app);
    }
    return CDispatchObject::GetInterface(riid);
}
