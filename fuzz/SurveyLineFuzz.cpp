// Fuzzes CSurveyPoint::ParseLine against the simple reference reading of the rules: the same
// result, name, bit-identical coordinates and code, and nothing changed on a rejected line.
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

#include "import/SurveyPoint.h"
#include "tests/import/SurveyReference.h"

namespace {

bool SameBits(float a, float b) {
    return std::memcmp(&a, &b, sizeof a) == 0;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* pData, size_t nSize) {
    // The reader never hands over more than 254 characters; longer input adds nothing but time.
    const std::string line(reinterpret_cast<const char*>(pData), nSize < 254 ? nSize : 254);
    const int nRunning = int(nSize * 7919 % 100000);

    CSurveyPoint point;
    point.m_strName = "sentinel";
    point.m_fX = -1.5f;
    point.m_Assignment.m_strObjectFile = "file.oqb";
    const bool bAccepted = point.ParseLine(std::string_view(line), nRunning);

    survey_reference::RefPoint expected;
    if (bAccepted != survey_reference::ParseLine(line, nRunning, expected)) {
        std::abort();
    }
    if (!bAccepted) {
        if (!(point.m_strName == "sentinel") || !SameBits(point.m_fX, -1.5f) ||
            !point.m_Assignment.m_strObjectId.IsEmpty()) {
            std::abort();
        }
        return 0;
    }
    if (point.m_strName.Str() != expected.name || !SameBits(point.m_fX, expected.x) ||
        !SameBits(point.m_fY, expected.y) || !SameBits(point.m_fZ, expected.z) ||
        point.m_Assignment.m_strObjectId.Str() != expected.code ||
        !(point.m_Assignment.m_strObjectFile == "file.oqb")) {
        std::abort();
    }
    return 0;
}
