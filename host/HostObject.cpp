#include "host/HostObject.h"

#include <algorithm>
#include <cstdio>
#include <vector>

CHostObject* CHostState::Find(const void* pInterface) const {
    const auto it = m_objects.find(pInterface);
    return it == m_objects.end() ? nullptr : it->second;
}

void CHostState::ForEachObject(const std::function<void(CHostObject&)>& visit) const {
    std::vector<CHostObject*> objects;
    objects.reserve(m_objects.size());
    for (const auto& entry : m_objects) {
        objects.push_back(entry.second);
    }
    std::sort(objects.begin(), objects.end(),
              [](const CHostObject* a, const CHostObject* b) { return a->Serial() < b->Serial(); });
    objects.erase(std::unique(objects.begin(), objects.end()), objects.end());
    for (CHostObject* pObject : objects) {
        visit(*pObject);
    }
}

void CHostState::DestroyAll() {
    ForEachObject([](CHostObject& object) { object.Detach(); });
    while (!m_objects.empty()) {
        delete m_objects.begin()->second;  // the destructor unregisters it
    }
}

namespace {

ULONG g_nNextSerial = 0;

}  // namespace

CHostObject::CHostObject(CHostState& state, std::string_view kind)
    : m_state(state), m_nSerial(++g_nNextSerial) {
    const std::string strKind(kind);
    const int nSerial = state.NextSerial(strKind);
    m_strName = nSerial == 1 && (strKind == "app" || strKind == "macro" || strKind == "view" ||
                                 strKind == "overlay" || strKind == "events")
                    ? strKind
                    : strKind + "#" + std::to_string(nSerial);
}

CHostObject::~CHostObject() {
    for (const void* pInterface : m_interfaces) {
        m_state.Unregister(pInterface);
    }
}

void CHostObject::HostAddRef() {
    ++m_lHostRefs;
    ++m_lRefs;
}

void CHostObject::HostRelease() {
    --m_lHostRefs;
    ReleaseObject();
}

ULONG CHostObject::AddRefObject() {
    return ++m_lRefs;
}

ULONG CHostObject::ReleaseObject() {
    const ULONG lRefs = --m_lRefs;
    if (lRefs == 0) {
        delete this;
    }
    return lRefs;
}

ULONG CHostObject::ReleaseFromCaller() {
    if (PluginRefs() <= 0) {
        TraceResult("released more often than referenced");
        m_state.project.leaks.push_back(
            {m_state.currentLine, m_state.strCurrentEvent, m_strName, PluginRefs() - 1});
        return m_lRefs;
    }
    TraceResult(std::to_string(m_lRefs - 1));
    return ReleaseObject();
}

void CHostObject::TraceResult(const std::string& result) const {
    if (m_state.bTrace && !m_state.project.trace.empty()) {
        m_state.project.trace.back() += " -> " + result;
    }
}

std::string CHostObject::TraceObject(const void* pInterface) const {
    if (!pInterface) {
        return "null";
    }
    const CHostObject* pObject = m_state.Find(pInterface);
    return pObject ? pObject->Name() : "foreign";
}

std::string HostIidName(REFIID riid) {
    static const struct {
        const IID* pIid;
        const char* pszName;
    } kNames[] = {
        {&IID_IUnknown, "IUnknown"},
        {&IID_IDispatch, "IDispatch"},
        {&IID_IConnectionPointContainer, "IConnectionPointContainer"},
        {&IID_IConnectionPoint, "IConnectionPoint"},
        {&IID_IOsrikApplication, "IOsrikApplication"},
        {&IID_IOsrikMacro, "IOsrikMacro"},
        {&IID_IOsrikEvents, "IOsrikEvents"},
        {&IID_IOsrikView, "IOsrikView"},
        {&IID_IOsrikOverlay, "IOsrikOverlay"},
        {&IID_IOsrikGraphic2D, "IOsrikGraphic2D"},
        {&IID_IOsrikLine, "IOsrikLine"},
        {&IID_IOsrikPolyline, "IOsrikPolyline"},
        {&IID_IOsrikRectangle, "IOsrikRectangle"},
        {&IID_IOsrikSite, "IOsrikSite"},
        {&IID_IOsrikObjectTemplate, "IOsrikObjectTemplate"},
        {&IID_IOsrikObject3D, "IOsrikObject3D"},
    };
    for (const auto& entry : kNames) {
        if (IsEqualIID(riid, *entry.pIid)) {
            return entry.pszName;
        }
    }
    char buffer[48];
    std::snprintf(buffer, sizeof buffer, "{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}",
                  unsigned(riid.Data1), unsigned(riid.Data2), unsigned(riid.Data3), riid.Data4[0],
                  riid.Data4[1], riid.Data4[2], riid.Data4[3], riid.Data4[4], riid.Data4[5],
                  riid.Data4[6], riid.Data4[7]);
    return buffer;
}
