#pragma once

#include <gtest/gtest.h>

#include <string>

#include "V2/document_file.h"
#include "platform/file_exchange.h"
#include "tests/V2/documents.h"
#include "tests/zip/raw_archive.h"
#include "tests/zip/support.h"

/// What the tests of loading and saving share.
namespace vrl_test {

/// A document with `colors` colors, each about half a kilobyte of text.
inline vrl_v2::Vrl document_of(unsigned colors, const std::wstring& name = L"c") {
    vrl_v2::Vrl made;
    complete(made);
    for (unsigned i = 0; i < colors; ++i) {
        made.append_Color();
        complete(made.back_Color(), name + std::to_wstring(i));
    }
    return made;
}

/// The document as text, with this library's stamp.
inline std::string text_of(const vrl_v2::Vrl& document) {
    std::string text;
    EXPECT_TRUE(save_document_to_memory(document, text));
    return text;
}

inline std::string with_crlf(const std::string& text) {
    std::string out;
    for (const char c : text) out += c == '\n' ? std::string("\r\n") : std::string(1, c);
    return out;
}

/// An archive with this text as its one entry.
inline zip_test::RawArchive packed(const std::string& text) {
    return zip_test::RawArchive::Of({zip_test::RawEntry::DeflatedEntry("a.vrl", text)});
}

/// The system's own, with failures on demand.
class FaultyExchange : public vrl_platform::file_exchange {
public:
    int open_error = 0;
    int create_error = 0;
    int replace_error = 0;
    int folder_error = 0;

    vrl_platform::io_result open(const std::filesystem::path& path) override {
        return open_error != 0 ? vrl_platform::io_result{-1, open_error} : m_native.open(path);
    }
    vrl_platform::replacement create_beside(const std::filesystem::path& target) override {
        if (create_error == 0) return m_native.create_beside(target);
        vrl_platform::replacement refused;
        refused.error = create_error;
        return refused;
    }
    int replace(const std::filesystem::path& from, const std::filesystem::path& to) noexcept override {
        return replace_error != 0 ? replace_error : m_native.replace(from, to);
    }
    int remove(const std::filesystem::path& path) noexcept override { return m_native.remove(path); }
    int commit_folder(const std::filesystem::path& folder) noexcept override {
        return folder_error != 0 ? folder_error : m_native.commit_folder(folder);
    }

private:
    vrl_platform::file_exchange& m_native = vrl_platform::native_file_exchange();
};

}  // namespace vrl_test
