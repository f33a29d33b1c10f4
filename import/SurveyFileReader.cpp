// CSurveyPointSet::ReadFile: the surveyor file reader.
#include <algorithm>
#include <climits>
#include <cstdio>
#include <memory>
#include <new>
#include <stdexcept>
#include <string_view>

#include "import/SurveyPieceReader.h"
#include "import/SurveyPointSet.h"

namespace {

// After this many pieces the array is sized for the whole file by the density seen so far.
constexpr size_t kSamplePieces = 4096;

// The file's length in bytes, 0 when unknown (not seekable, or beyond what ftell reports). Leaves
// the stream at its start.
uint64_t FileBytes(std::FILE* pFile) {
    if (std::fseek(pFile, 0, SEEK_END) != 0) {
        std::clearerr(pFile);
        return 0;
    }
    const long nBytes = std::ftell(pFile);
    std::rewind(pFile);
    return nBytes > 0 ? uint64_t(nBytes) : 0;
}

struct CFileCloser {
    void operator()(std::FILE* pFile) const { std::fclose(pFile); }
};

// The set cannot reach INT_MAX points in memory, but keep the conversion sound anyway.
int RunningIndex(size_t nPoints) {
    return int(std::min<size_t>(nPoints, INT_MAX));
}

}  // namespace

bool CSurveyPointSet::ReadFile(const CString& strPath) {
    try {
        const CString strFile(strPath);  // strPath may be this set's own name, emptied next
        Reset();
        if (!ReadPoints(strFile)) {
            Reset();
            return false;
        }
        m_strFileName = strFile;
        UpdateRange();
        return true;
    } catch (const std::bad_alloc&) {
        // A file too large for memory is a failed read, not a crash of the host.
        Reset();
        return false;
    }
}

void CSurveyPointSet::Reset() {
    m_nCreationMode = 0;
    std::vector<CSurveyPoint>().swap(m_points);  // also gives back the memory of a large set
    m_strFileName.Empty();
    UpdateRange();
}

bool CSurveyPointSet::ReadPoints(const CString& strFile) {
    // Binary mode on every system: the piece reader applies the Windows text-mode rules itself.
    // A missing or unreadable file fails here, which is what an access check would report.
    const std::unique_ptr<std::FILE, CFileCloser> file(std::fopen(strFile, "rb"));
    if (file == nullptr) {
        return false;
    }
    std::FILE* pFile = file.get();
    const uint64_t nFileBytes = FileBytes(pFile);
    CSurveyPieceReader reader(pFile);
    std::string_view piece;
    size_t nPieces = 0;
    while (reader.Next(piece)) {
        if (++nPieces == kSamplePieces) {
            ReserveByDensity(reader.GetBytesConsumed(), nFileBytes);
        }
        // Parsed in place at the end of the array rather than copied there: the same result as
        // appending a copy of a new point, without the copy.
        const int nRunning = RunningIndex(m_points.size());
        if (!m_points.emplace_back().ParseLine(piece, nRunning)) {
            m_points.pop_back();
        }
    }
    if (reader.FailedAtStart()) {
        return false;
    }
    // Geometric growth may leave up to half the array unused; a set lives long, so give it back.
    if (m_points.capacity() - m_points.size() > m_points.size() / 8) {
        m_points.shrink_to_fit();
    }
    return true;
}

void CSurveyPointSet::ReserveByDensity(uint64_t nBytesSeen, uint64_t nFileBytes) {
    if (nBytesSeen == 0 || nFileBytes <= nBytesSeen) {
        return;
    }
    // Regrowing a large array holds the old and the new one at once; sizing it once from the
    // density of points so far avoids that for files of even density. 3 % spare absorbs small
    // variations; a point line takes at least 6 bytes ("1 2 3" and a line end), which caps it.
    const double dEstimate =
        double(m_points.size()) * (double(nFileBytes) / double(nBytesSeen)) * 1.03 + 16.0;
    const double dCeiling = double(nFileBytes / 6 + 1);
    try {
        m_points.reserve(size_t(std::min(dEstimate, dCeiling)));
    } catch (const std::bad_alloc&) {
        // Only a guess: growing step by step may still fit.
    } catch (const std::length_error&) {
    }
}
