// One queued action of the UI driver: how the scenario answers the modal UI the plug-in opens.
#pragma once

#include <string>

enum class EUiAction {
    Ok,          // answer a message box with OK
    Cancel,      // answer a message box with Cancel
    File,        // choose a file in a file-open dialog (strText: the path)
    FileCancel,  // cancel a file-open dialog
    Dialog,      // the next dialog must be template nValue
    Type,        // replace edit control nCtrl's text with strText; it then loses the focus
    Click,       // click push or radio button nCtrl
    Select,      // choose entry nValue of drop-down list nCtrl
    Mark,        // set list view nCtrl's selection mark to row nValue
    DblClick,    // double-click row nValue of list view nCtrl
    Key,         // press virtual key nValue in control nCtrl
};

struct CUiAction {
    EUiAction eKind = EUiAction::Ok;
    int nLine = 0;  // scenario line, for messages
    int nCtrl = 0;
    int nValue = 0;
    std::string strText;  // UTF-8 as written in the scenario
};

// The action as the scenario writes it, with its line: `ui type 1001 "12,5" (line 7)`.
std::string DescribeUiAction(const CUiAction& action);
