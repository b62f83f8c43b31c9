#include "zip/path_component.h"

#include <gtest/gtest.h>

namespace {

struct Parts {
    const char* why;
    std::string path;
    char separator;
    const char* prefix;
    const char* drive;
    const char* directory;
    const char* title;
    const char* extension;
};
void PrintTo(const Parts& c, std::ostream* os) { *os << c.why << ": " << c.path; }

class PathParts : public testing::TestWithParam<Parts> {};

TEST_P(PathParts, AreTheseParts) {
    const CZipPathComponent path(GetParam().path, GetParam().separator);
    EXPECT_EQ(path.GetFilePrefix(), GetParam().prefix);
    EXPECT_EQ(path.GetFileDrive(), GetParam().drive);
    EXPECT_EQ(path.GetFileDirectory(), GetParam().directory);
    EXPECT_EQ(path.GetFileTitle(), GetParam().title);
    EXPECT_EQ(path.GetFileExtension(), GetParam().extension);
}

INSTANTIATE_TEST_SUITE_P(
    WithBackslashes, PathParts,
    testing::Values(
        Parts{"a network path", R"(\\server\share\a.zip)", '\\', R"(\\)", "", R"(server\share)", "a", "zip"},
        Parts{"a long path", R"(\\?\C:\dir\a.zip)", '\\', R"(\\?\)", "C:", "dir", "a", "zip"},
        Parts{"a long network path", R"(\\?\UNC\server\a.zip)", '\\', R"(\\?\UNC\)", "", "server", "a",
              "zip"},
        Parts{"a prefix in small letters", R"(\\?\unc\s\a.zip)", '\\', R"(\\?\unc\)", "", "s", "a", "zip"},
        Parts{"three matching characters are no prefix", R"(\\?x\a)", '\\', "", "", R"(?x)", "a", ""},
        Parts{"five matching characters are no prefix", R"(\\?\usr\a)", '\\', "", "", R"(?\usr)", "a", ""},
        Parts{"one backslash is no prefix", R"(\dir\a.zip)", '\\', "", "", "dir", "a", "zip"},
        Parts{"a drive", R"(C:\data\a.vrlz)", '\\', "", "C:", "data", "a", "vrlz"},
        Parts{"a drive and a name", "C:a.zip", '\\', "", "C:", "", "a", "zip"},
        Parts{"a name alone", "a.zip", '\\', "", "", "", "a", "zip"},
        Parts{"the last dot counts", "a.b.c", '\\', "", "", "", "a.b", "c"},
        Parts{"a dot in the directory is no extension", R"(d.x\a)", '\\', "", "", "d.x", "a", ""},
        Parts{"a name that begins with a dot is all extension", ".profile", '\\', "", "", "", "", "profile"},
        Parts{"slashes part as well", "dir/sub/a.zip", '\\', "", "", "dir/sub/", "a", "zip"},
        Parts{"a directory alone", R"(dir\)", '\\', "", "", "dir", "", ""},
        Parts{"nothing", "", '\\', "", "", "", "", ""}));

INSTANTIATE_TEST_SUITE_P(
    WithSlashes, PathParts,
    testing::Values(
        Parts{"an absolute path", "/tmp/x/a.zip", '/', "/", "", "tmp/x", "a", "zip"},
        Parts{"a relative path", "x/a.zip", '/', "", "", "x", "a", "zip"},
        Parts{"a file of the root", "/a.zip", '/', "/", "", "", "a", "zip"},
        Parts{"a name alone", "a.zip", '/', "", "", "", "a", "zip"},
        Parts{"no drives", "C:a.zip", '/', "", "", "", "C:a", "zip"},
        Parts{"a backslash is a character", R"(x\a.zip)", '/', "", "", "", R"(x\a)", "zip"},
        Parts{"parts of any length", "/" + std::string(300, 'd') + "/a", '/', "/", "",
              "dddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddd"
              "dddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddd"
              "dddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddddd"
              "dddddddddddddddddddddddddddddddddddd",
              "a", ""}));

struct Limit {
    const char* why;
    std::string path;
    bool fits;
};
void PrintTo(const Limit& c, std::ostream* os) { *os << c.why; }

class PathLimits : public testing::TestWithParam<Limit> {};

TEST_P(PathLimits, EmptyEveryPartOfAPathThatHasOneTooLong) {
    const CZipPathComponent path(GetParam().path);
    EXPECT_EQ(!path.GetFullPath().empty(), GetParam().fits);
    EXPECT_EQ(path.GetFileDrive().empty(), !GetParam().fits);
}

INSTANTIATE_TEST_SUITE_P(
    OfTheDefinedForm, PathLimits,
    testing::Values(Limit{"a title of 255", "C:" + std::string(255, 't') + ".e", true},
                    Limit{"a title of 256", "C:" + std::string(256, 't') + ".e", false},
                    Limit{"an extension of 254 and its dot", "C:t." + std::string(254, 'e'), true},
                    Limit{"an extension of 255 and its dot", "C:t." + std::string(255, 'e'), false},
                    Limit{"a directory of 254 and a backslash", "C:" + std::string(254, 'd') + "\\t", true},
                    Limit{"a directory of 255 and a backslash", "C:" + std::string(255, 'd') + "\\t",
                          false}));

TEST(PathComponent, JoinsPartsWithBackslashesBetweenThoseThatAreNotEmpty) {
    const CZipPathComponent path(R"(C:\dir\sub\a.zip)");
    EXPECT_EQ(path.GetFileName(), "a.zip");
    EXPECT_EQ(path.GetNoDrive(), R"(dir\sub\a.zip)");
    EXPECT_EQ(path.GetFilePath(), R"(C:\dir\sub)");
    EXPECT_EQ(path.GetFullPath(), R"(C:\dir\sub\a.zip)");
    EXPECT_EQ(CZipPathComponent("C:a").GetFullPath(), R"(C:\a)");
    EXPECT_EQ(CZipPathComponent("a").GetFullPath(), "a");
    EXPECT_EQ(CZipPathComponent("a").GetNoDrive(), "a");
    EXPECT_EQ(CZipPathComponent(R"(\\server\share\a.zip)").GetFullPath(), R"(\\server\share\a.zip)");
    EXPECT_EQ(CZipPathComponent("/tmp/a.zip", '/').GetFullPath(), "/tmp/a.zip");
    EXPECT_EQ(CZipPathComponent("/tmp/a.zip", '/').GetNoDrive(), "tmp/a.zip");
}

TEST(PathComponent, HasNoDotWithoutAnExtension) {
    CZipPathComponent path("a.zip");
    path.SetFileExtension("");
    EXPECT_EQ(path.GetFileName(), "a");
    path.SetFileExtension("z01");
    EXPECT_EQ(path.GetFileName(), "a.z01");
}

}  // namespace
