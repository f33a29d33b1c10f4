#include "import/SurveyPieceReader.h"

#include <algorithm>
#include <cstring>

namespace {

constexpr char kEndOfText = '\x1a';  // Ctrl-Z

}  // namespace

CSurveyPieceReader::CSurveyPieceReader(std::FILE* pFile, size_t nBlockBytes)
    : m_pFile(pFile),
      m_nBlockBytes(std::max<size_t>(nBlockBytes, 1)),
      m_pBuffer(new char[m_nBlockBytes + kPieceChars]) {}

bool CSurveyPieceReader::Next(std::string_view& piece) {
    for (;;) {
        const char* pBegin = m_pBuffer.get() + m_nPos;
        const size_t nAvailable = m_nEnd - m_nPos;
        // Only a line end within the next piece and the byte after it matters; looking no
        // further keeps very long lines linear.
        const size_t nSearch = std::min(nAvailable, kPieceChars + 1);
        const char* pLineEnd = static_cast<const char*>(std::memchr(pBegin, '\n', nSearch));
        size_t nLength = 0;
        size_t nSkip = 0;
        if (pLineEnd != nullptr) {
            nLength = size_t(pLineEnd - pBegin);
            nSkip = nLength + 1;
            nLength -= nLength > 0 && pLineEnd[-1] == '\r' ? 1 : 0;  // text mode drops it
        } else if (nAvailable > kPieceChars || (m_bEnd && nAvailable > 0)) {
            // The byte after a full piece is known and no LF, so a CR at its end is a character.
            nLength = std::min(nAvailable, kPieceChars);
            nSkip = nLength;
        } else if (m_bEnd) {
            return false;
        } else {
            Refill();
            continue;
        }
        piece = MakePiece(m_nPos, nLength);
        m_nPos += nSkip;
        if (!piece.empty()) {
            return true;
        }
    }
}

std::string_view CSurveyPieceReader::MakePiece(size_t nBegin, size_t nLength) const {
    const char* p = m_pBuffer.get() + nBegin;
    if (m_bHasNul) {
        if (const void* pNul = std::memchr(p, '\0', nLength)) {
            nLength = size_t(static_cast<const char*>(pNul) - p);
        }
    }
    return std::string_view(p, nLength);
}

void CSurveyPieceReader::Refill() {
    // At most kPieceChars bytes are left (Next refills only then); keep them in front.
    const size_t nKeep = m_nEnd - m_nPos;
    std::memmove(m_pBuffer.get(), m_pBuffer.get() + m_nPos, nKeep);
    m_nBufferOffset += m_nPos;
    m_nPos = 0;
    m_nEnd = nKeep;

    char* pNew = m_pBuffer.get() + nKeep;
    size_t nRead = std::fread(pNew, 1, m_nBlockBytes, m_pFile);
    if (nRead == 0) {
        m_bFailedAtStart = !m_bStarted && std::ferror(m_pFile) != 0;
        m_bEnd = true;
    }
    m_bStarted = true;
    if (const void* pStop = std::memchr(pNew, kEndOfText, nRead)) {
        nRead = size_t(static_cast<const char*>(pStop) - pNew);
        m_bEnd = true;
    }
    m_nEnd += nRead;
    m_bHasNul = std::memchr(m_pBuffer.get(), '\0', m_nEnd) != nullptr;
}
