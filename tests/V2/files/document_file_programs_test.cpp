#include <gtest/gtest.h>

#include <cstdlib>

#include "document_files.h"

// Packed documents and programs that others wrote, both ways.

namespace {

using vrl_test::document_of;
using vrl_test::text_of;
using vrl_v2::file_failure;
using vrl_v2::load_document;
using vrl_v2::save_document;
using zip_test::ScratchFolder;

struct maker {
    const char* name;
    /// Makes a.vrlz of a.vrl.
    const char* command;
    /// Why it is refused, if it is.
    const char* words = nullptr;
};

const maker k_makers[] = {
    {"Zip", "zip -q a.vrlz a.vrl"},
    {"ZipBest", "zip -q -9 a.vrlz a.vrl"},
    {"ZipStored", "zip -q -0 a.vrlz a.vrl"},
    {"ZipBzip2", "zip -q -Z bzip2 a.vrlz a.vrl"},
    {"ZipWithDescriptor", "zip -q -fd a.vrlz a.vrl"},
    {"ZipFromAPipe", "cat a.vrl | zip -q a.vrlz -", "ZIP64"},
    {"ZipToAPipe", "zip -q - a.vrl | cat >a.vrlz"},
    {"ZipWithComment", "echo 'some comment' | zip -q -z a.vrlz a.vrl"},
    {"ZipOfAFolder", "mkdir -p d && cp a.vrl d/ && zip -q -r -D a.vrlz d"},
    {"ZipOfSeveral", "cp a.vrl 0.vrl && echo rubbish >z.txt && zip -q a.vrlz 0.vrl z.txt a.vrl"},
    {"ZipEnciphered", "zip -q -P secret a.vrlz a.vrl", "password"},
    {"SevenZip", "7z a -tzip a.vrlz a.vrl"},
    {"SevenZipStored", "7z a -tzip -mm=Copy a.vrlz a.vrl"},
    {"SevenZipBzip2", "7z a -tzip -mm=BZip2 a.vrlz a.vrl"},
    {"SevenZipUltra", "7z a -tzip -mx=9 a.vrlz a.vrl"},
    {"SevenZipDeflate64", "7z a -tzip -mm=Deflate64 a.vrlz a.vrl", "method 9"},
    {"SevenZipLzma", "7z a -tzip -mm=LZMA a.vrlz a.vrl", "method 14"},
    {"SevenZipAes", "7z a -tzip -psecret -mem=AES256 a.vrlz a.vrl", "password"},
    {"Python", "python3 -m zipfile -c a.vrlz a.vrl"},
    {"PythonDeflated",
     "python3 -c \"import zipfile; zipfile.ZipFile('a.vrlz', 'w', zipfile.ZIP_DEFLATED).write('a.vrl')\""},
    {"PythonBzip2",
     "python3 -c \"import zipfile; zipfile.ZipFile('a.vrlz', 'w', zipfile.ZIP_BZIP2).write('a.vrl')\""},
    {"PythonToAPipe",
     "python3 -c \"import sys, zipfile; z = zipfile.ZipFile(sys.stdout.buffer, 'w', zipfile.ZIP_DEFLATED); "
     "z.write('a.vrl'); z.close()\" | cat >a.vrlz"},
};

class MadeBy : public testing::TestWithParam<maker> {};

TEST_P(MadeBy, OthersIsLoadedOrRefusedWithTheReason) {
    const ScratchFolder folder;
    const auto document = document_of(200);
    ASSERT_TRUE(save_document(document, folder / "a.vrl"));
    ASSERT_EQ(zip_test::Run("cd '" + folder.Path().string() + "' && " + GetParam().command), 0);
    const auto loaded = load_document(folder / "a.vrlz");
    if (GetParam().words == nullptr) {
        ASSERT_TRUE(loaded) << loaded.message;
        EXPECT_EQ(text_of(*loaded.document), text_of(document));
    } else {
        EXPECT_EQ(loaded.failure, file_failure::bad_archive);
        EXPECT_NE(loaded.message.find(GetParam().words), std::string::npos) << loaded.message;
    }
}

INSTANTIATE_TEST_SUITE_P(Programs, MadeBy, testing::ValuesIn(k_makers),
                         [](const auto& row) { return std::string(row.param.name); });

struct size_and_level {
    unsigned colors;
    int level;
};

class Saved : public testing::TestWithParam<size_and_level> {};

TEST_P(Saved, IsTestedAndUnpackedByOthers) {
    const ScratchFolder folder;
    const zip_test::CurrentFolder current(folder.Path());
    vrl_v2::save_options options;
    options.compression_level = GetParam().level;
    const auto document = document_of(GetParam().colors);
    ASSERT_TRUE(save_document(document, "a.vrlz", options));
    ASSERT_TRUE(save_document(document, "plain.vrl"));
    for (const char* command :
         {"unzip -t a.vrlz", "7z t a.vrlz", "python3 -m zipfile -t a.vrlz",
          "unzip -p a.vrlz a.vrl | cmp - plain.vrl", "7z x -so a.vrlz a.vrl | cmp - plain.vrl",
          "python3 -m zipfile -e a.vrlz out && cmp out/a.vrl plain.vrl"}) {
        EXPECT_EQ(zip_test::Run(command), 0) << command;
    }
}

INSTANTIATE_TEST_SUITE_P(Programs, Saved,
                         testing::Values(size_and_level{0, -1}, size_and_level{1, 0}, size_and_level{500, -1},
                                         size_and_level{500, 1}, size_and_level{500, 9}));

TEST(Programs, SeeNamesThatAreNotAscii) {
    const ScratchFolder folder;
    const zip_test::CurrentFolder current(folder.Path());
    const std::string stem = "f\xC3\xA4rg \xE4\xB8\xAD";
    ASSERT_TRUE(save_document(document_of(1), stem + ".vrlz"));
    EXPECT_EQ(zip_test::Run("LC_ALL=C.UTF-8 unzip -o '" + stem + ".vrlz' -d by_unzip"), 0);
    EXPECT_TRUE(std::filesystem::exists("by_unzip/" + stem + ".vrl"));
    EXPECT_EQ(zip_test::Run("LC_ALL=C.UTF-8 7z x -oby_7z '" + stem + ".vrlz'"), 0);
    EXPECT_TRUE(std::filesystem::exists("by_7z/" + stem + ".vrl"));
}

}  // namespace
