#include "zip/file.h"

#include <cerrno>
#include <utility>

#include "zip/bytes.h"
#include "zip/exception.h"

namespace {

using vrl_platform::io_result;
using vrl_platform::open_request;
using vrl_platform::seek_origin;
using vrl_platform::share_mode;

share_mode ShareModeFromFlags(unsigned flags) {
    const unsigned bits =
        CZipAbstractFile::shareDenyWrite | CZipAbstractFile::shareDenyRead | CZipAbstractFile::shareDenyNone;
    switch (flags & bits) {
        case 0:
            return share_mode::deny_all;
        case CZipAbstractFile::shareDenyWrite:
            return share_mode::deny_write;
        case CZipAbstractFile::shareDenyRead:
            return share_mode::deny_read;
        default:
            return share_mode::deny_none;
    }
}

open_request RequestFromFlags(unsigned flags) {
    open_request request;
    request.read = (flags & CZipAbstractFile::modeRead) != 0;
    request.write = (flags & CZipAbstractFile::modeWrite) != 0;
    request.create = (flags & CZipAbstractFile::modeCreate) != 0;
    request.truncate = request.write && (flags & CZipAbstractFile::modeNoTruncate) == 0;
    request.sharing = ShareModeFromFlags(flags);
    return request;
}

seek_origin OriginFromNumber(CZipAbstractFile::SeekOrigin origin) {
    if (origin == CZipAbstractFile::begin) return seek_origin::begin;
    return origin == CZipAbstractFile::end ? seek_origin::end : seek_origin::current;
}

}  // namespace

void CZipFile::Abandon() noexcept {
    if (!IsClosed()) m_files.close(std::exchange(m_descriptor, -1));
}

bool CZipFile::Open(const std::string& path, unsigned flags, bool throwOnError) {
    if (!IsClosed()) Close();
    const io_result opened = m_files.open(path, RequestFromFlags(flags));
    if (opened.value < 0) {
        if (throwOnError) CZipException::Raise(opened.error, path);
        return false;
    }
    m_descriptor = static_cast<int>(opened.value);
    m_path = path;
    return true;
}

void CZipFile::Close() {
    if (IsClosed()) return;
    // Closed even when the system reports a failure: the descriptor must not be used again.
    const io_result closed = m_files.close(std::exchange(m_descriptor, -1));
    const std::string path = std::exchange(m_path, {});
    if (closed.value < 0) CZipException::Raise(closed.error, path);
}

void CZipFile::Flush() {
    const io_result flushed = m_files.commit(m_descriptor);
    if (flushed.value < 0) CZipException::Raise(flushed.error, m_path);
}

std::uint32_t CZipFile::Position(std::int64_t offset, seek_origin origin) const {
    const io_result moved = m_files.seek(m_descriptor, offset, origin);
    if (moved.value < 0) CZipException::Raise(moved.error, m_path);
    if (static_cast<std::uint64_t>(moved.value) > ZipArchiveLib::k_largestNumber)
        CZipException::Raise(EFBIG, m_path);
    return static_cast<std::uint32_t>(moved.value);
}

std::uint32_t CZipFile::GetPosition() const { return Position(0, seek_origin::current); }

std::uint32_t CZipFile::Seek(std::int64_t offset, SeekOrigin origin) {
    return Position(offset, OriginFromNumber(origin));
}

std::uint32_t CZipFile::GetLength() const {
    const std::uint32_t position = GetPosition();
    const std::uint32_t length = Position(0, seek_origin::end);
    Position(position, seek_origin::begin);
    return length;
}

void CZipFile::SetLength(std::uint64_t length) {
    if (length > ZipArchiveLib::k_largestNumber) CZipException::Raise(EFBIG, m_path);
    const io_result resized = m_files.resize(m_descriptor, static_cast<std::int64_t>(length));
    if (resized.value < 0) CZipException::Raise(resized.error, m_path);
}

std::uint32_t CZipFile::Read(void* buffer, std::uint32_t count) {
    const io_result got = m_files.read(m_descriptor, buffer, count);
    if (got.error != 0) CZipException::Raise(got.error, m_path);
    return static_cast<std::uint32_t>(got.value);
}

void CZipFile::Write(const void* buffer, std::uint32_t count) {
    const io_result put = m_files.write(m_descriptor, buffer, count);
    if (put.value != static_cast<std::int64_t>(count))
        CZipException::Raise(put.error != 0 ? put.error : ENOSPC, m_path);
}
