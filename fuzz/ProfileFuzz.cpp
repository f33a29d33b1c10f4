// The profile reader and writer on arbitrary file bytes: reading must not fail whatever the buffer
// size, and a key written must read back with the value written, leaving every other key as it was.
#include <fuzzer/FuzzedDataProvider.h>

#include <unistd.h>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

#include "platform/Win32.h"
#include "platform/linux/ProfileText.h"

namespace {

using standin::CProfileText;

// Names and values that the format can hold unchanged: no line breaks, nothing trimmed, no quotes
// around the value, no ']' in a section, no '=' in a key, no key that reads as a comment or
// section.
bool IsPlain(const std::string& text, const char* pszBad) {
    if (text.find_first_of(pszBad) != std::string::npos ||
        text.find_first_of("\r\n") != std::string::npos) {
        return false;
    }
    return text.empty() ||
           (!std::strchr(" \t\v", text.front()) && !std::strchr(" \t\v", text.back()));
}

bool IsQuoted(const std::string& value) {
    return value.size() >= 2 && value.front() == value.back() &&
           (value.front() == '"' || value.front() == '\'');
}

// The file the API reads, removed when the fuzzer exits. It lies in memory (/dev/shm) where there
// is one: rewriting a file on disk thousands of times a second waits for the disk.
struct CScratchFile {
    std::string path = std::string(access("/dev/shm", W_OK) == 0 ? "/dev/shm" : "/tmp") +
                       "/kalmoret-profile-fuzz-" + std::to_string(getpid()) + ".ini";
    ~CScratchFile() { unlink(path.c_str()); }
};

void CheckApi(const std::string& bytes, FuzzedDataProvider& input) {
    static const CScratchFile scratch;
    const std::string& path = scratch.path;
    FILE* file = std::fopen(path.c_str(), "wb");
    if (!file) {
        return;
    }
    std::fwrite(bytes.data(), 1, bytes.size(), file);
    std::fclose(file);
    const std::string section = input.ConsumeRandomLengthString(16);
    const std::string key = input.ConsumeRandomLengthString(16);
    const DWORD nSize = input.ConsumeIntegralInRange<DWORD>(0, 40);
    char buffer[40];
    const DWORD n =
        GetPrivateProfileStringA(section.c_str(), key.c_str(), "def", buffer, nSize, path.c_str());
    GetPrivateProfileStringA(nullptr, nullptr, "", buffer, nSize, path.c_str());
    GetPrivateProfileStringA(section.c_str(), nullptr, "", buffer, nSize, path.c_str());
    GetPrivateProfileIntA(section.c_str(), key.c_str(), 5, path.c_str());
    if (nSize > 0 && n >= nSize) {
        std::abort();
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    FuzzedDataProvider input(data, size);
    const std::string section = input.ConsumeRandomLengthString(12);
    const std::string key = input.ConsumeRandomLengthString(12);
    const std::string value = input.ConsumeRandomLengthString(12);
    const std::string bytes = input.ConsumeRandomLengthString(4096);

    CProfileText text(bytes);
    const auto sections = text.SectionNames();
    for (const auto& name : sections) {
        text.KeyNames(name);
    }
    text.FindValue(section, key);

    const bool plain = IsPlain(section, "]") && IsPlain(key, "=") && IsPlain(value, "") &&
                       !IsQuoted(value) && !key.empty() && !std::strchr(";[", key.front());
    if (plain) {
        // Another key's value before and after the write: unchanged unless it is the same key.
        const std::string otherKey = key + "x";
        const auto before = text.FindValue(section, otherKey);
        const std::string kept = before ? std::string(*before) : std::string("\x01");
        text.SetValue(section, key, value);
        const CProfileText reread(text.Bytes());
        const auto written = reread.FindValue(section, key);
        const auto after = reread.FindValue(section, otherKey);
        if (!written || *written != value || (after ? std::string(*after) : "\x01") != kept) {
            std::abort();
        }
    }
    CheckApi(bytes, input);
    return 0;
}
