// Fuzzes the reference host's readers of untrusted text: scenario scripts, object files and the
// UTF-8 decoding behind both. Checks what must hold for any input: parsed commands carry rising
// line numbers and sane values, accepted objects have finite sizes >= 0, and decoding is stable
// (text decoded once and encoded again decodes to the same units).
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "host/ObjectFile.h"
#include "host/Scenario.h"
#include "host/Text.h"

namespace {

void Check(bool bHolds) {
    if (!bHolds) {
        std::abort();
    }
}

void CheckScenario(std::string_view text) {
    const CScenario scenario = ParseScenario(text);
    int nLastLine = 0;
    for (const CScenarioCommand& cmd : scenario.commands) {
        Check(cmd.nLine > nLastLine);
        nLastLine = cmd.nLine;
        Check(cmd.eKind != ECommand::Event || (cmd.nValue >= 2 && cmd.nValue <= 52));
        Check(cmd.eKind != ECommand::Idle || cmd.nValue >= 0);
    }
    Check(scenario.strError.empty() || scenario.strError.rfind("line ", 0) == 0);
}

void CheckObjectFile(std::string_view text) {
    const auto info = ParseObjectFile(text);
    if (info) {
        for (const float fSize : {info->fSizeX, info->fSizeY, info->fSizeZ}) {
            Check(std::isfinite(fSize) && fSize >= 0);
        }
    }
}

void CheckUtf8(std::string_view text) {
    const COleString units = Utf8ToUtf16(text);
    Check(Utf8ToUtf16(Utf16ToUtf8(units)) == units);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* pData, size_t nSize) {
    const std::string_view text(reinterpret_cast<const char*>(pData), nSize);
    CheckScenario(text);
    CheckObjectFile(text);
    CheckUtf8(text);
    return 0;
}
