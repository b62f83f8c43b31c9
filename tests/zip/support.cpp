#include "support.h"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <ctime>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace zip_test {
namespace {

namespace fs = std::filesystem;
using vrl_platform::io_result;

// The engine writes local time; expected bytes must not depend on where the tests run.
const bool k_utc = [] {
    ::setenv("TZ", "UTC", 1);
    ::tzset();
    return true;
}();

}  // namespace

ScratchFolder::ScratchFolder() {
    if (!k_utc) throw std::logic_error("time zone");
}

std::string ScratchFolder::Write(const std::string& name, const Bytes& bytes) const {
    fs::create_directories((Path() / name).parent_path());
    WriteFile(*this / name, bytes);
    return *this / name;
}

Bytes ScratchFolder::Read(const std::string& name) const { return ReadFile(*this / name); }

std::vector<std::string> ScratchFolder::Names() const {
    std::vector<std::string> names;
    for (const auto& item : fs::directory_iterator(Path())) names.push_back(item.path().filename().string());
    std::sort(names.begin(), names.end());
    return names;
}

CurrentFolder::CurrentFolder(const fs::path& path) : m_before(fs::current_path()) { fs::current_path(path); }
CurrentFolder::~CurrentFolder() {
    std::error_code ignored;
    fs::current_path(m_before, ignored);
}

Bytes ReadFile(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    if (!in) throw std::runtime_error("cannot read " + path);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

void WriteFile(const std::string& path, const Bytes& bytes) {
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    if (!out) throw std::runtime_error("cannot write " + path);
}

Bytes ReadData(const std::string& name) { return ReadFile(std::string(VRL_TEST_DATA "/zip/") + name); }

int Run(const std::string& command) {
    const int status = std::system(("{ " + command + "\n} >/dev/null 2>&1").c_str());
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

int CodeOf(const std::function<void()>& action) {
    try {
        action();
    } catch (const CZipException& exception) {
        return exception.GetCode();
    }
    return 0;
}

Bytes SampleText(std::size_t size) {
    static constexpr const char* names[] = {"Barn Red", "Harbor Blue", "Moss", "Slate", "Old Gold"};
    Bytes text = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n<Palette>\r\n";
    std::uint32_t state = 7;
    while (text.size() < size) {
        state = state * 1664525U + 1013904223U;
        text += "\t<Color Name=\"";
        text += names[(state >> 8) % std::size(names)];
        text += "\" L=\"" + std::to_string(state % 10000) + "\" a=\"-" + std::to_string((state >> 16) % 128) +
                "\"/>\r\n";
    }
    text.resize(size);
    return text;
}

Bytes Noise(std::size_t size, std::uint32_t seed) {
    Bytes bytes(size, '\0');
    std::uint32_t state = seed * 2654435761U + 1;
    for (char& c : bytes) {
        state ^= state << 13;
        state ^= state >> 17;
        state ^= state << 5;
        c = static_cast<char>(state >> 11);
    }
    return bytes;
}

bool FixedEntropy::fill(void* buffer, std::size_t size) {
    auto* bytes = static_cast<std::uint8_t*>(buffer);
    for (std::size_t i = 0; i < size; ++i) bytes[i] = m_next++;
    return available;
}

void FaultyFiles::FailAt(std::size_t n, int error, std::vector<Call> calls) {
    Heal();
    m_failAt = n;
    m_error = error;
    m_calls = std::move(calls);
}

void FaultyFiles::FallShortAt(std::size_t n, std::vector<Call> calls) {
    FailAt(n, 0, std::move(calls));
    m_short = true;
}

void FaultyFiles::Heal() {
    m_failAt.reset();
    m_calls.clear();
    m_short = m_failed = false;
    m_failedCall.reset();
    m_count = 0;
}

bool FaultyFiles::Fails(Call call) {
    if (!m_calls.empty() && std::find(m_calls.begin(), m_calls.end(), call) == m_calls.end()) return false;
    if (!m_failAt || m_count++ != *m_failAt) return false;
    m_failed = true;
    m_failedCall = call;
    return true;
}

io_result FaultyFiles::open(const std::string& path, const vrl_platform::open_request& request) {
    const bool held = std::find(denied.begin(), denied.end(), path) != denied.end();
    if (held && request.sharing != vrl_platform::share_mode::deny_none) return {-1, EACCES};
    if (Fails(Call::open)) return {-1, m_error};
    const io_result opened = vrl_platform::native_file_descriptors().open(path, request);
    if (opened.value >= 0) ++m_openCount;
    return opened;
}

// A file is closed whatever the system says about it.
io_result FaultyFiles::close(int descriptor) {
    const bool fails = Fails(Call::close);
    const io_result closed = vrl_platform::native_file_descriptors().close(descriptor);
    if (closed.value >= 0) --m_openCount;
    return fails ? io_result{-1, m_error} : closed;
}

io_result FaultyFiles::read(int descriptor, void* buffer, std::size_t count) {
    if (!Fails(Call::read)) return vrl_platform::native_file_descriptors().read(descriptor, buffer, count);
    if (!m_short) return {0, m_error};
    return vrl_platform::native_file_descriptors().read(descriptor, buffer, count / 2);
}

io_result FaultyFiles::write(int descriptor, const void* buffer, std::size_t count) {
    if (!Fails(Call::write)) return vrl_platform::native_file_descriptors().write(descriptor, buffer, count);
    return vrl_platform::native_file_descriptors().write(descriptor, buffer, count / 2).value < 0
               ? io_result{0, EIO}
               : io_result{static_cast<std::int64_t>(count / 2), m_error};
}

io_result FaultyFiles::seek(int descriptor, std::int64_t offset, vrl_platform::seek_origin origin) {
    if (Fails(Call::seek)) return {-1, m_error};
    return vrl_platform::native_file_descriptors().seek(descriptor, offset, origin);
}

io_result FaultyFiles::resize(int descriptor, std::int64_t length) {
    if (Fails(Call::resize)) return {-1, m_error};
    return vrl_platform::native_file_descriptors().resize(descriptor, length);
}

// The bytes need not reach a device for a test.
io_result FaultyFiles::commit(int /*descriptor*/) {
    return Fails(Call::commit) ? io_result{-1, m_error} : io_result{0, 0};
}

void* FaultyFiles::map(int descriptor, std::size_t length) {
    if (Fails(Call::map)) return nullptr;
    return vrl_platform::native_file_descriptors().map(descriptor, length);
}

void FaultyFiles::unmap(void* view, std::size_t length) {
    vrl_platform::native_file_descriptors().unmap(view, length);
}

std::optional<unsigned> FaultyNames::attributes(const std::string& path) {
    return vrl_platform::native_file_names().attributes(path);
}
bool FaultyNames::set_attributes(const std::string& path, unsigned attributes) {
    return !failAttributes && vrl_platform::native_file_names().set_attributes(path, attributes);
}
std::optional<std::int64_t> FaultyNames::modification_time(const std::string& path) {
    return vrl_platform::native_file_names().modification_time(path);
}
bool FaultyNames::set_modification_time(const std::string& path, std::int64_t time) {
    return !failTime && vrl_platform::native_file_names().set_modification_time(path, time);
}
vrl_platform::existence FaultyNames::exists(const std::string& path) {
    return vrl_platform::native_file_names().exists(path);
}
bool FaultyNames::is_enterable_folder(const std::string& path) {
    return vrl_platform::native_file_names().is_enterable_folder(path);
}
bool FaultyNames::remove(const std::string& path) {
    return !failRemove && vrl_platform::native_file_names().remove(path);
}
bool FaultyNames::rename(const std::string& from, const std::string& to) {
    return !failRename && vrl_platform::native_file_names().rename(from, to);
}
std::string FaultyNames::temporary_folder() {
    return temporaryFolder.value_or(vrl_platform::native_file_names().temporary_folder());
}
std::optional<std::string> FaultyNames::make_temporary_file(const std::string& folder,
                                                            const std::string& prefix) {
    if (failTemporary) return std::nullopt;
    auto path = vrl_platform::native_file_names().make_temporary_file(folder, prefix);
    if (path) temporaryFiles.push_back(*path);
    return path;
}

bool FakeVolumes::is_removable(const std::string& /*path*/) { return removable; }
std::optional<std::uint64_t> FakeVolumes::free_space(const std::string& folder) {
    return space ? space : vrl_platform::native_volumes().free_space(folder);
}
bool FakeVolumes::set_label(const std::string& /*path*/, const std::string& label) {
    if (labels) given.push_back(label);
    return labels;
}

std::size_t OpenDescriptors() {
    const fs::directory_iterator all("/proc/self/fd");
    return static_cast<std::size_t>(std::distance(begin(all), end(all)));
}

}  // namespace zip_test
