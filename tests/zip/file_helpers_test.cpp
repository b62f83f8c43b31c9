#include "zip/file_helpers.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "support.h"

namespace {

using zip_test::CodeOf;
using zip_test::ScratchFolder;
using zip_test::World;

class FileHelpers : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    const CZipEnvironment& environment = world.environment;
};

TEST_F(FileHelpers, FileTimeIsTheModificationTime) {
    const std::string path = folder.Write("a", "");
    ASSERT_TRUE(ZipArchiveLib::SetFileTime(environment, path, 1234567890));
    EXPECT_EQ(ZipArchiveLib::GetFileTime(environment, path).time, 1234567890);
    EXPECT_TRUE(ZipArchiveLib::GetFileTime(environment, path).valid);
}

TEST_F(FileHelpers, FileTimeThatIsInvalidIsThePresent) {
    EXPECT_EQ(ZipArchiveLib::GetFileTime(environment, folder / "none").time, world.clock.time);
    EXPECT_FALSE(ZipArchiveLib::GetFileTime(environment, folder / "none").valid);
}

TEST_F(FileHelpers, TheTimeMinusOneMeansNow) {
    const std::string path = folder.Write("a", "");
    ASSERT_TRUE(ZipArchiveLib::SetFileTime(environment, path, -1));
    EXPECT_EQ(ZipArchiveLib::GetFileTime(environment, path).time, world.clock.time);
}

TEST_F(FileHelpers, FileSizeIsMeasured) {
    EXPECT_EQ(ZipArchiveLib::GetFileSize(environment, folder.Write("a", "abc")), 3U);
    EXPECT_FALSE(ZipArchiveLib::GetFileSize(environment, folder / "none"));
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(FileHelpers, FileSizeAbove32BitsCannotBeTold) {
    std::filesystem::resize_file(folder.Write("a", ""), 0x100000000);
    EXPECT_FALSE(ZipArchiveLib::GetFileSize(environment, folder / "a"));
    std::filesystem::resize_file(folder / "a", 0xFFFFFFFF);
    EXPECT_EQ(ZipArchiveLib::GetFileSize(environment, folder / "a"), 0xFFFFFFFFU);
}

TEST_F(FileHelpers, ExistsTellsFoldersFromFiles) {
    EXPECT_EQ(ZipArchiveLib::FileExists(environment, folder.Path().string()), -1);
    EXPECT_EQ(ZipArchiveLib::FileExists(environment, folder.Write("a", "")), 1);
    EXPECT_EQ(ZipArchiveLib::FileExists(environment, folder / "none"), 0);
}

TEST_F(FileHelpers, ADirectoryIsWhatCanBeEntered) {
    EXPECT_TRUE(ZipArchiveLib::IsDirectory(environment, folder.Path().string()));
    EXPECT_FALSE(ZipArchiveLib::IsDirectory(environment, folder.Write("a", "")));
    EXPECT_FALSE(ZipArchiveLib::IsDirectory(environment, folder / "none"));
}

TEST_F(FileHelpers, DeletingRaises115OnRequest) {
    folder.Write("a", "");
    EXPECT_TRUE(ZipArchiveLib::RemoveFile(environment, folder / "a", true));
    EXPECT_FALSE(ZipArchiveLib::RemoveFile(environment, folder / "a", false));
    EXPECT_EQ(CodeOf([&] { ZipArchiveLib::RemoveFile(environment, folder / "a", true); }), 115);
}

TEST_F(FileHelpers, RenamingRaises116OnRequest) {
    folder.Write("a", "");
    EXPECT_TRUE(ZipArchiveLib::RenameFile(environment, folder / "a", folder / "b", true));
    EXPECT_FALSE(ZipArchiveLib::RenameFile(environment, folder / "a", folder / "c", false));
    EXPECT_EQ(CodeOf([&] { ZipArchiveLib::RenameFile(environment, folder / "a", folder / "c", true); }), 116);
}

TEST_F(FileHelpers, FreeSpaceIsCutAt32BitsAndZeroWhenUnknown) {
    world.volumes.space = 0x100000000;
    EXPECT_EQ(ZipArchiveLib::GetFreeSpace(environment, folder.Path().string()), 0xFFFFFFFFU);
    world.volumes.space = 17;
    EXPECT_EQ(ZipArchiveLib::GetFreeSpace(environment, folder.Path().string()), 17U);
    world.volumes.space.reset();
    EXPECT_EQ(ZipArchiveLib::GetFreeSpace(environment, "/no/such/folder"), 0U);
}

TEST_F(FileHelpers, TemporaryFilesGoToTheWantedFolderWhenItHasRoom) {
    const auto path = ZipArchiveLib::MakeTemporaryFile(environment, folder.Path().string(), 10);
    ASSERT_TRUE(path);
    EXPECT_EQ(path->rfind(folder / "ZAR", 0), 0U);
}

TEST_F(FileHelpers, TemporaryFilesFallBackToTheSystemsFolder) {
    world.names.temporaryFolder = folder.Path().string();
    const auto path = ZipArchiveLib::MakeTemporaryFile(environment, "/no/such/folder", 10);
    ASSERT_TRUE(path);
    EXPECT_EQ(path->rfind(folder / "ZAR", 0), 0U);
}

TEST_F(FileHelpers, WithoutEnoughRoomThereIsNoTemporaryFile) {
    world.volumes.space = 9;
    EXPECT_FALSE(ZipArchiveLib::MakeTemporaryFile(environment, folder.Path().string(), 10));
    EXPECT_TRUE(folder.Names().empty());
}

}  // namespace
