// CSurveyPieceReader: cuts an open surveyor file into the pieces that are parsed as lines.
#pragma once

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string_view>

// The pieces are exactly those that fgets with a 255-byte buffer returns on the file opened in
// Windows text mode, so the Linux build reads every file as the Windows build does:
//  - a Ctrl-Z byte (0x1A) ends the text, as text mode treats it as the end of the file;
//  - CR LF and LF end a line, a lone CR is an ordinary character; the CR of a CR LF is removed
//    before the line is cut, so a 254-character line ended by CR LF is one piece;
//  - a piece ends after a line end or after 254 characters, so a longer line falls into pieces
//    of 254 characters and a remainder;
//  - a piece holding a NUL byte ends there, as the C string that fgets fills would.
// The file is read in large blocks; only the unfinished piece (at most 254 bytes) is carried
// from one block to the next, so memory stays bounded whatever the file.
class CSurveyPieceReader {
public:
    static constexpr size_t kPieceChars = 254;
    static constexpr size_t kDefaultBlockBytes = 256 * 1024;

    // Reads pFile (open in binary mode; not owned, not closed) in blocks of nBlockBytes (taken
    // as at least 1). Allocates the block buffer once; throws std::bad_alloc only then.
    explicit CSurveyPieceReader(std::FILE* pFile, size_t nBlockBytes = kDefaultBlockBytes);

    // The next piece without its line end; false at the end of the text. A read error ends the
    // text like the end of the file. The view is valid until the next call. Empty pieces that
    // fgets would return for a bare line end are skipped, as they can never be point lines.
    bool Next(std::string_view& piece);

    // True when the very first read failed: the stream could not be read at all (a folder, for
    // example, opens on some systems but cannot be read).
    bool FailedAtStart() const { return m_bFailedAtStart; }

    // Bytes of the file passed so far, up to the end of the last piece returned.
    uint64_t GetBytesConsumed() const { return m_nBufferOffset + m_nPos; }

private:
    void Refill();
    std::string_view MakePiece(size_t nBegin, size_t nLength) const;

    std::FILE* m_pFile;
    size_t m_nBlockBytes;
    std::unique_ptr<char[]> m_pBuffer;  // a block plus room for the carried unfinished piece
    size_t m_nPos = 0;                  // first byte not yet returned
    size_t m_nEnd = 0;                  // end of the bytes in the buffer
    uint64_t m_nBufferOffset = 0;       // file offset of the buffer's first byte
    bool m_bEnd = false;                // nothing more comes from the file
    bool m_bStarted = false;
    bool m_bFailedAtStart = false;
    bool m_bHasNul = false;  // the buffer holds a NUL byte, so pieces must be checked for one
};
