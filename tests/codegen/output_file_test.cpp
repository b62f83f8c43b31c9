#include "codegen/output_file.h"

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <string>

#include "tests/codegen/small_schema.h"

namespace {

using codegen_tests::temporary_folder;
using vrl_codegen::write_if_changed;

std::string content_of(const std::filesystem::path& path) {
    std::ostringstream text;
    text << std::ifstream(path, std::ios::binary).rdbuf();
    return text.str();
}

class OutputFile : public testing::Test {
protected:
    /// Dates a file back, and gives its date: a second write would be seen.
    std::filesystem::file_time_type age(const std::filesystem::path& path) const {
        const auto date = std::filesystem::last_write_time(path) - std::chrono::hours(1);
        std::filesystem::last_write_time(path, date);
        return std::filesystem::last_write_time(path);
    }

    const temporary_folder m_folder;
    const std::filesystem::path m_file = m_folder.write("file.h", "old\n");
};

TEST_F(OutputFile, IsWrittenWithTheFoldersThatItNeeds) {
    const std::filesystem::path path = m_file.parent_path() / "a" / "b" / "new.h";
    write_if_changed(path, "text\r\n");
    EXPECT_EQ(content_of(path), "text\r\n");
}

TEST_F(OutputFile, IsReplacedWhenItSaysSomethingElse) {
    const auto date = age(m_file);
    write_if_changed(m_file, "new\n");
    EXPECT_EQ(content_of(m_file), "new\n");
    EXPECT_NE(std::filesystem::last_write_time(m_file), date);
}

TEST_F(OutputFile, IsLeftAloneWhenItSaysTheSame) {
    const auto date = age(m_file);
    write_if_changed(m_file, "old\n");
    EXPECT_EQ(std::filesystem::last_write_time(m_file), date);
}

TEST_F(OutputFile, IsMadeEvenWhenItHasNothingToSay) {
    const std::filesystem::path path = m_file.parent_path() / "empty.h";
    write_if_changed(path, "");
    EXPECT_TRUE(std::filesystem::exists(path));
}

TEST_F(OutputFile, ThatCannotBeWrittenIsToldByName) {
    const std::filesystem::path folder = m_file.parent_path() / "folder.h";
    std::filesystem::create_directories(folder);
    try {
        write_if_changed(folder, "text");
        FAIL();
    } catch (const std::runtime_error& failure) {
        EXPECT_NE(std::string(failure.what()).find("folder.h"), std::string::npos) << failure.what();
    }
}

}  // namespace
