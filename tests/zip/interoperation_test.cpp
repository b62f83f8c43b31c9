// Archives of other programs, and other programs on ours: unzip, 7z, zip, Python.

#include <gtest/gtest.h>

#include "support.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::ScratchFolder;

constexpr char k_password[] = "barn red";

struct Way {
    const char* name;
    std::uint16_t method;
    int level;
    int encryption;  ///< -1 none
};
void PrintTo(const Way& c, std::ostream* os) { *os << c.name; }

class Interoperation : public testing::Test {
protected:
    ScratchFolder folder;
    const Bytes text = zip_test::SampleText(150000);
    const Bytes noise = zip_test::Noise(150000);

    void SetUp() override { Prepare(); }
    void Prepare() {
        folder.Write("in/text.xml", text);
        folder.Write("in/noise.bin", noise);
        folder.Write("in/empty", "");
        folder.Write("in/sub/small", "abc");
    }
    std::string In(const std::string& command) const {
        return "cd '" + folder.Path().string() + "' && " + command;
    }
    int RunIn(const std::string& command) const { return zip_test::Run(In(command)); }

    // Everything under "in", with the engine.
    void Write(const std::string& name, int mode, int volumeSize, const Way& way) {
        CZipArchive archive;
        archive.Open((folder / name).c_str(), mode, volumeSize);
        archive.SetCompressionMethod(way.method);
        if (way.encryption >= 0) {
            archive.SetPassword(k_password);
            archive.SetEncryptionMethod(static_cast<std::uint8_t>(way.encryption));
        }
        archive.SetRootPath(folder / "in");
        for (const char* file : {"text.xml", "noise.bin", "empty", "sub", "sub/small"})
            EXPECT_TRUE(archive.AddFile((folder / ("in/" + std::string(file))).c_str(), way.level));
        archive.Close();
    }
    void ExpectUnpacked(const std::string& place) {
        EXPECT_TRUE(folder.Read(place + "/text.xml") == text);
        EXPECT_TRUE(folder.Read(place + "/noise.bin") == noise);
        EXPECT_EQ(folder.Read(place + "/empty"), "");
        EXPECT_EQ(folder.Read(place + "/sub/small"), "abc");
    }
    // Everything of an archive of another program, with the engine and every check on.
    void ExpectReadable(const std::string& name, bool enciphered = false) {
        CZipArchive archive;
        archive.Open((folder / name).c_str(), CZipStorage::openReadOnly);
        if (enciphered) archive.SetPassword(k_password);
        archive.GetCentralDir().SetIgnoredChecks(0);
        const std::pair<const char*, Bytes> expected[] = {
            {"text.xml", text}, {"noise.bin", noise}, {"empty", ""}, {"sub\\small", "abc"}};
        for (const auto& [file, contents] : expected) {
            const std::uint16_t index = archive.FindEntry(file);
            ASSERT_NE(index, CZipArchive::k_noIndex) << file;
            EXPECT_FALSE(archive.GetEntryHeader(index)->IsDirectory());
            ASSERT_TRUE(archive.OpenEntry(index)) << file;
            Bytes bytes(contents.size() + 1, '\0');
            bytes.resize(archive.ReadEntry(bytes.data(), static_cast<std::uint32_t>(bytes.size())));
            if (!contents.empty()) {
                char more = 0;
                EXPECT_EQ(archive.ReadEntry(&more, 1), 0U);
            }
            EXPECT_TRUE(bytes == contents) << file;
            EXPECT_EQ(archive.CloseEntry(), 1) << file;
        }
    }
};

class OurArchive : public Interoperation, public testing::WithParamInterface<Way> {
protected:
    void SetUp() override {
        Prepare();
        Write("a.zip", CZipStorage::create, 0, GetParam());
    }
    bool IsAes() const { return GetParam().encryption > 0; }
};

TEST_P(OurArchive, IsTestedAndUnpackedBy7z) {
    EXPECT_EQ(RunIn("7z t -p'barn red' a.zip"), 0);
    EXPECT_EQ(RunIn("7z x -p'barn red' -oout a.zip"), 0);
    ExpectUnpacked("out");
}

TEST_P(OurArchive, IsTestedAndUnpackedByUnzip) {
    // It knows no AES and says so.
    EXPECT_EQ(RunIn("unzip -t -P 'barn red' a.zip"), IsAes() ? 81 : 0);
    if (IsAes()) return;
    EXPECT_EQ(RunIn("unzip -P 'barn red' -d out a.zip"), 0);
    ExpectUnpacked("out");
}

TEST_P(OurArchive, IsTestedAndUnpackedByPython) {
    const std::string script =
        "import sys, zipfile\n"
        "z = zipfile.ZipFile('a.zip')\n"
        "z.setpassword(b'barn red')\n"
        "assert z.testzip() is None\n"
        "assert z.getinfo('sub/').is_dir()\n"
        "z.extractall('out')\n";
    folder.Write("check.py", script);
    // It knows no AES either.
    EXPECT_EQ(RunIn("python3 check.py"), IsAes() ? 1 : 0);
    if (!IsAes()) ExpectUnpacked("out");
}

INSTANTIATE_TEST_SUITE_P(Ways, OurArchive,
                         testing::Values(Way{"Stored", 8, 0, -1}, Way{"Deflated", 8, -1, -1},
                                         Way{"DeflatedBest", 8, 9, -1}, Way{"Bzip2", 12, -1, -1},
                                         Way{"Traditional", 8, -1, 0}, Way{"TraditionalBzip2", 12, 9, 0},
                                         Way{"Aes128", 8, -1, 1}, Way{"Aes192", 8, -1, 2},
                                         Way{"Aes256", 8, -1, 3}, Way{"Aes256Stored", 8, 0, 3}),
                         [](const auto& row) { return std::string(row.param.name); });

class OurSegmentedArchive : public OurArchive {
protected:
    void SetUp() override {
        Prepare();
        Write("a.zip", CZipStorage::createSegmented, 40000, GetParam());
    }
};

TEST_P(OurSegmentedArchive, IsUnpackedBy7z) {
    ASSERT_TRUE(std::filesystem::exists(folder / "a.z02"));
    EXPECT_EQ(RunIn("7z x -p'barn red' -oout a.zip"), 0);
    ExpectUnpacked("out");
}

TEST_P(OurSegmentedArchive, IsJoinedByZip) {
    // Joining takes the entries as they are; it is unzip that knows no AES.
    EXPECT_EQ(RunIn("zip -s 0 a.zip --out whole.zip"), 0);
    EXPECT_EQ(RunIn("unzip -t -P 'barn red' whole.zip"), IsAes() ? 81 : 0);
    ExpectReadable("whole.zip", GetParam().encryption >= 0);
}

TEST_P(OurSegmentedArchive, IsRead) { ExpectReadable("a.zip", GetParam().encryption >= 0); }

INSTANTIATE_TEST_SUITE_P(Ways, OurSegmentedArchive,
                         testing::Values(Way{"Stored", 8, 0, -1}, Way{"Deflated", 8, -1, -1},
                                         Way{"Bzip2", 12, -1, -1}, Way{"Traditional", 8, -1, 0},
                                         Way{"Aes256", 8, -1, 3}),
                         [](const auto& row) { return std::string(row.param.name); });

TEST_F(Interoperation, OursBehindAStubIsUnpackedByOthers) {
    folder.Write("a.zip", "#!/bin/sh\nexit 0\n" + Bytes(5000, '#'));
    Write("a.zip", CZipStorage::createAppend, 0, {"", 8, -1, -1});
    // unzip warns of the extra bytes, and goes on.
    EXPECT_LE(RunIn("unzip -d out a.zip"), 1);
    ExpectUnpacked("out");
    ExpectReadable("a.zip");
}

TEST_F(Interoperation, OursMadeByAddingAndReplacingIsTestedByOthers) {
    Write("a.zip", CZipStorage::create, 0, {"", 8, -1, -1});
    CZipArchive archive;
    archive.Open((folder / "a.zip").c_str(), CZipStorage::openExisting);
    CZipNewFile file;
    file.path = folder.Write("other", zip_test::Noise(5000));
    file.replacedIndex = 0;
    ASSERT_TRUE(archive.AddFile(file));
    ASSERT_TRUE(archive.AddFile((folder / "other").c_str()));
    archive.Close();
    EXPECT_EQ(RunIn("unzip -t a.zip"), 0);
    EXPECT_EQ(RunIn("7z t a.zip"), 0);
}

TEST_F(Interoperation, NamesThatAreNotAsciiAreReadByOthers) {
    folder.Write("in/M\xC3\xBCnze", "x");
    CZipArchive archive;
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.AddFile((folder / "in/M\xC3\xBCnze").c_str()));
    archive.Close();
    // The made-by system is DOS: others take the name for code page 437, as it is.
    EXPECT_EQ(
        RunIn("python3 -c \"import zipfile; assert zipfile.ZipFile('a.zip').namelist() == ['M\\u00fcnze']\""),
        0);
}

struct Writer {
    const char* name;
    const char* command;
    bool enciphered;
};
void PrintTo(const Writer& c, std::ostream* os) { *os << c.name; }

class ForeignArchive : public Interoperation, public testing::WithParamInterface<Writer> {};

TEST_P(ForeignArchive, IsRead) {
    ASSERT_EQ(RunIn("cd in && " + std::string(GetParam().command)), 0);
    ExpectReadable("a.zip", GetParam().enciphered);
}

INSTANTIATE_TEST_SUITE_P(
    Programs, ForeignArchive,
    testing::Values(
        Writer{"Zip", "zip -r ../a.zip .", false}, Writer{"ZipBest", "zip -9 -r ../a.zip .", false},
        Writer{"ZipStored", "zip -0 -r ../a.zip .", false},
        Writer{"ZipBzip2", "zip -Z bzip2 -r ../a.zip .", false},
        Writer{"ZipWithoutExtraFields", "zip -X -r ../a.zip .", false},
        // As a stream: sizes stand in data descriptors.
        Writer{"ZipStreamed", "zip -r - . | cat > ../a.zip", false},
        Writer{"ZipTraditional", "zip -P 'barn red' -r ../a.zip .", true},
        Writer{"ZipWithAComment", "zip -r ../a.zip . && echo 'a comment' | zip -z ../a.zip", false},
        Writer{"ZipSelfExtracting",
               "zip -r ../b.zip . && head -c 3000 /dev/urandom | cat - ../b.zip > ../a.zip", false},
        Writer{"ZipSplit", "zip -r -s 64k ../a.zip . && test -e ../a.z02", false},
        Writer{"ZipSplitTraditional", "zip -P 'barn red' -r -s 64k ../a.zip . && test -e ../a.z02", true},
        Writer{"ZipSplitBzip2", "zip -Z bzip2 -r -s 64k ../a.zip .", false},
        Writer{"SevenZip", "7z a -tzip ../a.zip .", false},
        Writer{"SevenZipStored", "7z a -tzip -mm=Copy ../a.zip .", false},
        Writer{"SevenZipBzip2", "7z a -tzip -mm=BZip2 ../a.zip .", false},
        Writer{"SevenZipTraditional", "7z a -tzip -p'barn red' -mem=ZipCrypto ../a.zip .", true},
        Writer{"SevenZipAes128", "7z a -tzip -p'barn red' -mem=AES128 ../a.zip .", true},
        Writer{"SevenZipAes192", "7z a -tzip -p'barn red' -mem=AES192 ../a.zip .", true},
        Writer{"SevenZipAes256", "7z a -tzip -p'barn red' -mem=AES256 ../a.zip .", true},
        Writer{"SevenZipAes256Bzip2", "7z a -tzip -p'barn red' -mem=AES256 -mm=BZip2 ../a.zip .", true},
        Writer{"SevenZipAes256Stored", "7z a -tzip -p'barn red' -mem=AES256 -mm=Copy ../a.zip .", true},
        Writer{"Python",
               "python3 -m zipfile -c ../a.zip text.xml noise.bin empty sub/ && "
               "python3 -c \"import zipfile; z = zipfile.ZipFile('../a.zip', 'w', zipfile.ZIP_DEFLATED); "
               "[z.write(n) for n in ('text.xml', 'noise.bin', 'empty', 'sub', 'sub/small')]; z.close()\"",
               false},
        Writer{"PythonStored",
               "python3 -c \"import zipfile; z = zipfile.ZipFile('../a.zip', 'w'); "
               "[z.write(n) for n in ('text.xml', 'noise.bin', 'empty', 'sub', 'sub/small')]; z.close()\"",
               false},
        Writer{"PythonBzip2",
               "python3 -c \"import zipfile; z = zipfile.ZipFile('../a.zip', 'w', zipfile.ZIP_BZIP2); "
               "[z.write(n) for n in ('text.xml', 'noise.bin', 'empty', 'sub', 'sub/small')]; z.close()\"",
               false},
        Writer{"PythonToAPipe",
               "python3 -c \"import sys, zipfile; z = zipfile.ZipFile(sys.stdout.buffer, 'w', "
               "zipfile.ZIP_DEFLATED); "
               "[z.write(n) for n in ('text.xml', 'noise.bin', 'empty', 'sub', 'sub/small')]; z.close()\" | "
               "cat > ../a.zip",
               false}),
    [](const auto& row) { return std::string(row.param.name); });

TEST_F(Interoperation, ZipsplitPartsAreArchivesOfTheirOwn) {
    ASSERT_EQ(
        RunIn("cd in && zip -X -r ../a.zip . && cd .. && mkdir parts && zipsplit -n 170000 -b parts a.zip"),
        0);
    unsigned entries = 0;
    for (const auto& part : std::filesystem::directory_iterator(folder / "parts")) {
        CZipArchive archive;
        archive.Open(part.path().c_str(), CZipStorage::openReadOnly);
        for (std::uint16_t i = 0; i < archive.GetCount(); ++i) {
            ASSERT_TRUE(archive.OpenEntry(i));
            Bytes bytes(200000, '\0');
            bytes.resize(archive.ReadEntry(bytes.data(), 200000));
            EXPECT_EQ(archive.CloseEntry(), 1);
            const bool isNoise = archive.GetEntryHeader(i)->GetFileName() == "noise.bin";
            EXPECT_TRUE(!isNoise || bytes == noise);
            ++entries;
        }
    }
    EXPECT_EQ(entries, 5U);
}

TEST_F(Interoperation, AZip64ArchiveOfPythonIsRefusedWithCode120) {
    // A count of 65535 and more makes it write a ZIP64 record.
    folder.Write("make.py",
                 "import zipfile\n"
                 "z = zipfile.ZipFile('a.zip', 'w')\n"
                 "for i in range(65536): z.writestr(str(i), b'')\n"
                 "z.close()\n");
    ASSERT_EQ(RunIn("python3 make.py"), 0);
    CZipArchive archive;
    EXPECT_EQ(zip_test::CodeOf([&] { archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly); }),
              120);
    archive.Close(1);
}

TEST_F(Interoperation, AForeignArchiveTakesOurEntriesAndStaysReadableToItsProgram) {
    ASSERT_EQ(RunIn("cd in && zip -r ../a.zip ."), 0);
    CZipArchive archive;
    archive.Open((folder / "a.zip").c_str(), CZipStorage::openExisting);
    EXPECT_EQ(archive.GetSystemCompatibility(), 3);
    ASSERT_TRUE(archive.AddFile(folder.Write("more", "more text").c_str()));
    archive.Close();
    EXPECT_EQ(RunIn("zip -T a.zip"), 0);
    EXPECT_EQ(RunIn("unzip -d out a.zip"), 0);
    ExpectUnpacked("out");
    EXPECT_EQ(folder.Read("out/more"), "more text");
}

}  // namespace
