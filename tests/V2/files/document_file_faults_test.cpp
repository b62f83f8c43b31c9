#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <fstream>
#include <random>
#include <system_error>

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
    // Under the same name, which stands in an archive, too.
    const ScratchFolder other;
    ASSERT_TRUE(save_document(new_document, other / GetParam()));
    const std::uintmax_t size = fs::file_size(other / GetParam());
    for (const std::uintmax_t most : {std::uintmax_t{0}, std::uintmax_t{1}, size / 2, size - 1, size}) {
        const int code = in_a_child([&] {
            std::signal(SIGXFSZ, SIG_IGN);
            const rlimit limit{most, most};
            if (::setrlimit(RLIMIT_FSIZE, &limit) != 0) return 1;
            const save_result result = save_document(new_document, path);
            if (result) return 2;
            if (result.failure != file_failure::system_error) return 3;
            return result.message.find("File too large") != std::string::npos ? 17 : 4;
        });
        EXPECT_EQ(code, most == size ? 2 : 17) << "at most " << most << " bytes";
        if (most != size) expect_old();
    }
}

/// The system's files on a disk that has room for so many bytes more.
class scarce_files : public zip_test::FaultyFiles {
public:
    explicit scarce_files(std::size_t room) : m_room(room) {}

    vrl_platform::io_result write(int descriptor, const void* buffer, std::size_t count) override {
        const std::size_t taken = std::min(count, m_room);
        m_room -= taken;
        const auto written = FaultyFiles::write(descriptor, buffer, taken);
        return taken == count ? written : vrl_platform::io_result{written.value, ENOSPC};
    }

private:
    std::size_t m_room;
};

TEST_P(Faults, AFullDiskLeavesTheOldFile) {
    std::size_t room = 0;
    for (;; room = room * 3 / 2 + 1) {
        scarce_files files(room);
        const save_result result = save_document(new_document, path, {}, file_access{files, world.exchange});
        if (result) break;
        EXPECT_EQ(result.failure, file_failure::system_error);
        EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_3);
        EXPECT_NE(result.message.find("No space left on device"), std::string::npos) << result.message;
        expect_old();
    }
    EXPECT_GT(room, 1000u) << "there was no room at first";
}

TEST_P(Faults, ErrorsOfTheSystemAreNotTakenForThoseOfTheArchive) {
    // Their numbers are those of codes of the ZIP engine.
    for (const int error : {EDQUOT, ESTALE, ENOTCONN}) {
        for (const Call call : {Call::write, Call::commit, Call::close}) {
            world.files.FailAt(0, error, {call});
            const save_result result = save_document(new_document, path, {}, world.access);
            EXPECT_EQ(result.failure, file_failure::system_error);
            EXPECT_NE(result.message.find(std::generic_category().message(error)), std::string::npos)
                << result.message;
            expect_old();
        }
    }
    ASSERT_TRUE(save_document(new_document, path));
    for (const int error : {EDQUOT, ESTALE, ENOTCONN}) {
        for (const std::size_t n : {0U, 1U}) {
            world.files.FailAt(n, error, {Call::read});
            const auto result = load_document(path, {}, world.access);
            EXPECT_EQ(result.failure, file_failure::system_error);
            EXPECT_NE(result.message.find(std::generic_category().message(error)), std::string::npos)
                << result.message;
        }
    }
}

TEST(SaveDocument, ReportsAStreamOnAFullDisk) {
    const Vrl document = document_of(500);
    for (const auto format : {vrl_v2::file_format::plain, vrl_v2::file_format::packed}) {
        std::ofstream full("/dev/full", std::ios::binary);
        ASSERT_TRUE(full.is_open());
        full.rdbuf()->pubsetbuf(nullptr, 0);
        vrl_v2::save_options options;
        options.format = format;
        EXPECT_EQ(save_document(document, full, options).failure, file_failure::system_error);
    }
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

/// Removes what a killed save left. It has a name by which it can be told.
std::size_t remove_leftovers(const ScratchFolder& folder, const std::string& target) {
    std::size_t count = 0;
    for (const std::string& name : folder.Names()) {
        if (name == target) continue;
        EXPECT_EQ(name.rfind(".vrl-", 0), 0u) << name;
        fs::remove(folder.Path() / name);
        ++count;
    }
    return count;
}

TEST_P(Faults, AKilledSaveLeavesTheOldDocumentOrTheNewOne) {
    constexpr int k_kills = 150;
    const Vrl document = document_of(200, L"new");
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
    std::size_t killed_within = 0;
    for (int i = 0; i < k_kills; ++i) {
        zip_test::WriteFile(path, old_bytes);
        save_and_kill(document, path, std::chrono::microseconds(moments(random)));
        const auto loaded = load_document(path);
        ASSERT_TRUE(loaded) << loaded.message;
        const std::string text = text_of(*loaded.document);
        EXPECT_TRUE(text == old_text || text == new_text);
        killed_before += text == old_text ? 1 : 0;
        killed_within += remove_leftovers(folder, GetParam());
    }
    EXPECT_GT(killed_before, 0) << "some must have come in time";
    EXPECT_GT(killed_within, 0u) << "and some in the middle";
}

INSTANTIATE_TEST_SUITE_P(DocumentFile, Faults, testing::Values("a.vrl", "a.vrlz"), [](const auto& row) {
    return std::string(row.param) == "a.vrl" ? "Plain" : "Packed";
});

}  // namespace
