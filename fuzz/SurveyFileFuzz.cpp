// Fuzzes the surveyor file reader against the simple reference reading of the rules: once
// through CSurveyPointSet::ReadFile on a real file, once through the piece reader on the same
// bytes in small blocks (the first input byte picks the block size), so that line ends, CR LF
// pairs, NUL bytes and Ctrl-Z fall across block boundaries.
#include <unistd.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include "import/SurveyPieceReader.h"
#include "import/SurveyPointSet.h"
#include "tests/import/SurveyReference.h"

namespace {

bool Same(const CSurveyPoint& p, const survey_reference::RefPoint& r) {
    return p.m_strName.Str() == r.name && std::memcmp(&p.m_fX, &r.x, sizeof r.x) == 0 &&
           std::memcmp(&p.m_fY, &r.y, sizeof r.y) == 0 &&
           std::memcmp(&p.m_fZ, &r.z, sizeof r.z) == 0 &&
           p.m_Assignment.m_strObjectId.Str() == r.code;
}

void CheckReadFile(const std::string& bytes,
                   const std::vector<survey_reference::RefPoint>& expected) {
    static const std::string path =
        "/tmp/kalmoret_survey_fuzz_" + std::to_string(getpid()) + ".txt";
    std::FILE* pFile = std::fopen(path.c_str(), "wb");
    if (pFile == nullptr) {
        return;
    }
    std::fwrite(bytes.data(), 1, bytes.size(), pFile);
    std::fclose(pFile);
    CSurveyPointSet set;
    if (!set.ReadFile(path.c_str()) || set.GetCount() != int(expected.size()) ||
        !(set.GetFileName() == path.c_str())) {
        std::abort();
    }
    for (size_t i = 0; i < expected.size(); ++i) {
        if (!Same(set.GetAt(int(i)), expected[i])) {
            std::abort();
        }
    }
    std::remove(path.c_str());
}

void CheckBlocks(const std::string& bytes, size_t nBlock,
                 const std::vector<survey_reference::RefPoint>& expected) {
    if (bytes.empty()) {
        return;  // fmemopen wants a buffer; ReadFile has covered the empty file
    }
    std::string copy = bytes;  // fmemopen wants writable memory
    std::FILE* pFile = fmemopen(copy.data(), copy.size(), "rb");
    if (pFile == nullptr) {
        return;
    }
    CSurveyPieceReader reader(pFile, nBlock);
    std::string_view piece;
    size_t nPoints = 0;
    while (reader.Next(piece)) {
        CSurveyPoint point;
        if (point.ParseLine(piece, int(nPoints))) {
            if (nPoints >= expected.size() || !Same(point, expected[nPoints])) {
                std::abort();
            }
            ++nPoints;
        }
    }
    std::fclose(pFile);
    if (nPoints != expected.size()) {
        std::abort();
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* pData, size_t nSize) {
    if (nSize == 0) {
        return 0;
    }
    const size_t nBlock = pData[0] == 0 ? CSurveyPieceReader::kDefaultBlockBytes : pData[0];
    const std::string bytes(reinterpret_cast<const char*>(pData + 1), nSize - 1);
    const std::vector<survey_reference::RefPoint> expected = survey_reference::Read(bytes);
    CheckReadFile(bytes, expected);
    CheckBlocks(bytes, nBlock, expected);
    return 0;
}
