// A fresh folder for one test's files, removed with everything in it when the test ends.
#pragma once

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>

class CTempFolder {
public:
    // A new folder under the system's temporary folder; the name is taken from a random number
    // until one is free (create_directory is false for an existing folder), as mkdtemp does.
    CTempFolder() {
        std::random_device random;
        const std::filesystem::path base = std::filesystem::temp_directory_path();
        for (int nAttempt = 0; nAttempt < 100 && m_path.empty(); ++nAttempt) {
            const std::filesystem::path candidate = base / ("kalmoret-" + std::to_string(random()));
            std::error_code error;
            if (std::filesystem::create_directory(candidate, error)) {
                m_path = candidate.generic_string();
            }
        }
    }
    ~CTempFolder() {
        std::error_code ignored;
        std::filesystem::remove_all(m_path, ignored);
    }
    CTempFolder(const CTempFolder&) = delete;
    CTempFolder& operator=(const CTempFolder&) = delete;

    std::string Path(const std::string& name = {}) const {
        return name.empty() ? m_path : m_path + "/" + name;
    }
    bool Exists(const std::string& name) const { return std::filesystem::exists(Path(name)); }
    void Write(const std::string& name, const std::string& bytes) const {
        std::ofstream(Path(name), std::ios::binary) << bytes;
    }
    std::string Read(const std::string& name) const {
        std::ifstream in(Path(name), std::ios::binary);
        return std::string(std::istreambuf_iterator<char>(in), {});
    }

private:
    std::string m_path;
};
