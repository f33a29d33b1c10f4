// The host's event interface: 52 events called by dispatch identifier on the plug-in's IDispatch.
//
// Parameters are described by one letter each, in declaration order (DISPPARAMS holds them in
// reverse): l = long (VT_I4), f = float (VT_R4), b = BOOL (VT_BOOL), s = string (VT_BSTR),
// d = IDispatch (VT_DISPATCH), v = VARIANT (any type); an upper-case letter is passed by reference
// (VT_BYREF with the type; V is a VARIANT* of VT_BYREF | VT_VARIANT).
#pragma once

#include <string_view>

#include "platform/Win32.h"

enum EOsrikEvent : DISPID {
    kEventProgramExit = 1,
    kEventButtonChange = 6,
    kEventHowMove = 7,
    kEventHowInput = 8,
};

struct COsrikEventInfo {
    DISPID id;
    const char* name;
    const char* params;
};

inline constexpr COsrikEventInfo kOsrikEvents[] = {
    {1, "ProgramExit", ""},
    {2, "LoadDialog", "lld"},
    {3, "EndDialog", "lb"},
    {4, "ExecuteMenuItem", "l"},
    {5, "GotOneClick", "bffl"},
    {6, "ButtonChange", "lllbbb"},
    {7, "HowMove", "lffl"},
    {8, "HowInput", "lffffld"},
    {9, "SaveDialogDefaults", "ll"},
    {10, "DialogActivation", "lllb"},
    {11, "LoadComplete", "b"},
    {12, "LoadBuilding", "dl"},
    {13, "LoadStart", ""},
    {14, "SaveStart", "slbL"},
    {15, "SaveBuilding", "ld"},
    {16, "HowSnap", "lfflf"},
    {17, "HowStatusLineRedraw", "lffl"},
    {18, "ProjectClosed", ""},
    {19, "Graphics2DDoubleClick", "d"},
    {20, "Graphics2DSelectionChanged", "dffbbbfl"},
    {21, "Graphics2DDeleted", "dB"},
    {22, "Graphics2DMove", "dffl"},
    {23, "Graphics2DEndMoving", "dbbb"},
    {24, "NewCurrentProject", ""},
    {25, "Graphics2DStartMoving", "dfffblB"},
    {26, "InputModeChanged", "l"},
    {27, "ProjectChange", ""},
    {28, "ChangeNotify", "dl"},
    {29, "Object3DDoubleClicked", "ddBB"},
    {30, "TextureDropped", "ddldsfffBBB"},
    {31, "Graphics2DStoryHeightsChanged", "d"},
    {32, "Graphics2DObjectTransform", "dV"},
    {33, "RoofDoubleClicked", "B"},
    {34, "UserPanelAdjustSize", "lLLB"},
    {35, "UserPanelPosChanged", "lllll"},
    {36, "UserPanelRightClicked", "l"},
    {37, "ExternalViewsVisibilityChanged", "l"},
    {38, "Object3DInserted", "dddVB"},
    {39, "WorldObject3DDoubleClicked", "ddlB"},
    {40, "WorldObject3DMoved", "dddv"},
    {41, "WorldObject3DTextureDropped", "dlfffdlssB"},
    {42, "WorldObject3DMaterialDropped", "dlfffdlddB"},
    {43, "NewMacroInterface", "s"},
    {44, "ConstructiveElementMoves", "dlfffffddffdfffb"},
    {45, "ProgressIndicatorStart", "slB"},
    {46, "ProgressIndicatorStop", ""},
    {47, "ProgressIndicatorSubTitle", "sB"},
    {48, "ProgressIndicatorPercent", "lB"},
    {49, "StatusLineChanging", "sB"},
    {50, "DialogSubObjectChanged", "lll"},
    {51, "GlobalModeChanged", "ll"},
    {52, "UndoRedoDon", "b"},
};
static_assert(std::size(kOsrikEvents) == 52);

// The event with that identifier, or null.
inline const COsrikEventInfo* FindOsrikEvent(DISPID id) {
    return (id >= 1 && id <= 52) ? &kOsrikEvents[id - 1] : nullptr;
}

// The VARTYPE that a parameter letter stands for (VT_EMPTY for an unknown letter).
inline VARTYPE OsrikParamType(char letter) {
    switch (letter) {
        case 'l':
            return VT_I4;
        case 'f':
            return VT_R4;
        case 'b':
            return VT_BOOL;
        case 's':
            return VT_BSTR;
        case 'd':
            return VT_DISPATCH;
        case 'v':
            return VT_VARIANT;
        case 'L':
            return VT_BYREF | VT_I4;
        case 'F':
            return VT_BYREF | VT_R4;
        case 'B':
            return VT_BYREF | VT_BOOL;
        case 'S':
            return VT_BYREF | VT_BSTR;
        case 'D':
            return VT_BYREF | VT_DISPATCH;
        case 'V':
            return VT_BYREF | VT_VARIANT;
        default:
            return VT_EMPTY;
    }
}
