#include "host/CommandLine.h"

#include <string_view>

bool ParseCommandLine(int argc, const char* const* argv, COptions& options, std::string& strError) {
    options = COptions();
    bool bScenario = false;
    for (int i = 1; i < argc; ++i) {
        const std::string_view arg = argv[i];
        std::string* pValue = arg == "--plugin" ? &options.strPlugin
                              : arg == "--out"  ? &options.strOut
                              : arg == "--svg"  ? &options.strSvg
                                                : nullptr;
        if (pValue) {
            if (i + 1 >= argc || std::string_view(argv[i + 1]).empty()) {
                strError = std::string(arg) + " needs a value";
                return false;
            }
            *pValue = argv[++i];
        } else if (arg == "--trace") {
            options.bTrace = true;
        } else if (arg.size() > 1 && arg[0] == '-') {
            strError = "unknown option " + std::string(arg);
            return false;
        } else if (bScenario) {
            strError = "more than one scenario: " + options.strScenario + ", " + std::string(arg);
            return false;
        } else {
            options.strScenario = arg;
            bScenario = true;
        }
    }
    if (!bScenario) {
        strError = "no scenario given";
        return false;
    }
    return true;
}
