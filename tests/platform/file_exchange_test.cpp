#include "platform/file_exchange.h"

#include <grp.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <fstream>
#include <iterator>
#include <set>

#include "tests/temporary_folder.h"

namespace {

namespace fs = std::filesystem;

using vrl_platform::native_file_descriptors;
using vrl_platform::native_file_exchange;
using vrl_platform::replacement;

class FileExchange : public testing::Test {
protected:
    const vrl_test::temporary_folder scratch;
    const fs::path& folder = scratch.root();

    fs::path write(const std::string& name, const std::string& bytes) const {
        std::ofstream(folder / name, std::ios::binary) << bytes;
        return folder / name;
    }
    static std::string read(const fs::path& path) {
        std::ifstream file(path, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
    }
    std::size_t count() const {
        const fs::directory_iterator all(folder);
        return static_cast<std::size_t>(std::distance(begin(all), end(all)));
    }
};

/// Writes into a new file and closes it.
void fill(const replacement& made, const std::string& bytes) {
    EXPECT_EQ(native_file_descriptors().write(made.descriptor, bytes.data(), bytes.size()).error, 0);
    EXPECT_EQ(native_file_descriptors().close(made.descriptor).error, 0);
}

TEST_F(FileExchange, OpensFilesForReadingAndRefusesFolders) {
    const auto opened = native_file_exchange().open(write("a", "bytes"));
    ASSERT_GE(opened.value, 0);
    char bytes[8] = {};
    EXPECT_EQ(native_file_descriptors().read(static_cast<int>(opened.value), bytes, 8).value, 5);
    EXPECT_NE(native_file_descriptors().write(static_cast<int>(opened.value), bytes, 1).error, 0);
    native_file_descriptors().close(static_cast<int>(opened.value));
    EXPECT_EQ(native_file_exchange().open(folder).error, EISDIR);
    EXPECT_EQ(native_file_exchange().open(folder / "none").error, ENOENT);
    EXPECT_EQ(native_file_exchange().open(folder / "a" / "b").error, ENOTDIR);
}

TEST_F(FileExchange, MakesANewFileBesideTheTargetEachTime) {
    std::set<fs::path> paths;
    for (int i = 0; i < 20; ++i) {
        const replacement made = native_file_exchange().create_beside(folder / "a.vrl");
        ASSERT_EQ(made.error, 0);
        EXPECT_EQ(made.path.parent_path(), folder);
        EXPECT_EQ(made.path.filename().string().rfind(".vrl-", 0), 0u);
        EXPECT_EQ(made.target, folder / "a.vrl");
        EXPECT_EQ(fs::file_size(made.path), 0u);
        paths.insert(made.path);
        native_file_descriptors().close(made.descriptor);
    }
    EXPECT_EQ(paths.size(), 20u);
    EXPECT_FALSE(fs::exists(folder / "a.vrl"));
}

TEST_F(FileExchange, PutsOneFileInTheOthersPlace) {
    const fs::path target = write("a", "old");
    const replacement made = native_file_exchange().create_beside(target);
    fill(made, "new");
    EXPECT_EQ(read(target), "old");
    EXPECT_EQ(native_file_exchange().replace(made.path, made.target), 0);
    EXPECT_EQ(read(target), "new");
    EXPECT_EQ(count(), 1u);
    EXPECT_EQ(made.folder, folder);
    EXPECT_EQ(native_file_exchange().commit_folder(made.folder), 0);
    EXPECT_EQ(native_file_exchange().replace(made.path, made.target), ENOENT);
}

TEST_F(FileExchange, FlushesFoldersOnly) {
    EXPECT_EQ(native_file_exchange().commit_folder(folder), 0);
    EXPECT_EQ(native_file_exchange().commit_folder(folder / "none"), ENOENT);
    EXPECT_EQ(native_file_exchange().commit_folder(write("a", "")), ENOTDIR);
}

TEST_F(FileExchange, WorksInTheCurrentFolderForABareName) {
    const fs::path before = fs::current_path();
    fs::current_path(folder);
    const replacement made = native_file_exchange().create_beside("a");
    fill(made, "new");
    EXPECT_EQ(made.folder, ".");
    EXPECT_EQ(native_file_exchange().replace(made.path, made.target), 0);
    EXPECT_EQ(native_file_exchange().commit_folder(made.folder), 0);
    fs::current_path(before);
    EXPECT_EQ(read(folder / "a"), "new");
    EXPECT_EQ(count(), 1u);
}

TEST_F(FileExchange, RemovesFilesOnly) {
    EXPECT_EQ(native_file_exchange().remove(write("a", "")), 0);
    EXPECT_EQ(native_file_exchange().remove(folder / "a"), ENOENT);
    EXPECT_NE(native_file_exchange().remove(folder), 0);
    EXPECT_TRUE(fs::exists(folder));
}

TEST_F(FileExchange, KeepsTheModeOfTheTarget) {
    const fs::path target = write("a", "old");
    for (const unsigned mode : {0600U, 0644U, 0660U, 0755U}) {
        fs::permissions(target, fs::perms(mode));
        const replacement made = native_file_exchange().create_beside(target);
        EXPECT_EQ(fs::status(made.path).permissions(), fs::perms(mode));
        native_file_descriptors().close(made.descriptor);
    }
}

TEST_F(FileExchange, GivesAForeignGroupNoMoreThanEverybody) {
    const fs::path target = write("a", "old");
    fs::permissions(target, fs::perms(0676));
    fs::permissions(folder, fs::perms(0777));
    const bool is_root = ::geteuid() == 0;
    // Only who may become somebody else can meet a file of a group that is not his.
    const pid_t child = ::fork();
    if (child == 0) {
        constexpr gid_t k_nobody = 65534;
        if (is_root && (::setgroups(0, nullptr) != 0 || ::setegid(k_nobody) != 0 || ::seteuid(k_nobody) != 0))
            ::_exit(1);
        const replacement made = native_file_exchange().create_beside(target);
        if (made.error != 0) ::_exit(2);
        ::_exit(fs::status(made.path).permissions() == fs::perms(is_root ? 0666 : 0676) ? 0 : 3);
    }
    int status = 0;
    ASSERT_EQ(::waitpid(child, &status, 0), child);
    EXPECT_TRUE(WIFEXITED(status));
    EXPECT_EQ(WEXITSTATUS(status), 0);
}

TEST_F(FileExchange, GivesANewFileWhatTheMaskLeaves) {
    const mode_t mask = ::umask(077);
    const replacement made = native_file_exchange().create_beside(folder / "a");
    ::umask(mask);
    EXPECT_EQ(fs::status(made.path).permissions(), fs::perms(0600));
    native_file_descriptors().close(made.descriptor);
}

TEST_F(FileExchange, FollowsLinksAlsoToAFileThatIsNotThereYet) {
    write("a", "old");
    fs::create_symlink("a", folder / "b");
    fs::create_symlink("b", folder / "c");
    fs::create_directory(folder / "sub");
    fs::create_symlink("../nowhere", folder / "sub" / "link");
    fs::create_symlink("sub/link", folder / "d");
    fs::create_symlink("e", folder / "e");
    fs::create_symlink("none/a", folder / "f");
    const replacement followed = native_file_exchange().create_beside(folder / "c");
    EXPECT_EQ(followed.target, fs::canonical(folder) / "a");
    native_file_descriptors().close(followed.descriptor);
    const replacement dangling = native_file_exchange().create_beside(folder / "d");
    EXPECT_EQ(dangling.error, 0);
    fill(dangling, "new");
    EXPECT_EQ(native_file_exchange().replace(dangling.path, dangling.target), 0);
    EXPECT_EQ(read(folder / "nowhere"), "new");
    EXPECT_TRUE(fs::is_symlink(folder / "d"));
    EXPECT_TRUE(fs::is_symlink(folder / "sub" / "link"));
    EXPECT_EQ(native_file_exchange().create_beside(folder / "f").error, ENOENT);
    EXPECT_EQ(native_file_exchange().create_beside(folder / "e").error, ELOOP);
}

TEST_F(FileExchange, RefusesTargetsThatAreNoFiles) {
    ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0600), 0);
    const struct {
        fs::path target;
        int error;
    } rows[] = {{"", ENOENT},
                {folder, EISDIR},
                {folder / "pipe", EINVAL},
                {"/dev/null", EINVAL},
                {folder / "none" / "a", ENOENT},
                {folder / "pipe" / "a", ENOTDIR},
                {folder / std::string(300, 'n'), ENAMETOOLONG}};
    for (const auto& row : rows) {
        const replacement refused = native_file_exchange().create_beside(row.target);
        EXPECT_EQ(refused.error, row.error) << row.target;
        EXPECT_EQ(refused.descriptor, -1);
    }
    EXPECT_EQ(count(), 1u);
}

TEST_F(FileExchange, MakesPathsOfWideText) {
    EXPECT_EQ(vrl_platform::path_from_wide(L"a/\xE4\x4E2D").native(), "a/\xC3\xA4\xE4\xB8\xAD");
    EXPECT_EQ(vrl_platform::path_from_wide(L"\xD83D\xDE00").native(), "\xF0\x9F\x98\x80");
    EXPECT_EQ(vrl_platform::path_from_wide(L"\x1F600").native(), "\xF0\x9F\x98\x80");
    EXPECT_EQ(vrl_platform::path_from_wide(L"").native(), "");
}

}  // namespace
