#include "host/EventArgs.h"

#include <cstring>

#include "host/Json.h"
#include "host/Text.h"

CEventArgs::CEventArgs(const COsrikEventInfo& event) : m_event(event) {
    const size_t nCount = std::strlen(event.params);
    m_args.resize(nCount);
    m_targets.resize(nCount);  // never resized again: arguments point into it
    for (size_t i = 0; i < nCount; ++i) {
        VARIANT& v = m_args[i];
        VariantInit(&v);
        VariantInit(&m_targets[i].varValue);
        const VARTYPE vt = OsrikParamType(event.params[i]);
        switch (vt) {
            case VT_I4:
                v.lVal = 0;
                break;
            case VT_R4:
                v.fltVal = 0;
                break;
            case VT_BOOL:
                v.boolVal = VARIANT_FALSE;
                break;
            case VT_BSTR:
                v.bstrVal = SysAllocStringLen(nullptr, 0);
                break;
            case VT_DISPATCH:
                v.pdispVal = nullptr;
                break;
            case VT_VARIANT:
                break;  // passed as VT_EMPTY
            case VT_BYREF | VT_I4:
                v.plVal = &m_targets[i].lValue;
                break;
            case VT_BYREF | VT_BOOL:
                v.pboolVal = &m_targets[i].boolValue;
                break;
            case VT_BYREF | VT_VARIANT:
                v.pvarVal = &m_targets[i].varValue;
                break;
            default:
                break;
        }
        v.vt = vt == VT_VARIANT ? VARTYPE(VT_EMPTY) : vt;
    }
}

CEventArgs::~CEventArgs() {
    for (size_t i = 0; i < m_args.size(); ++i) {
        VariantClear(&m_args[i]);  // frees the strings; by-reference targets are ours
        VariantClear(&m_targets[i].varValue);
    }
}

void CEventArgs::SetLong(size_t i, LONG lValue) {
    if (i < m_args.size() && m_args[i].vt == VT_I4) {
        m_args[i].lVal = lValue;
    }
}

void CEventArgs::SetFloat(size_t i, float fValue) {
    if (i < m_args.size() && m_args[i].vt == VT_R4) {
        m_args[i].fltVal = fValue;
    }
}

void CEventArgs::SetBool(size_t i, bool bValue) {
    if (i < m_args.size() && m_args[i].vt == VT_BOOL) {
        m_args[i].boolVal = bValue ? VARIANT_TRUE : VARIANT_FALSE;
    }
}

DISPPARAMS CEventArgs::Params() {
    m_reversed.assign(m_args.rbegin(), m_args.rend());
    return {m_reversed.empty() ? nullptr : m_reversed.data(), nullptr, UINT(m_reversed.size()), 0};
}

std::string CEventArgs::Describe() const {
    std::string text = std::string(m_event.name) + "(";
    for (size_t i = 0; i < m_args.size(); ++i) {
        const VARIANT& v = m_args[i];
        text += i ? ", " : "";
        switch (v.vt) {
            case VT_I4:
                text += std::to_string(v.lVal);
                break;
            case VT_R4:
                text += FormatJsonFloat(v.fltVal);
                break;
            case VT_BOOL:
                text += v.boolVal ? "true" : "false";
                break;
            case VT_BSTR:
                text += QuoteJson(BstrToUtf8(v.bstrVal));
                break;
            case VT_DISPATCH:
                text += v.pdispVal ? "object" : "null";
                break;
            case VT_BYREF | VT_I4:
                text += '&';
                text += std::to_string(*v.plVal);
                break;
            case VT_BYREF | VT_BOOL:
                text += *v.pboolVal ? "&true" : "&false";
                break;
            case VT_BYREF | VT_VARIANT:
                text += "&variant";
                break;
            default:
                text += "empty";
                break;
        }
    }
    return text + ")";
}
