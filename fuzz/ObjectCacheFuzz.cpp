// The object cache file reader on arbitrary bytes: it must not fail, must give the same entries
// whatever blocks the bytes arrive in, and what it read must survive a save and a new read.
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "objects/CacheFile.h"

namespace {

CObjectAssignmentArray Parse(std::string_view bytes, size_t nBlock) {
    CObjectAssignmentArray entries;
    CCacheLineReader reader;
    for (size_t i = 0; i < bytes.size(); i += nBlock) {
        reader.Feed(bytes.substr(i, nBlock), entries);
    }
    reader.Finish(entries);
    return entries;
}

bool Same(const CObjectAssignmentArray& a, const CObjectAssignmentArray& b) {
    if (a.size() != b.size()) {
        return false;
    }
    for (size_t i = 0; i < a.size(); ++i) {
        if (!(a[i].m_strObjectId == b[i].m_strObjectId) ||
            !(a[i].m_strObjectFile == b[i].m_strObjectFile)) {
            return false;
        }
    }
    return true;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    if (size == 0) {
        return 0;
    }
    // The first byte chooses the block size of the second reading.
    const size_t nBlock = size_t(data[0] % 61) + 1;
    const std::string_view bytes(reinterpret_cast<const char*>(data) + 1, size - 1);
    const CObjectAssignmentArray entries = Parse(bytes, bytes.size() + 1);
    if (!Same(entries, Parse(bytes, nBlock))) {
        std::abort();
    }
    for (const CObjectAssignment& entry : entries) {
        if (entry.m_strObjectFile.IsEmpty() ||
            entry.m_strObjectId.Str().find('=') != std::string::npos) {
            std::abort();
        }
    }
    const std::string text = FormatObjectCache(entries);
    if (!Same(entries, Parse(text, text.size() + 1))) {
        std::abort();
    }
    return 0;
}
