// The object cache file "Standard\Makros\KalmoretObj.Cache": text in the ANSI code page, one
// "ID=file" line per entry in cache order, lines ending in CR LF; no header, comments, quoting or
// escaping. Reading keeps the rules of a text-mode fgets with a 1024-byte buffer, so files written
// by earlier versions read exactly as they always did.
#pragma once

#include <string>
#include <string_view>

#include "framework/String.h"
#include "objects/AssignmentTable.h"

// Cuts a byte stream into the lines the file is read by, and appends their entries: CR LF counts as
// one line break, a line ends after its line break or at 1023 characters (the rest of a longer
// line is a line of its own), and a line ends at a zero byte. Ctrl-Z is an ordinary character here,
// not the end of the file as in text mode: a point code holding one would otherwise hide every
// later entry. Feed it in blocks of any size.
class CCacheLineReader {
public:
    // Appends the entries of the lines that `bytes` completes.
    void Feed(std::string_view bytes, CObjectAssignmentArray& entries);
    // Ends the input; a last line without a line break counts too.
    void Finish(CObjectAssignmentArray& entries);

private:
    void Put(char ch, CObjectAssignmentArray& entries);
    void EndLine(CObjectAssignmentArray& entries);

    std::string m_strLine;
    bool m_bPendingCR = false;
};

// One line of the file: white space trimmed from both ends, then the ID before the first '=' and
// the file after it, both unchanged. False (skip the line) for an empty line, a line without '='
// and a line whose '=' is its last character. entry is set only on true.
bool ParseCacheLine(std::string_view line, CObjectAssignment& entry);

// The file's text: "ID=file" and CR LF for each entry, each text up to its first zero byte.
std::string FormatObjectCache(const CObjectAssignmentArray& entries);

enum class ECacheRead {
    Read,     // the whole file was read
    Missing,  // neither the file nor its folder exists
    Failed,   // it exists but could not be opened or read to its end (entries read so far kept)
};

// Appends the entries of the file.
ECacheRead ReadObjectCacheFile(const CString& strFile, CObjectAssignmentArray& entries);

// Writes the entries to strFile by way of a temporary file beside it (strFile + ".tmp"), which
// replaces strFile only once it has been written and flushed completely. On failure returns false;
// strFile is then as it was and the temporary file is gone.
bool WriteObjectCacheFile(const CString& strFile, const CObjectAssignmentArray& entries);
