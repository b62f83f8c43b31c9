#include "zip/file.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "support.h"

namespace {

using zip_test::Bytes;
using zip_test::Call;
using zip_test::CodeOf;
using zip_test::FaultyFiles;
using zip_test::ScratchFolder;

class File : public testing::Test {
protected:
    ScratchFolder folder;
    FaultyFiles files;
    CZipFile file{files};

    Bytes ReadAll() {
        file.SeekToBegin();
        Bytes bytes(file.GetLength(), '\0');
        bytes.resize(file.Read(bytes.data(), static_cast<std::uint32_t>(bytes.size())));
        return bytes;
    }
};

TEST(FileFlags, AreTheNumbersOfTheirUses) {
    EXPECT_EQ(CZipFile::createNew, 39U);
    EXPECT_EQ(CZipFile::openExisting, 71U);
    EXPECT_EQ(CZipFile::openReadOnly, 69U);
    EXPECT_EQ(CZipFile::openSource, 17U);
    EXPECT_EQ(CZipFile::openMeasured, 5U);
}

TEST_F(File, CreateNewMakesReadsAndWrites) {
    EXPECT_TRUE(file.IsClosed());
    EXPECT_TRUE(file.Open(folder / "a", CZipFile::createNew, true));
    EXPECT_FALSE(file.IsClosed());
    EXPECT_EQ(file.GetFilePath(), folder / "a");
    file.Write("abc", 3);
    EXPECT_EQ(ReadAll(), "abc");
    file.Close();
    EXPECT_EQ(folder.Read("a"), "abc");
    EXPECT_EQ(file.GetFilePath(), "");
}

TEST_F(File, CreateNewTruncates) {
    folder.Write("a", "old contents");
    file.Open(folder / "a", CZipFile::createNew, true);
    EXPECT_EQ(file.GetLength(), 0U);
}

TEST_F(File, OpenExistingKeepsTheContentsAndDoesNotCreate) {
    folder.Write("a", "old");
    EXPECT_TRUE(file.Open(folder / "a", CZipFile::openExisting, true));
    EXPECT_EQ(ReadAll(), "old");
    file.SeekToEnd();
    file.Write("er", 2);
    EXPECT_EQ(ReadAll(), "older");
    EXPECT_FALSE(file.Open(folder / "none", CZipFile::openExisting, false));
}

TEST_F(File, ReadOnlyRefusesToWrite) {
    folder.Write("a", "abc");
    file.Open(folder / "a", CZipFile::openReadOnly, true);
    EXPECT_EQ(ReadAll(), "abc");
    EXPECT_EQ(CodeOf([&] { file.Write("x", 1); }), EBADF);
}

TEST_F(File, TheWriteBitAloneWritesOnlyAndTruncates) {
    folder.Write("a", "abc");
    file.Open(folder / "a", CZipAbstractFile::modeWrite, true);
    file.Write("x", 1);
    char byte = 0;
    EXPECT_EQ(CodeOf([&] { file.Read(&byte, 1); }), EBADF);
    file.Close();
    EXPECT_EQ(folder.Read("a"), "x");
}

TEST_F(File, AMissingFileGivesFalseOrItsErrnoWithThePath) {
    EXPECT_FALSE(file.Open(folder / "none", CZipFile::openReadOnly, false));
    try {
        file.Open(folder / "none", CZipFile::openReadOnly, true);
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetCode(), ENOENT);
        EXPECT_EQ(exception.GetPath(), folder / "none");
    }
    EXPECT_TRUE(file.IsClosed());
}

TEST_F(File, AFolderIsRefused) {
    EXPECT_EQ(CodeOf([&] { file.Open(folder.Path().string(), CZipFile::openReadOnly, true); }), EISDIR);
    EXPECT_EQ(CodeOf([&] { file.Open(folder.Path().string(), CZipFile::openExisting, true); }), EISDIR);
}

TEST_F(File, ANamedPipeDoesNotBlock) {
    ASSERT_EQ(zip_test::Run("mkfifo '" + folder / "pipe" + "'"), 0);
    EXPECT_TRUE(file.Open(folder / "pipe", CZipFile::openReadOnly, true));
    EXPECT_EQ(CodeOf([&] { file.GetLength(); }), ESPIPE);
}

TEST_F(File, OpeningClosesWhatIsOpen) {
    folder.Write("a", "a");
    folder.Write("b", "b");
    file.Open(folder / "a", CZipFile::openReadOnly, true);
    file.Open(folder / "b", CZipFile::openReadOnly, true);
    EXPECT_EQ(files.OpenCount(), 1U);
    EXPECT_EQ(ReadAll(), "b");
}

TEST_F(File, TheDestructorCloses) {
    folder.Write("a", "a");
    { CZipFile(files).Open(folder / "a", CZipFile::openReadOnly, true); }
    EXPECT_EQ(files.OpenCount(), 0U);
}

TEST_F(File, CloseOnAClosedFileDoesNothing) { EXPECT_NO_THROW(file.Close()); }

TEST_F(File, AShortReadAtTheEndIsNoFailure) {
    folder.Write("a", "abc");
    file.Open(folder / "a", CZipFile::openReadOnly, true);
    char buffer[10];
    EXPECT_EQ(file.Read(buffer, sizeof buffer), 3U);
    EXPECT_EQ(file.Read(buffer, sizeof buffer), 0U);
}

TEST_F(File, SetLengthGrowsAndTruncates) {
    file.Open(folder / "a", CZipFile::createNew, true);
    file.Write("abc", 3);
    file.SetLength(1);
    EXPECT_EQ(file.GetLength(), 1U);
    file.SetLength(5);
    EXPECT_EQ(ReadAll(), Bytes("a\0\0\0\0", 5));
}

TEST_F(File, SeeksFromAllThreeOriginsAndRefusesToGoBeforeTheBegin) {
    folder.Write("a", "abcdef");
    file.Open(folder / "a", CZipFile::openReadOnly, true);
    EXPECT_EQ(file.Seek(4, CZipAbstractFile::begin), 4U);
    EXPECT_EQ(file.Seek(-1, CZipAbstractFile::current), 3U);
    EXPECT_EQ(file.GetPosition(), 3U);
    EXPECT_EQ(file.Seek(-2, CZipAbstractFile::end), 4U);
    EXPECT_EQ(file.GetLength(), 6U);
    EXPECT_EQ(file.GetPosition(), 4U);
    EXPECT_EQ(CodeOf([&] { file.Seek(-7, CZipAbstractFile::end); }), EINVAL);
}

TEST_F(File, WhatDoesNotFit32BitsIsRefused) {
    file.Open(folder / "a", CZipFile::createNew, true);
    EXPECT_EQ(CodeOf([&] { file.SetLength(0x100000000); }), EFBIG);
    EXPECT_EQ(CodeOf([&] { file.Seek(0x100000000, CZipAbstractFile::begin); }), EFBIG);
    std::filesystem::resize_file(folder / "a", 0x100000000);
    EXPECT_EQ(CodeOf([&] { file.Seek(0, CZipAbstractFile::begin), file.GetLength(); }), EFBIG);
    std::filesystem::resize_file(folder / "a", 0xFFFFFFFF);
    file.Seek(0, CZipAbstractFile::begin);
    EXPECT_EQ(file.GetLength(), 0xFFFFFFFFU);
}

struct FailingCall {
    const char* name;
    Call call;
    std::function<void(CZipFile&)> action;
};
void PrintTo(const FailingCall& c, std::ostream* os) { *os << c.name; }

class FileFailure : public testing::TestWithParam<FailingCall> {};

TEST_P(FileFailure, RaisesTheErrnoWithThePath) {
    const ScratchFolder folder;
    FaultyFiles files;
    CZipFile file(files);
    file.Open(folder / "a", CZipFile::createNew, true);
    file.Write("abc", 3);
    files.FailAt(0, EIO, {GetParam().call});
    try {
        GetParam().action(file);
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetCode(), EIO);
        EXPECT_EQ(exception.GetPath(), folder / "a");
    }
}

char k_someByte;

INSTANTIATE_TEST_SUITE_P(
    EveryOperation, FileFailure,
    testing::Values(
        FailingCall{"Close", Call::close, [](CZipFile& file) { file.Close(); }},
        FailingCall{"Flush", Call::commit, [](CZipFile& file) { file.Flush(); }},
        FailingCall{"GetPosition", Call::seek, [](CZipFile& file) { static_cast<void>(file.GetPosition()); }},
        FailingCall{"Seek", Call::seek, [](CZipFile& file) { file.Seek(0, CZipAbstractFile::begin); }},
        FailingCall{"SeekToBegin", Call::seek, [](CZipFile& file) { file.SeekToBegin(); }},
        FailingCall{"SeekToEnd", Call::seek, [](CZipFile& file) { file.SeekToEnd(); }},
        FailingCall{"GetLength", Call::seek, [](CZipFile& file) { static_cast<void>(file.GetLength()); }},
        FailingCall{"SetLength", Call::resize, [](CZipFile& file) { file.SetLength(1); }},
        FailingCall{"Read", Call::read, [](CZipFile& file) { file.Read(&k_someByte, 1); }},
        FailingCall{"Write", Call::write, [](CZipFile& file) { file.Write("x", 1); }}),
    [](const auto& row) { return std::string(row.param.name); });

TEST_F(File, AShortWriteWithoutAnErrnoIsAFullDisk) {
    file.Open(folder / "a", CZipFile::createNew, true);
    files.FallShortAt(0, {Call::write});
    EXPECT_EQ(CodeOf([&] { file.Write("abcd", 4); }), ENOSPC);
}

TEST_F(File, IsClosedAfterAFailedClose) {
    file.Open(folder / "a", CZipFile::createNew, true);
    files.FailAt(0, EIO, {Call::close});
    EXPECT_EQ(CodeOf([&] { file.Close(); }), EIO);
    EXPECT_TRUE(file.IsClosed());
    EXPECT_EQ(files.OpenCount(), 0U);
}

struct Sharing {
    const char* name;
    unsigned first;
    unsigned second;
    bool together;
};
void PrintTo(const Sharing& c, std::ostream* os) { *os << c.name; }

class FileSharing : public testing::TestWithParam<Sharing> {};

TEST_P(FileSharing, HoldsBetweenOpenings) {
    const ScratchFolder folder;
    const std::string path = folder.Write("a", "abc");
    CZipFile first;
    CZipFile second;
    ASSERT_TRUE(first.Open(path, GetParam().first, true));
    EXPECT_EQ(CodeOf([&] { second.Open(path, GetParam().second, true); }), GetParam().together ? 0 : EACCES);
    // A refused opening has not emptied the file.
    EXPECT_EQ(first.GetLength(), 3U);
}

INSTANTIATE_TEST_SUITE_P(
    ShareModes, FileSharing,
    testing::Values(Sharing{"TwoReaders", 69, 69, true}, Sharing{"ReaderAndWriter", 69, 71, false},
                    Sharing{"WriterAndMeasurer", 71, 5, false}, Sharing{"WriterAndSource", 71, 17, true},
                    Sharing{"WriterAndCreator", 71, 39, false}, Sharing{"ReaderAndCreator", 69, 39, false},
                    Sharing{"DenyAllAndReader", 65, 69, false}, Sharing{"DenyReadAndReader", 73, 69, false},
                    Sharing{"DenyNoneAndDenyAll", 17, 65, true}),
    [](const auto& row) { return std::string(row.param.name); });

}  // namespace
