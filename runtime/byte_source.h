#pragma once

#include <cstddef>
#include <cstdio>
#include <memory>
#include <string>

#include "platform/api.h"

namespace qbxV2 {

/// Where the bytes of a document come from. A caller's own source implements `read` and `rewind`.
///
/// Runs. A source that holds its bytes in memory can publish them as a run: the stretch [next, end) of its
/// own buffer that stands next. The reader then works on the run and moves `next` on; `read` must take its
/// byte from there too, so that both ways of reading share one position. A source without runs is read byte
/// by byte. A subclass of a publishing source that overrides `read` overrides `fill_run` with one that
/// returns false.
class VRL_API c_read {
public:
    c_read() = default;
    c_read(const c_read&) = default;
    c_read& operator=(const c_read&) = default;

    /// Whether the source can deliver. True by default.
    virtual bool is_open() const;
    /// The next byte as 0 to 255, or -1 at the end.
    virtual int read() = 0;
    /// The name of the input for reports. Null by default.
    virtual const char* get_source_id();
    /// Goes back to the first byte.
    virtual void rewind() = 0;
    virtual ~c_read();
    /// Called when the published run is used up: publishes the bytes that stand next, at least one. False
    /// when there are none, or when the source has no runs; then `read` decides. False by default.
    virtual bool fill_run();

protected:
    /// The published bytes are [begin, end); those before `next` have been delivered.
    struct s_run {
        const unsigned char* begin = nullptr;
        const unsigned char* next = nullptr;
        const unsigned char* end = nullptr;
    };
    s_run m_run;

private:
    friend class c_get_as_utf8;
};

/// Bytes in memory that somebody else owns and keeps alive. Copies share the memory.
class VRL_API c_read_memory : public c_read {
public:
    c_read_memory(const char* data, std::size_t size);
    int read() override;
    void rewind() override;
    bool fill_run() override;

private:
    c_read_memory() = default;
};

/// The characters of a string, which must outlive the source and stay unchanged.
class VRL_API c_read_string : public c_read_memory {
public:
    explicit c_read_string(const std::string& text) : c_read_memory(text.data(), text.size()) {}
};

/// A file, by path or as an open C stream. A failed open shows in `is_open`; `read` then gives -1.
///
/// A path is read ahead in large blocks, a caller's stream in blocks of 512 bytes. Either way `rewind` and
/// `close` act as if blocks had 512 bytes: what is left of the current one is still delivered, first.
class VRL_API c_read_file : public c_read {
public:
    /// Takes over the stream, and closes it on destruction unless `leave_file_open_on_delete(true)` was
    /// called. The source id is empty. A null stream counts as not open.
    explicit c_read_file(std::FILE* file);
    /// Opens a file for reading. `path` is in the encoding of the system's narrow calls, and is the source
    /// id.
    explicit c_read_file(const char* path);
    /// Opens a file by its wide path. The source id is the path as UTF-8, unit by unit.
    explicit c_read_file(const wchar_t* path);
    c_read_file(const c_read_file&) = delete;
    c_read_file& operator=(const c_read_file&) = delete;
    ~c_read_file() override;

    bool is_open() const override { return m_file != nullptr; }
    int read() override;
    const char* get_source_id() override { return m_source_id.c_str(); }
    /// Seeks to the start of the file. The rest of the current block comes first.
    void rewind() override;
    bool fill_run() override;
    /// Closes the stream, if there is one. The rest of the current block can still be read.
    void close();
    void leave_file_open_on_delete(bool leave) { m_close_on_delete = !leave; }

private:
    void keep_current_block_only();

    std::string m_source_id;
    std::FILE* m_file = nullptr;
    bool m_close_on_delete = true;
    std::size_t m_buffer_size;
    std::unique_ptr<unsigned char[]> m_buffer;
};

}  // namespace qbxV2
