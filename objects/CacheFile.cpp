#include "objects/CacheFile.h"

#include <algorithm>
#include <cstring>

#include "platform/Win32.h"

namespace {

// fgets with a 1024-byte buffer returns at most 1023 characters at a time.
constexpr size_t kMaxLine = 1023;

bool IsSpace(char ch) {
    return ch && std::strchr(" \t\r\n\v\f", ch);
}

bool WriteAll(HANDLE hFile, std::string_view bytes) {
    while (!bytes.empty()) {
        const DWORD nChunk = DWORD(std::min<size_t>(bytes.size(), 1u << 20));
        DWORD nWritten = 0;
        if (!WriteFile(hFile, bytes.data(), nChunk, &nWritten, nullptr) || nWritten != nChunk) {
            return false;
        }
        bytes.remove_prefix(nChunk);
    }
    return true;
}

bool WriteWholeFile(const CString& strFile, std::string_view bytes) {
    HANDLE hFile = CreateFileA(strFile, GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS,
                               FILE_ATTRIBUTE_NORMAL, nullptr);
    if (hFile == INVALID_HANDLE_VALUE) {
        return false;
    }
    const bool written = WriteAll(hFile, bytes) && FlushFileBuffers(hFile);
    return CloseHandle(hFile) && written;
}

}  // namespace

void CCacheLineReader::Feed(std::string_view bytes, CObjectAssignmentArray& entries) {
    for (const char ch : bytes) {
        // Text mode reads CR LF as LF; a CR before anything else stays.
        if (m_bPendingCR) {
            m_bPendingCR = false;
            if (ch != '\n') {
                Put('\r', entries);
            }
        }
        if (ch == '\r') {
            m_bPendingCR = true;
        } else {
            Put(ch, entries);
        }
    }
}

void CCacheLineReader::Finish(CObjectAssignmentArray& entries) {
    if (m_bPendingCR) {
        m_bPendingCR = false;
        Put('\r', entries);
    }
    if (!m_strLine.empty()) {
        EndLine(entries);
    }
}

void CCacheLineReader::Put(char ch, CObjectAssignmentArray& entries) {
    m_strLine.push_back(ch);
    if (ch == '\n' || m_strLine.size() == kMaxLine) {
        EndLine(entries);
    }
}

void CCacheLineReader::EndLine(CObjectAssignmentArray& entries) {
    // The line was a C string: a zero byte ends it.
    const std::string_view line(m_strLine.c_str());
    CObjectAssignment entry;
    if (ParseCacheLine(line, entry)) {
        entries.push_back(std::move(entry));
    }
    m_strLine.clear();
}

bool ParseCacheLine(std::string_view line, CObjectAssignment& entry) {
    while (!line.empty() && IsSpace(line.front())) {
        line.remove_prefix(1);
    }
    while (!line.empty() && IsSpace(line.back())) {
        line.remove_suffix(1);
    }
    const size_t nEquals = line.find('=');
    if (nEquals == std::string_view::npos || nEquals + 1 == line.size()) {
        return false;
    }
    entry.m_strObjectId = CString(line.substr(0, nEquals));
    entry.m_strObjectFile = CString(line.substr(nEquals + 1));
    return true;
}

std::string FormatObjectCache(const CObjectAssignmentArray& entries) {
    std::string text;
    for (const CObjectAssignment& entry : entries) {
        text.append(static_cast<const char*>(entry.m_strObjectId));
        text.push_back('=');
        text.append(static_cast<const char*>(entry.m_strObjectFile));
        text.append("\r\n");
    }
    return text;
}

ECacheRead ReadObjectCacheFile(const CString& strFile, CObjectAssignmentArray& entries) {
    HANDLE hFile = CreateFileA(strFile, GENERIC_READ, FILE_SHARE_READ, nullptr, OPEN_EXISTING,
                               FILE_ATTRIBUTE_NORMAL, nullptr);
    if (hFile == INVALID_HANDLE_VALUE) {
        const DWORD dwError = GetLastError();
        const bool missing = dwError == ERROR_FILE_NOT_FOUND || dwError == ERROR_PATH_NOT_FOUND;
        return missing ? ECacheRead::Missing : ECacheRead::Failed;
    }
    CCacheLineReader reader;
    char buffer[65536];
    DWORD nRead = 0;
    bool ok = true;
    while ((ok = ReadFile(hFile, buffer, sizeof buffer, &nRead, nullptr) != FALSE) && nRead > 0) {
        reader.Feed(std::string_view(buffer, nRead), entries);
    }
    if (ok) {
        reader.Finish(entries);
    }
    CloseHandle(hFile);
    return ok ? ECacheRead::Read : ECacheRead::Failed;
}

bool WriteObjectCacheFile(const CString& strFile, const CObjectAssignmentArray& entries) {
    const CString strTemp = strFile + CString(".tmp");
    if (!WriteWholeFile(strTemp, FormatObjectCache(entries)) ||
        !MoveFileExA(strTemp, strFile, MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH)) {
        DeleteFileA(strTemp);
        return false;
    }
    return true;
}
