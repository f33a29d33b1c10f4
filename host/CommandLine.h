// The command line of Osrik.exe: [--plugin PATH] [--out FILE] [--trace] [--svg FILE] SCENARIO
#pragma once

#include <string>

struct COptions {
    std::string strPlugin;  // empty: the plug-in beside the executable
    std::string strOut;     // empty: standard output
    std::string strSvg;     // empty: no plan drawing
    std::string strScenario;
    bool bTrace = false;
};

// False with the reason for an unknown option, a missing value, or not exactly one scenario.
bool ParseCommandLine(int argc, const char* const* argv, COptions& options, std::string& strError);

inline constexpr const char* kUsage =
    "usage: Osrik.exe [--plugin PATH] [--out FILE] [--trace] [--svg FILE] SCENARIO";
