// The services of the system that the engine stands on.

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cerrno>
#include <cstdlib>

#include "platform/c_random.h"
#include "platform/code_page.h"
#include "support.h"

namespace {

using vrl_platform::existence;
using zip_test::ScratchFolder;

struct ModeAttributes {
    mode_t mode;
    unsigned attributes;
};
void PrintTo(const ModeAttributes& c, std::ostream* os) { *os << std::oct << c.mode; }

class FileAttributes : public testing::TestWithParam<ModeAttributes> {};

TEST_P(FileAttributes, ComeFromTheModeBits) {
    const ScratchFolder folder;
    const std::string path = folder.Write("a", "");
    ASSERT_EQ(::chmod(path.c_str(), GetParam().mode), 0);
    EXPECT_EQ(vrl_platform::native_file_names().attributes(path), GetParam().attributes);
}

INSTANTIATE_TEST_SUITE_P(ModeBits, FileAttributes,
                         testing::Values(ModeAttributes{0644, 0x20}, ModeAttributes{0444, 0x21},
                                         ModeAttributes{0200, 0x22}, ModeAttributes{0000, 0x23},
                                         ModeAttributes{0755, 0x00}, ModeAttributes{0555, 0x01}));

class ModeBits : public testing::TestWithParam<ModeAttributes> {};

TEST_P(ModeBits, ComeFromTheAttributes) {
    const ScratchFolder folder;
    const std::string path = folder.Write("a", "");
    ASSERT_EQ(::chmod(path.c_str(), 0644), 0);
    ASSERT_TRUE(vrl_platform::native_file_names().set_attributes(path, GetParam().attributes));
    struct stat status {};
    ASSERT_EQ(::stat(path.c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777, GetParam().mode);
}

INSTANTIATE_TEST_SUITE_P(Attributes, ModeBits,
                         testing::Values(ModeAttributes{0644, 0x20}, ModeAttributes{0444, 0x21},
                                         ModeAttributes{0200, 0x22}, ModeAttributes{0000, 0x23}));

TEST(FileNames, AFolderHasTheFolderBit) {
    const ScratchFolder folder;
    EXPECT_EQ(vrl_platform::native_file_names().attributes(folder.Path().string()), 0x10U);
}

TEST(FileNames, AbsenceIsAnEmptyAnswer) {
    auto& names = vrl_platform::native_file_names();
    EXPECT_FALSE(names.attributes("/no/such/file"));
    EXPECT_FALSE(names.modification_time("/no/such/file"));
    EXPECT_FALSE(names.set_attributes("/no/such/file", 0));
    EXPECT_FALSE(names.set_modification_time("/no/such/file", 0));
    EXPECT_FALSE(names.remove("/no/such/file"));
    EXPECT_FALSE(names.rename("/no/such/file", "/no/such/file2"));
    EXPECT_EQ(names.exists("/no/such/file"), existence::absent);
    EXPECT_FALSE(names.is_enterable_folder("/no/such/file"));
}

TEST(FileNames, TellsFilesFromFolders) {
    const ScratchFolder folder;
    auto& names = vrl_platform::native_file_names();
    EXPECT_EQ(names.exists(folder.Write("a", "")), existence::file);
    EXPECT_EQ(names.exists(folder.Path().string()), existence::folder);
    EXPECT_TRUE(names.is_enterable_folder(folder.Path().string()));
    EXPECT_FALSE(names.is_enterable_folder(folder / "a"));
}

TEST(FileNames, ModificationTimeGoesAndComes) {
    const ScratchFolder folder;
    const std::string path = folder.Write("a", "");
    auto& names = vrl_platform::native_file_names();
    EXPECT_TRUE(names.set_modification_time(path, 1234567890));
    EXPECT_EQ(names.modification_time(path), 1234567890);
}

TEST(FileNames, RenameDoesNotOverwrite) {
    const ScratchFolder folder;
    folder.Write("a", "a");
    folder.Write("b", "b");
    EXPECT_FALSE(vrl_platform::native_file_names().rename(folder / "a", folder / "b"));
    EXPECT_TRUE(vrl_platform::native_file_names().rename(folder / "a", folder / "c"));
    EXPECT_EQ(folder.Read("b"), "b");
    EXPECT_EQ(folder.Read("c"), "a");
}

TEST(FileNames, TemporaryFilesAreNewAndLieInTheTemporaryFolder) {
    const ScratchFolder folder;
    const char* before = std::getenv("TMPDIR");
    const std::string saved = before != nullptr ? before : "";
    auto& names = vrl_platform::native_file_names();
    ::setenv("TMPDIR", (folder.Path().string() + "/").c_str(), 1);
    EXPECT_EQ(names.temporary_folder(), folder.Path().string());
    ::unsetenv("TMPDIR");
    EXPECT_EQ(names.temporary_folder(), "/tmp");
    if (before != nullptr) ::setenv("TMPDIR", saved.c_str(), 1);

    const auto first = names.make_temporary_file(folder.Path().string(), "ZAR");
    const auto second = names.make_temporary_file(folder.Path().string(), "ZAR");
    ASSERT_TRUE(first && second);
    EXPECT_NE(*first, *second);
    EXPECT_EQ(first->rfind(folder / "ZAR", 0), 0U);
    EXPECT_EQ(names.exists(*first), existence::file);
    EXPECT_FALSE(names.make_temporary_file("/no/such/folder", "ZAR"));
}

TEST(Volumes, HaveFreeSpaceAndAreNeverRemovable) {
    auto& volumes = vrl_platform::native_volumes();
    EXPECT_GT(volumes.free_space("/tmp").value_or(0), 0U);
    EXPECT_FALSE(volumes.free_space("/no/such/folder"));
    EXPECT_FALSE(volumes.is_removable("/tmp"));
    EXPECT_FALSE(volumes.set_label("/tmp", "label"));
}

TEST(Entropy, DiffersFromCallToCall) {
    std::uint8_t first[300] = {};
    std::uint8_t second[300] = {};
    ASSERT_TRUE(vrl_platform::native_entropy().fill(first, sizeof first));
    ASSERT_TRUE(vrl_platform::native_entropy().fill(second, sizeof second));
    EXPECT_NE(zip_test::Bytes(reinterpret_cast<char*>(first), sizeof first),
              zip_test::Bytes(reinterpret_cast<char*>(second), sizeof second));
}

TEST(Clock, TellsAPlausibleTime) {
    // 2023-01-01, and the end of what DOS dates can say.
    EXPECT_GT(vrl_platform::native_clock().now(), 1672531200);
    EXPECT_LT(vrl_platform::native_clock().now(), 4354819200);
}

// The first values that the generator of the Windows C runtime gives for the seed 1.
TEST(CRandom, IsTheGeneratorOfTheWindowsRuntime) {
    vrl_platform::c_random random(1);
    EXPECT_EQ(random.next(), 41U);
    EXPECT_EQ(random.next(), 18467U);
    EXPECT_EQ(random.next(), 6334U);
    EXPECT_EQ(random.next(), 26500U);
}

struct Conversion {
    const char* why;
    std::string text;
    std::uint32_t from;
    std::uint32_t to;
    std::string result;
};
void PrintTo(const Conversion& c, std::ostream* os) { *os << c.why; }

class CodePages : public testing::TestWithParam<Conversion> {};

TEST_P(CodePages, Convert) {
    EXPECT_EQ(vrl_platform::convert_code_page(GetParam().text, GetParam().from, GetParam().to),
              GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(
    Conversions, CodePages,
    testing::Values(Conversion{"OEM letters to UTF-8", "\x81\x9A\xE1", 1, 0, "\xC3\xBC\xC3\x9C\xC3\x9F"},
                    Conversion{"UTF-8 letters to OEM", "\xC3\xBC\xC3\x9C\xC3\x9F", 0, 1, "\x81\x9A\xE1"},
                    Conversion{"by their proper numbers", "\x81", 437, 65001, "\xC3\xBC"},
                    Conversion{"three bytes of UTF-8", "\xC9", 1, 0, "\xE2\x95\x94"},
                    Conversion{"and back", "\xE2\x95\x94", 0, 1, "\xC9"},
                    Conversion{"what the page does not have", "\xE4\xB8\xAD!\xF0\x9F\x98\x80", 0, 1, "?!?"},
                    Conversion{"what is no UTF-8", "a\xFF\xC3z\xC3", 0, 1, "a??z?"},
                    Conversion{"overlong and surrogate forms", "\xC0\xAF\xED\xA0\x80\xF5", 0, 1, "??????"},
                    Conversion{"the last two forms past their ranges", "\xE0\x80\x80\xF4\x90\x80\x80", 0, 1,
                               "???????"},
                    Conversion{"the same page", "\x81\xFF", 1, 1, "\x81\xFF"},
                    Conversion{"UTF-8 under both its numbers", "\xFF", 0, 65001, "\xFF"},
                    Conversion{"a page that is not known", "\x81", 1250, 0, "\x81"}));

TEST(CodePages, EveryOemByteComesBack) {
    std::string all;
    for (int c = 0; c < 256; ++c) all.push_back(static_cast<char>(c));
    EXPECT_EQ(vrl_platform::convert_code_page(vrl_platform::convert_code_page(all, 1, 0), 0, 1), all);
}

}  // namespace
