#include "runtime/byte_source.h"

#include "platform/file_open.h"
#include "runtime/utf8.h"

namespace qbxV2 {
namespace {

/// What `rewind` and `close` take for the size of a block, and the size of reads from a stream that others
/// may use too.
constexpr std::size_t k_block = 512;
/// How far a file of our own is read ahead.
constexpr std::size_t k_read_ahead = 128 * k_block;

std::string source_id_of(const wchar_t* path) {
    std::string id;
    char character[5];
    for (; *path != 0; ++path) id += unicode_char_to_utf8(static_cast<int>(*path), character);
    return id;
}

}  // namespace

bool c_read::is_open() const { return true; }
const char* c_read::get_source_id() { return nullptr; }
c_read::~c_read() = default;
bool c_read::fill_run() { return false; }

c_read_memory::c_read_memory(const char* data, std::size_t size) {
    m_run.begin = reinterpret_cast<const unsigned char*>(data);
    m_run.next = m_run.begin;
    m_run.end = m_run.begin + size;
}

int c_read_memory::read() { return m_run.next == m_run.end ? -1 : *m_run.next++; }
void c_read_memory::rewind() { m_run.next = m_run.begin; }
bool c_read_memory::fill_run() { return m_run.next != m_run.end; }

c_read_file::c_read_file(std::FILE* file) : m_file(file), m_buffer_size(k_block) {}

c_read_file::c_read_file(const char* path)
    : m_source_id(path), m_file(vrl_platform::open_file(path, "rb")), m_buffer_size(k_read_ahead) {}

c_read_file::c_read_file(const wchar_t* path)
    : m_source_id(source_id_of(path)),
      m_file(vrl_platform::open_file(path, "rb")),
      m_buffer_size(k_read_ahead) {}

c_read_file::~c_read_file() {
    if (m_close_on_delete && m_file != nullptr) std::fclose(m_file);
}

int c_read_file::read() {
    if (m_run.next == m_run.end && !fill_run()) return -1;
    return *m_run.next++;
}

bool c_read_file::fill_run() {
    if (m_file == nullptr) return false;
    if (!m_buffer) m_buffer.reset(new unsigned char[m_buffer_size]);
    const std::size_t size = std::fread(m_buffer.get(), 1, m_buffer_size, m_file);
    if (size == 0) return false;
    m_run.begin = m_buffer.get();
    m_run.next = m_run.begin;
    m_run.end = m_run.begin + size;
    return true;
}

void c_read_file::rewind() {
    // Intended: bytes of the current block that have not been read yet come first after a rewind.
    keep_current_block_only();
    if (m_file != nullptr) std::fseek(m_file, 0, SEEK_SET);
}

void c_read_file::close() {
    keep_current_block_only();
    if (m_file != nullptr) std::fclose(m_file);
    m_file = nullptr;
}

void c_read_file::keep_current_block_only() {
    const auto read = static_cast<std::size_t>(m_run.next - m_run.begin);
    const auto held = static_cast<std::size_t>(m_run.end - m_run.begin);
    const std::size_t block_end = (read + k_block - 1) / k_block * k_block;
    if (block_end < held) m_run.end = m_run.begin + block_end;
}

}  // namespace qbxV2
