#pragma once

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

namespace vrl_test {

/// A folder of its own for one test, gone with everything in it at the end.
class temporary_folder {
public:
    temporary_folder() {
        // The six X are what mkdtemp puts a name of its own in place of.
        std::string name = (std::filesystem::temp_directory_path() / "vrl_test_XXXXXX").string();
        if (::mkdtemp(name.data()) == nullptr) std::abort();
        m_path = name;
    }
    temporary_folder(const temporary_folder&) = delete;
    temporary_folder& operator=(const temporary_folder&) = delete;
    ~temporary_folder() {
        std::error_code ignored;
        std::filesystem::remove_all(m_path, ignored);
    }

    const std::filesystem::path& root() const { return m_path; }
    std::string path(const std::string& name) const { return (m_path / name).string(); }
    std::wstring wide_path(const std::wstring& name) const {
        const std::string folder = m_path.string();  // plain ASCII
        return std::wstring(folder.begin(), folder.end()) + L"/" + name;
    }
    bool has(const std::string& name) const { return std::filesystem::exists(m_path / name); }
    bool is_empty() const { return std::filesystem::is_empty(m_path); }

    std::string bytes(const std::string& name) const {
        std::ifstream file(m_path / name, std::ios_base::binary);
        return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
    }
    void write(const std::string& name, const std::string& bytes) const {
        std::ofstream(m_path / name, std::ios_base::binary) << bytes;
    }

private:
    std::filesystem::path m_path;
};

}  // namespace vrl_test
