#include "V2/descriptor_file.h"

#include <cerrno>

#include "zip/bytes.h"
#include "zip/exception.h"

namespace vrl_v2 {

using vrl_platform::io_result;
using vrl_platform::seek_origin;

bool descriptor_file::Open(const std::string& /*path*/, unsigned /*flags*/, bool /*throwOnError*/) {
    return true;
}

void descriptor_file::raise_call(int error) const {
    if (m_call_error == 0) m_call_error = error;
    CZipException::Raise(error);
}

std::uint32_t descriptor_file::move(std::int64_t offset, seek_origin origin) const {
    const io_result moved = m_files.seek(m_descriptor, offset, origin);
    if (moved.value < 0) raise_call(moved.error);
    if (static_cast<std::uint64_t>(moved.value) > ZipArchiveLib::k_largestNumber) CZipException::Raise(EFBIG);
    return static_cast<std::uint32_t>(moved.value);
}

std::uint32_t descriptor_file::GetPosition() const { return move(0, seek_origin::current); }

std::uint32_t descriptor_file::Seek(std::int64_t offset, SeekOrigin origin) {
    if (origin == begin) return move(offset, seek_origin::begin);
    return move(offset, origin == end ? seek_origin::end : seek_origin::current);
}

std::uint32_t descriptor_file::GetLength() const {
    const std::uint32_t position = GetPosition();
    const std::uint32_t length = move(0, seek_origin::end);
    move(position, seek_origin::begin);
    return length;
}

void descriptor_file::SetLength(std::uint64_t length) {
    if (length > ZipArchiveLib::k_largestNumber) CZipException::Raise(EFBIG);
    const io_result resized = m_files.resize(m_descriptor, static_cast<std::int64_t>(length));
    if (resized.value < 0) raise_call(resized.error);
}

std::uint32_t descriptor_file::Read(void* buffer, std::uint32_t count) {
    const io_result got = m_files.read(m_descriptor, buffer, count);
    if (got.error != 0) raise_call(got.error);
    return static_cast<std::uint32_t>(got.value);
}

void descriptor_file::Write(const void* buffer, std::uint32_t count) {
    const io_result put = m_files.write(m_descriptor, buffer, count);
    if (put.value != static_cast<std::int64_t>(count)) raise_call(put.error != 0 ? put.error : ENOSPC);
}

}  // namespace vrl_v2
