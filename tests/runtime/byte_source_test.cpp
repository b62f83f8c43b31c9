#include "runtime/byte_source.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <type_traits>

#include "reading_paths.h"
#include "runtime/utf8_decoder.h"

namespace {

using namespace qbxV2;

std::string rest_of(c_read& source) {
    std::string bytes;
    for (int c = source.read(); c != -1; c = source.read()) bytes += static_cast<char>(c);
    return bytes;
}

std::string skip_and_rewind(c_read& source, std::size_t count) {
    for (std::size_t i = 0; i < count; ++i) source.read();
    source.rewind();
    return rest_of(source);
}

/// A file that is gone when the test ends.
class TemporaryFile {
public:
    explicit TemporaryFile(const std::string& content, const std::string& name = "source.bin") {
        const auto* const info = testing::UnitTest::GetInstance()->current_test_info();
        m_folder = std::filesystem::temp_directory_path() / ("vrl_" + std::string(info->name()));
        std::filesystem::create_directories(m_folder);
        m_path = m_folder / std::filesystem::u8path(name);
        std::ofstream(m_path, std::ios::binary) << content;
    }
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;
    ~TemporaryFile() { std::filesystem::remove_all(m_folder); }
    std::string path() const { return m_path.string(); }
    std::string folder() const { return m_folder.string(); }

private:
    std::filesystem::path m_folder;
    std::filesystem::path m_path;
};

/// Bytes in which every position can be told from its neighbours.
std::string numbered_bytes(std::size_t size) {
    std::string bytes;
    for (std::size_t i = 0; bytes.size() < size; ++i) bytes += std::to_string(i) + ",";
    bytes.resize(size);
    return bytes;
}

TEST(Read, ASourceOfACallersOwnHasUsefulDefaults) {
    reading_paths::ReadOnlySource source("a");
    EXPECT_TRUE(source.is_open());
    EXPECT_EQ(source.get_source_id(), nullptr);
    EXPECT_FALSE(source.fill_run());
    EXPECT_EQ(source.read(), 'a');
}

TEST(ReadMemory, GivesUnsignedBytesAndThenTheEndAgainAndAgain) {
    const reading_paths::ExactMemory memory("\xFF\x7F");
    c_read_memory source = memory.source();
    EXPECT_TRUE(source.is_open());
    EXPECT_EQ(source.get_source_id(), nullptr);
    EXPECT_EQ(source.read(), 0xFF);
    EXPECT_EQ(source.read(), 0x7F);
    EXPECT_EQ(source.read(), -1);
    EXPECT_EQ(source.read(), -1);
}

TEST(ReadMemory, NoBytesAtAllAreTheEndAtOnce) {
    c_read_memory source(nullptr, 0);
    EXPECT_EQ(source.read(), -1);
}

TEST(ReadMemory, RewindStartsOverAndCopiesGoOnByThemselves) {
    const std::string text = "abc";
    c_read_memory source(text.data(), text.size());
    source.read();
    c_read_memory copy = source;
    EXPECT_EQ(rest_of(copy), "bc");
    EXPECT_EQ(rest_of(source), "bc");
    source.rewind();
    copy = source;
    EXPECT_EQ(rest_of(copy), "abc");
}

TEST(ReadMemory, NeedsItsBytes) { EXPECT_FALSE(std::is_default_constructible_v<c_read_memory>); }

TEST(ReadString, ReadsTheCharactersOfTheString) {
    const std::string text("a\0b", 3);
    c_read_string source(text);
    EXPECT_EQ(rest_of(source), text);
    c_read_string moved = std::move(source);
    moved.rewind();
    EXPECT_EQ(rest_of(moved), text);
}

TEST(ReadFile, AMissingPathIsNotOpenAndGivesTheEndWithoutAReport) {
    c_read_file source("no/such/folder/no.such.file");
    EXPECT_FALSE(source.is_open());
    EXPECT_EQ(source.read(), -1);
    EXPECT_STREQ(source.get_source_id(), "no/such/folder/no.such.file");
    c_error errors;
    c_get_as_utf8 getter(source, errors);
    EXPECT_EQ(getter.get(), -1);
    EXPECT_FALSE(errors.is_errored());
    source.rewind();
    EXPECT_EQ(source.read(), -1);
}

TEST(ReadFile, AFolderIsNoFile) {
    const TemporaryFile file("x");
    const std::string folder = file.folder();
    EXPECT_FALSE(c_read_file(folder.c_str()).is_open());
    EXPECT_FALSE(c_read_file(std::wstring(folder.begin(), folder.end()).c_str()).is_open());
}

TEST(ReadFile, ANullStreamIsNotOpen) {
    c_read_file source(static_cast<std::FILE*>(nullptr));
    EXPECT_FALSE(source.is_open());
    EXPECT_EQ(source.read(), -1);
    EXPECT_STREQ(source.get_source_id(), "");
}

TEST(ReadFile, ReadsBinaryAndIsNamedByItsPath) {
    const TemporaryFile file("a\r\n\x1A\xFF");
    c_read_file source(file.path().c_str());
    EXPECT_TRUE(source.is_open());
    EXPECT_EQ(source.get_source_id(), file.path());
    EXPECT_EQ(rest_of(source), "a\r\n\x1A\xFF");
}

TEST(ReadFile, AWidePathIsNamedInUtf8) {
    const TemporaryFile file("x",
                             "f\xC3\xA4"
                             "rbe.vrl");
    const std::string folder = file.folder();
    const std::wstring path = std::wstring(folder.begin(), folder.end()) + L"/f\xE4rbe.vrl";
    c_read_file source(path.c_str());
    ASSERT_TRUE(source.is_open());
    EXPECT_EQ(rest_of(source), "x");
    EXPECT_EQ(source.get_source_id(), file.folder() +
                                          "/f\xC3\xA4"
                                          "rbe.vrl");
}

TEST(ReadFile, TheSourceIdOfAWidePathDoesNotJoinSurrogates) {
    c_read_file source(L"\xD83D\xDE00");
    EXPECT_STREQ(source.get_source_id(), "\xED\xA0\xBD\xED\xB8\x80");
}

TEST(ReadFile, CloseTwiceIsHarmless) {
    const TemporaryFile file("abc");
    c_read_file source(file.path().c_str());
    source.close();
    EXPECT_FALSE(source.is_open());
    source.close();
    EXPECT_EQ(source.read(), -1);
}

TEST(ReadFile, CloseLeavesTheRestOfTheCurrentBlockToRead) {
    const std::string bytes = numbered_bytes(2000);
    const TemporaryFile file(bytes);
    c_read_file source(file.path().c_str());
    for (int i = 0; i < 600; ++i) source.read();
    source.close();
    EXPECT_EQ(rest_of(source), bytes.substr(600, 1024 - 600));
}

TEST(ReadFile, ClosesACallersStreamUnlessToldToLeaveIt) {
    const TemporaryFile file("abc");
    std::FILE* const stream = std::fopen(file.path().c_str(), "rb");
    ASSERT_NE(stream, nullptr);
    {
        c_read_file source(stream);
        source.leave_file_open_on_delete(true);
        EXPECT_EQ(source.read(), 'a');
    }
    EXPECT_EQ(std::fseek(stream, 0, SEEK_SET), 0);
    EXPECT_EQ(std::fgetc(stream), 'a');
    std::rewind(stream);
    c_read_file source(stream);
    source.leave_file_open_on_delete(true);
    source.leave_file_open_on_delete(false);
    EXPECT_EQ(rest_of(source), "abc");
}

TEST(ReadFile, TakesBlocksOf512BytesFromACallersStream) {
    const TemporaryFile file(numbered_bytes(2000));
    std::FILE* const stream = std::fopen(file.path().c_str(), "rb");
    ASSERT_NE(stream, nullptr);
    c_read_file source(stream);
    source.read();
    EXPECT_EQ(std::ftell(stream), 512);
}

struct RewindCase {
    const char* why;
    std::size_t size;
    std::size_t read;
    std::size_t left_of_block;
};
void PrintTo(const RewindCase& c, std::ostream* os) { *os << c.why; }

class ReadFileRewind : public testing::TestWithParam<RewindCase> {};

// Intended: a rewind is a bare seek; what is left of the block of 512 bytes is still delivered, first.
TEST_P(ReadFileRewind, DeliversTheRestOfTheBlockFirst) {
    const RewindCase& c = GetParam();
    const std::string bytes = numbered_bytes(c.size);
    const TemporaryFile file(bytes);
    const std::string expected = bytes.substr(std::min(c.read, c.size), c.left_of_block) + bytes;
    c_read_file by_path(file.path().c_str());
    EXPECT_EQ(skip_and_rewind(by_path, c.read), expected);
    c_read_file by_stream(std::fopen(file.path().c_str(), "rb"));
    EXPECT_EQ(skip_and_rewind(by_stream, c.read), expected);
}

INSTANTIATE_TEST_SUITE_P(AroundBlocks, ReadFileRewind,
                         testing::Values(RewindCase{"nothing read", 2000, 0, 0},
                                         RewindCase{"one byte", 2000, 1, 511},
                                         RewindCase{"one short of a block", 2000, 511, 1},
                                         RewindCase{"a whole block", 2000, 512, 0},
                                         RewindCase{"into the second block", 2000, 513, 511},
                                         RewindCase{"into a short last block", 2000, 1990, 10},
                                         RewindCase{"the whole file", 2000, 2000, 0},
                                         RewindCase{"past the end", 100, 150, 0},
                                         RewindCase{"far into a large file", 200000, 130000, 130048 - 130000},
                                         RewindCase{"a block's end far in", 200000, 131072, 0}));

struct GetterRewindCase {
    const char* why;
    std::size_t gets;
    std::size_t pushed_back;
};
void PrintTo(const GetterRewindCase& c, std::ostream* os) { *os << c.why; }

class ReadFileUnderAGetter : public testing::TestWithParam<GetterRewindCase> {};

TEST_P(ReadFileUnderAGetter, ForgetsWhatWasPushedBackBeforeARewind) {
    const std::string bytes = reading_paths::join({"<", numbered_bytes(3000)});
    const TemporaryFile file(bytes);
    std::string outcome[2];
    for (const bool use_runs : {true, false}) {
        c_read_file source(file.path().c_str());
        c_error errors;
        c_get_as_utf8 getter(source, errors);
        getter.use_runs(use_runs);
        std::string read;
        for (std::size_t i = 0; i < GetParam().gets; ++i) read += static_cast<char>(getter.get());
        for (std::size_t i = 0; i < GetParam().pushed_back; ++i) getter.unget(read[read.size() - 1 - i]);
        getter.rewind();
        outcome[use_runs] = rest_of(source);
    }
    EXPECT_EQ(outcome[true], outcome[false]);
    EXPECT_EQ(outcome[true].substr(outcome[true].size() - bytes.size()), bytes);
}

INSTANTIATE_TEST_SUITE_P(Cases, ReadFileUnderAGetter,
                         testing::Values(GetterRewindCase{"nothing pushed back", 100, 0},
                                         GetterRewindCase{"one", 100, 1}, GetterRewindCase{"two", 100, 2},
                                         GetterRewindCase{"three", 100, 3},
                                         GetterRewindCase{"across a block", 513, 2},
                                         GetterRewindCase{"at a block's end", 512, 1}));

}  // namespace
