#include <gtest/gtest.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <csignal>
#include <fstream>
#include <random>

#include "V2/file_access.h"
#include "document_files.h"

// What happens when the system fails, and when it stops.

namespace {

namespace fs = std::filesystem;

using vrl_test::document_of;
using vrl_test::text_of;
using vrl_v2::file_access;
using vrl_v2::file_failure;
using vrl_v2::load_document;
using vrl_v2::save_document;
using vrl_v2::save_result;
using vrl_v2::Vrl;
using zip_test::Call;
using zip_test::ScratchFolder;

struct faulty_world {
    zip_test::FaultyFiles files;
    vrl_test::FaultyExchange exchange;
    file_access access{files, exchange};
};

class Faults : public testing::TestWithParam<const char*> {
protected:
    ScratchFolder folder;
    faulty_world world;
    Vrl old_document = document_of(3, L"old");
    Vrl new_document = document_of(400, L"new");
    std::string path = folder / GetParam();

    void SetUp() override { ASSERT_TRUE(save_document(old_document, path)); }

    void expect_old() const {
        const auto loaded = load_document(path);
        ASSERT_TRUE(loaded) << loaded.message;
        EXPECT_EQ(text_of(*loaded.document), text_of(old_document));
        EXPECT_EQ(folder.Names().size(), 1u) << "the new file is gone";
    }
};

TEST_P(Faults, EachCallOfASaveMayFailAndTheOldFileStays) {
    const std::size_t open = zip_test::OpenDescriptors();
    std::set<Call> failed;
    std::size_t n = 0;
    for (;; ++n) {
        world.files.FailAt(n, EIO);
        const save_result result = save_document(new_document, path, {}, world.access);
        if (!world.files.HasFailed()) {
            EXPECT_TRUE(result) << "no call was left to fail";
            break;
        }
        failed.insert(*world.files.FailedCall());
        EXPECT_EQ(result.failure, file_failure::system_error) << n;
        EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_3);
        EXPECT_NE(result.message.find("Input/output error"), std::string::npos) << result.message;
        EXPECT_NE(result.message.find(path), std::string::npos);
        expect_old();
        EXPECT_EQ(zip_test::OpenDescriptors(), open);
    }
    EXPECT_GE(n, 3u);
    for (const Call call : {Call::write, Call::commit, Call::close}) EXPECT_EQ(failed.count(call), 1u);
}

TEST_P(Faults, EachWriteMayFallShort) {
    for (std::size_t n = 0;; ++n) {
        world.files.FallShortAt(n, {Call::write});
        const save_result result = save_document(new_document, path, {}, world.access);
        if (!world.files.HasFailed()) break;
        EXPECT_EQ(result.failure, file_failure::system_error);
        expect_old();
    }
}

TEST_P(Faults, EachCallOfALoadMayFail) {
    ASSERT_TRUE(save_document(new_document, path));
    const std::size_t open = zip_test::OpenDescriptors();
    std::size_t reported = 0;
    for (std::size_t n = 0;; ++n) {
        world.files.FailAt(n, EIO);
        const auto result = load_document(path, {}, world.access);
        EXPECT_EQ(zip_test::OpenDescriptors(), open);
        if (!world.files.HasFailed()) {
            EXPECT_TRUE(result);
            break;
        }
        if (result) {
            // What asks for the size of a plain file, and what closes a file that was read.
            EXPECT_TRUE(world.files.FailedCall() == Call::seek || world.files.FailedCall() == Call::close);
            EXPECT_EQ(text_of(*result.document), text_of(new_document));
            continue;
        }
        ++reported;
        EXPECT_EQ(result.failure, file_failure::system_error) << n << result.message;
        EXPECT_NE(result.message.find("Input/output error"), std::string::npos) << result.message;
        EXPECT_EQ(result.document, nullptr);
        EXPECT_TRUE(result.reports.empty());
    }
    EXPECT_GE(reported, 3u);
}

TEST_P(Faults, AReadThatFallsShortLosesNothing) {
    ASSERT_TRUE(save_document(new_document, path));
    for (std::size_t n = 0;; ++n) {
        world.files.FallShortAt(n, {Call::read});
        const auto result = load_document(path, {}, world.access);
        if (result) {
            EXPECT_EQ(text_of(*result.document), text_of(new_document));
        } else {
            EXPECT_EQ(result.failure, file_failure::bad_archive) << "the engine takes it for the end";
        }
        if (!world.files.HasFailed()) break;
    }
}

TEST_P(Faults, TheFileMayNotBeMadeOrNotTakeItsPlace) {
    world.exchange.create_error = ENOSPC;
    save_result result = save_document(new_document, path, {}, world.access);
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_NE(result.message.find("No space left"), std::string::npos) << result.message;
    expect_old();
    world.exchange.create_error = 0;
    world.exchange.replace_error = EACCES;
    result = save_document(new_document, path, {}, world.access);
    EXPECT_EQ(result.failure, file_failure::system_error);
    EXPECT_NE(result.message.find("Permission denied"), std::string::npos) << result.message;
    expect_old();
}

TEST_P(Faults, AFolderThatCannotBeFlushedIsTold) {
    world.exchange.folder_error = EIO;
    const save_result result = save_document(new_document, path, {}, world.access);
    EXPECT_EQ(result.failure, file_failure::system_error);
    EXPECT_NE(result.message.find("saved, but"), std::string::npos) << result.message;
    const auto loaded = load_document(path);
    ASSERT_TRUE(loaded);
    EXPECT_EQ(text_of(*loaded.document), text_of(new_document));
    EXPECT_EQ(folder.Names().size(), 1u);
}

TEST_P(Faults, AFileThatCannotBeOpenedIsTold) {
    world.exchange.open_error = EMFILE;
    const auto result = load_document(path, {}, world.access);
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_NE(result.message.find("Too many open files"), std::string::npos) << result.message;
}

/// Runs an action in a child process, where it may change what would hurt the others. Its exit code.
template <class Action>
int in_a_child(const Action& action) {
    const pid_t child = ::fork();
    if (child == 0) ::_exit(action());
    int status = 0;
    EXPECT_EQ(::waitpid(child, &status, 0), child);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
}

TEST_P(Faults, AFileThatMayGrowNoFurtherLeavesTheOldOne) {
    const int code = in_a_child([&] {
        std::signal(SIGXFSZ, SIG_IGN);
        const rlimit limit{2000, 2000};
        ::setrlimit(RLIMIT_FSIZE, &limit);
        const save_result result = save_document(new_document, path);
        if (result.failure == file_failure::system_error) return 17;
        return result.failure == file_failure::limit_exceeded ? 18 : 1;
    });
    EXPECT_TRUE(code == 17 || code == 18) << code;
    expect_old();
}

/// A small file system of its own, in name spaces that end with the child: root needs one for mounts,
/// anybody else one for users, too, in which he is root.
bool mount_small_disk(const std::string& folder) {
    const std::string self = std::to_string(::geteuid());
    if (::geteuid() == 0) {
        if (::unshare(CLONE_NEWNS) != 0) return false;
    } else {
        if (::unshare(CLONE_NEWUSER | CLONE_NEWNS) != 0) return false;
        std::ofstream("/proc/self/uid_map") << "0 " << self << " 1";
    }
    return ::mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0 &&
           ::mount("tmpfs", folder.c_str(), "tmpfs", 0, "size=64k") == 0;
}

TEST_P(Faults, AFullDiskLeavesTheOldFile) {
    const std::string disk = folder / "disk";
    fs::create_directory(disk);
    const std::string target = disk + "/" + GetParam();
    const int code = in_a_child([&] {
        if (!mount_small_disk(disk)) return 2;
        if (!save_document(old_document, target)) return 3;
        const save_result result = save_document(document_of(20000, L"new"), target);
        if (result.failure != file_failure::system_error) return 4;
        if (result.message.find("No space left on device") == std::string::npos) return 5;
        const auto loaded = load_document(target);
        if (!loaded || text_of(*loaded.document) != text_of(old_document)) return 6;
        const auto names = fs::directory_iterator(disk);
        return std::distance(begin(names), end(names)) == 1 ? 0 : 7;
    });
    fs::remove(disk);
    if (code == 2) GTEST_SKIP() << "this system gives nobody a small disk; the limit above stands for it";
    EXPECT_EQ(code, 0);
}

// Kills ----------------------------------------------------------------------------------------------------

/// Starts a save in a child and kills it after a while.
void save_and_kill(const Vrl& document, const std::string& path, std::chrono::microseconds after) {
    int ready[2];
    ASSERT_EQ(::pipe(ready), 0);
    const pid_t child = ::fork();
    if (child == 0) {
        if (::write(ready[1], "!", 1) != 1) ::_exit(1);
        const bool saved = static_cast<bool>(save_document(document, path));
        ::_exit(saved ? 0 : 1);
    }
    char byte = 0;
    EXPECT_EQ(::read(ready[0], &byte, 1), 1);
    ::close(ready[0]);
    ::close(ready[1]);
    ::usleep(static_cast<useconds_t>(after.count()));
    ::kill(child, SIGKILL);
    int status = 0;
    EXPECT_EQ(::waitpid(child, &status, 0), child);
    EXPECT_TRUE(WIFSIGNALED(status) || (WIFEXITED(status) && WEXITSTATUS(status) == 0)) << status;
}

TEST_P(Faults, AKilledSaveLeavesTheOldDocumentOrTheNewOne) {
    const Vrl document = document_of(120, L"new");
    const auto begin = std::chrono::steady_clock::now();
    ASSERT_TRUE(save_document(document, path));
    const auto whole =
        std::chrono::duration_cast<std::chrono::microseconds>(std::chrono::steady_clock::now() - begin);
    const std::string new_text = text_of(document);
    const std::string old_text = text_of(old_document);
    ASSERT_TRUE(save_document(old_document, path));
    const std::string old_bytes = zip_test::ReadFile(path);

    std::mt19937 random(20240102);
    std::uniform_int_distribution<long> moments(
        0, std::max<long>(2000, static_cast<long>(whole.count()) * 3 / 2));
    int killed_before = 0;
    for (int i = 0; i < 100; ++i) {
        zip_test::WriteFile(path, old_bytes);
        save_and_kill(document, path, std::chrono::microseconds(moments(random)));
        const auto loaded = load_document(path);
        ASSERT_TRUE(loaded) << loaded.message;
        const std::string text = text_of(*loaded.document);
        EXPECT_TRUE(text == old_text || text == new_text);
        killed_before += text == old_text ? 1 : 0;
    }
    EXPECT_GT(killed_before, 0) << "some must have come in time";
    // What a killed save leaves has a name by which it can be told.
    for (const std::string& name : folder.Names())
        EXPECT_TRUE(name == GetParam() || name.rfind(".vrl-", 0) == 0) << name;
}

INSTANTIATE_TEST_SUITE_P(DocumentFile, Faults, testing::Values("a.vrl", "a.vrlz"), [](const auto& row) {
    return std::string(row.param) == "a.vrl" ? "Plain" : "Packed";
});

}  // namespace
