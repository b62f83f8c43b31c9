#pragma once

#include <cstdint>
#include <filesystem>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "platform/clock.h"
#include "platform/entropy.h"
#include "platform/file_descriptors.h"
#include "platform/file_names.h"
#include "platform/volumes.h"
#include "tests/temporary_folder.h"
#include "zip/environment.h"
#include "zip/exception.h"
#include "zip/random_pool.h"

/// What the tests of the ZIP engine share: folders to work in, a world that can be told to fail, and archives
/// laid out byte by byte without the engine.
namespace zip_test {

/// Bytes, in the type that compares and prints best.
using Bytes = std::string;

/// A new folder that goes away with everything in it.
class ScratchFolder {
public:
    ScratchFolder();

    std::string operator/(const std::string& name) const { return m_folder.path(name); }
    const std::filesystem::path& Path() const { return m_folder.root(); }
    std::string Write(const std::string& name, const Bytes& bytes) const;
    Bytes Read(const std::string& name) const;
    std::vector<std::string> Names() const;

private:
    vrl_test::temporary_folder m_folder;
};

/// Makes a folder the current one for as long as this lives.
class CurrentFolder {
public:
    explicit CurrentFolder(const std::filesystem::path& path);
    CurrentFolder(const CurrentFolder&) = delete;
    CurrentFolder& operator=(const CurrentFolder&) = delete;
    ~CurrentFolder();

private:
    std::filesystem::path m_before;
};

Bytes ReadFile(const std::string& path);
void WriteFile(const std::string& path, const Bytes& bytes);
/// A file of the test data.
Bytes ReadData(const std::string& name);

/// Runs a command of the shell, silently; its exit code.
int Run(const std::string& command);
/// The code of the CZipException that an action raises; 0 when it raises none.
int CodeOf(const std::function<void()>& action);

/// Text like that of a document: it compresses well.
Bytes SampleText(std::size_t size);
/// Bytes that do not compress.
Bytes Noise(std::size_t size, std::uint32_t seed = 1);

class FixedClock : public vrl_platform::clock {
public:
    std::int64_t now() override { return time; }
    /// 2023-11-14 22:13:20 UTC.
    std::int64_t time = 1700000000;
};

class FixedEntropy : public vrl_platform::entropy_source {
public:
    bool fill(void* buffer, std::size_t size) override;
    bool available = true;

private:
    std::uint8_t m_next = 0;
};

/// The calls that can be made to fail.
enum class Call { open, close, read, write, seek, resize, commit, map };

/// The system's files, with failures on demand.
class FaultyFiles : public vrl_platform::file_descriptors {
public:
    /// Lets call number `n` (from 0, counted over all calls in `calls`, or over every call when empty) fail.
    void FailAt(std::size_t n, int error, std::vector<Call> calls = {});
    /// The same, but a transfer moves half of its bytes and names no error.
    void FallShortAt(std::size_t n, std::vector<Call> calls = {});
    void Heal();
    bool HasFailed() const { return m_failed; }
    std::optional<Call> FailedCall() const { return m_failedCall; }
    std::size_t OpenCount() const { return m_openCount; }

    vrl_platform::io_result open(const std::string& path, const vrl_platform::open_request& request) override;
    vrl_platform::io_result close(int descriptor) override;
    vrl_platform::io_result read(int descriptor, void* buffer, std::size_t count) override;
    vrl_platform::io_result write(int descriptor, const void* buffer, std::size_t count) override;
    vrl_platform::io_result seek(int descriptor, std::int64_t offset,
                                 vrl_platform::seek_origin origin) override;
    vrl_platform::io_result resize(int descriptor, std::int64_t length) override;
    vrl_platform::io_result commit(int descriptor) override;
    void* map(int descriptor, std::size_t length) override;
    void unmap(void* view, std::size_t length) override;

    /// Paths that cannot be opened with a lock, as if somebody held them.
    std::vector<std::string> denied;

private:
    bool Fails(Call call);

    std::optional<std::size_t> m_failAt;
    int m_error = 0;
    bool m_short = false;
    std::vector<Call> m_calls;
    std::size_t m_count = 0;
    bool m_failed = false;
    std::optional<Call> m_failedCall;
    std::size_t m_openCount = 0;
};

/// The system's names, with failures on demand.
class FaultyNames : public vrl_platform::file_names {
public:
    bool failRemove = false;
    bool failRename = false;
    bool failTime = false;
    bool failAttributes = false;
    bool failTemporary = false;
    std::optional<std::string> temporaryFolder;
    std::vector<std::string> temporaryFiles;

    std::optional<unsigned> attributes(const std::string& path) override;
    bool set_attributes(const std::string& path, unsigned attributes) override;
    std::optional<std::int64_t> modification_time(const std::string& path) override;
    bool set_modification_time(const std::string& path, std::int64_t time) override;
    vrl_platform::existence exists(const std::string& path) override;
    bool is_enterable_folder(const std::string& path) override;
    bool remove(const std::string& path) override;
    bool rename(const std::string& from, const std::string& to) override;
    std::string temporary_folder() override;
    std::optional<std::string> make_temporary_file(const std::string& folder,
                                                   const std::string& prefix) override;
};

/// Volumes as a test wants them.
class FakeVolumes : public vrl_platform::volumes {
public:
    bool removable = false;
    bool labels = true;
    std::optional<std::uint64_t> space;
    std::vector<std::string> given;

    bool is_removable(const std::string& path) override;
    std::optional<std::uint64_t> free_space(const std::string& folder) override;
    bool set_label(const std::string& path, const std::string& label) override;
};

/// An environment made of the above.
struct World {
    FaultyFiles files;
    FaultyNames names;
    FakeVolumes volumes;
    FixedClock clock;
    FixedEntropy entropy;
    CZipRandomPool pool{entropy, clock};
    CZipEnvironment environment{files, names, volumes, clock, pool};
};

/// The descriptors that the process has open.
std::size_t OpenDescriptors();

}  // namespace zip_test
