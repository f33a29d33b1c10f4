// The reference host's project model: what the plug-in created or showed, in the order it happened.
// Values are kept exactly as the host received them (32-bit floats, 32-bit integers, UTF-8 texts).
#pragma once

#include <array>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "platform/Win32.h"

using CPlanPoint = std::pair<float, float>;

// The properties the plug-in set on a host object, each under its setter's name without "Set" in
// lower camel case, in the order they were first set.
class CPropertyList {
public:
    using CValue = std::variant<LONG, float, bool, std::vector<CPlanPoint>>;

    void Set(std::string_view name, CValue value);
    const CValue* Find(std::string_view name) const;
    const std::vector<std::pair<std::string, CValue>>& Items() const { return m_items; }

private:
    std::vector<std::pair<std::string, CValue>> m_items;
};

struct CToolbarElement {
    LONG lHandle = 0;
    LONG lParent = 0;     // 0: the host
    std::string strKind;  // "toolbar", "button", "entry"
    std::optional<std::string> text;
    std::optional<std::string> bitmap;  // "WxHxBITS" as GetObject tells, "invalid" for a bad handle
    std::optional<LONG> number;
    std::optional<LONG> style;
};

struct CHeightPoint {
    float fX = 0, fY = 0, fZ = 0;
    std::optional<size_t> group;
};

struct CSiteRecord {
    LONG lKind = 0;
    std::vector<CPlanPoint> outline;
    bool bClosed = false;
    std::optional<size_t> group;
};

struct CPlacedObject {
    std::string strFile;
    std::optional<std::array<float, 16>> matrix;
    std::optional<LONG> mode;
    std::optional<LONG> level;
    std::optional<size_t> group;
};

enum class EGroupState { Open, Committed, Cancelled };

struct CEditGroupRecord {
    std::string strName;
    EGroupState eState = EGroupState::Open;
};

struct CGraphicSnapshot {
    std::string strType;  // "line", "polyline", "rectangle"
    CPropertyList properties;
};
using COverlaySnapshot = std::vector<CGraphicSnapshot>;

struct CMessageRecord {
    std::string strText, strCaption;
    UINT uStyle = 0;
    std::string strAnswer;  // "ok" or "cancel"
};

struct CProgressRecord {
    std::string strCall;
    std::optional<std::string> text;
    std::optional<LONG> percent;
};

struct CHelpRecord {
    std::string strPath;
    ULONG_PTR context = 0;
};

// A host object the plug-in still held a reference to after an event.
struct CLeakRecord {
    std::optional<int> line;  // scenario line of the event; none for loading and unloading
    std::string strEvent;
    std::string strObject;
    LONG lRefs = 0;
};

// An event that did not reach the plug-in, or that it refused.
struct CUndeliveredRecord {
    int nLine = 0;
    std::string strEvent;
    std::string strReason;
};

class CProject {
public:
    // Edit groups. Handles are index + 1, so 0 never names a group.
    LONG BeginEditGroup(std::string strName);
    // Makes an open group the one new objects go into; false for an unknown or closed group.
    bool ActivateEditGroup(LONG lGroup);
    // Closes an open group, committed or cancelled; false for an unknown or closed group.
    bool EndEditGroup(LONG lGroup, bool bKeep);
    // The index of the group that is active and open, if any.
    std::optional<size_t> ActiveGroup() const;

    bool bConnected = false;
    std::vector<CToolbarElement> toolbar;
    std::vector<CHeightPoint> heightPoints;
    std::vector<CSiteRecord> sites;
    std::vector<CPlacedObject> objects;
    std::vector<CEditGroupRecord> editGroups;
    std::vector<COverlaySnapshot> overlays;
    std::vector<CMessageRecord> messages;
    std::vector<CProgressRecord> progress;
    std::vector<CHelpRecord> help;
    std::vector<CLeakRecord> leaks;
    std::vector<CUndeliveredRecord> undelivered;
    std::vector<std::string> trace;

    const CToolbarElement* FindToolbarElement(LONG lHandle) const;

private:
    std::vector<size_t> m_activeStack;  // activated groups, the innermost last
};
