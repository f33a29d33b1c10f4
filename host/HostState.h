// What all host objects of one session share: the project model, the trace switch, the registry of
// live host objects with their reference counts, and the host's settings.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <string>

#include "core/HostInterfaces.h"
#include "host/Project.h"

class CHostObject;

// The mode flags the host starts with: some interactive-mode bits (the five lowest) set and one
// above them, so that masking and restoring them is visible.
inline constexpr LONG kInitialModeFlags = 0x2B;

class CHostState {
public:
    CProject project;
    bool bTrace = false;
    bool bViewAvailable = true;
    LONG lModeFlags = kInitialModeFlags;
    LONG lBatchMode = 0;
    LONG lNextHandle = 1;        // toolbar elements
    std::string strProgramPath;  // the executable's folder with its trailing separator
    MACROIDLEHOOK pfnIdleHook = nullptr;
    MACROMESSAGEHOOK pfnMessageHook = nullptr;
    // The event or step being run, for leak reports made inside it.
    std::optional<int> currentLine;
    std::string strCurrentEvent = "load";

    void Trace(std::string line) {
        if (bTrace) {
            project.trace.push_back(std::move(line));
        }
    }

    // The registry: every live host object under each interface address it hands out.
    void Register(const void* pInterface, CHostObject* pObject) { m_objects[pInterface] = pObject; }
    void Unregister(const void* pInterface) { m_objects.erase(pInterface); }
    CHostObject* Find(const void* pInterface) const;
    // Each live object once, in creation order.
    void ForEachObject(const std::function<void(CHostObject&)>& visit) const;
    // The next number for a name like "line#3".
    int NextSerial(const std::string& strKind) { return ++m_serials[strKind]; }
    // Deletes every object still alive, whoever holds references; for the end of the session.
    void DestroyAll();

private:
    std::map<const void*, CHostObject*> m_objects;
    std::map<std::string, int> m_serials;
};
