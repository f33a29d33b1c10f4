// Scenario scripts of the reference host: one command a line, blanks separate words, "..." quotes a
// word with blanks, # at the start of a word begins a comment. The parser checks every line before
// anything runs, so a faulty script fails without touching the plug-in.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host/UiAction.h"
#include "platform/Win32.h"

enum class ECommand { Button, Click, Move, Event, Exit, Idle, NoView, View, Ui };

struct CScenarioCommand {
    ECommand eKind = ECommand::Exit;
    int nLine = 0;
    std::string strElement;      // button, click, move: a toolbar element name, or
    std::optional<LONG> handle;  // the handle written in decimal instead
    long long nValue = 0;        // button: change code; click: flags; event: identifier; idle: ms
    float fX = 0;
    float fY = 0;
    CUiAction ui;  // ui
};

struct CScenario {
    std::vector<CScenarioCommand> commands;
    std::string strError;  // the first fault, "line N: ..."; empty when the script is sound
};

CScenario ParseScenario(std::string_view text);

// Splits one line into words. Returns false with a reason for an unterminated quote or a quote
// that does not stand alone as a word.
bool SplitScenarioWords(std::string_view line, std::vector<std::string>& words,
                        std::string& strError);

// True for the element names the host resolves to the plug-in's toolbar handles.
bool IsToolbarElementName(std::string_view name);
