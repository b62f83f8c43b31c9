#include "V2/block_file.h"

#include <algorithm>
#include <cerrno>

#include "zip/bytes.h"
#include "zip/exception.h"

namespace vrl_v2 {

using ZipArchiveLib::k_largestNumber;

bool block_file::Open(const std::string& /*path*/, unsigned /*flags*/, bool /*throwOnError*/) { return true; }

std::uint32_t block_file::Seek(std::int64_t offset, SeekOrigin origin) {
    const std::int64_t base = origin == begin ? 0 : origin == end ? GetLength() : m_position;
    if (offset < -base) CZipException::Raise(EINVAL);
    if (offset > static_cast<std::int64_t>(k_largestNumber) - base) CZipException::Raise(EFBIG);
    m_position = static_cast<std::uint32_t>(base + offset);
    return m_position;
}

void block_file::SetLength(std::uint64_t /*length*/) { CZipException::Raise(EBADF); }

std::uint32_t block_file::Read(void* buffer, std::uint32_t count) {
    const std::string_view rest = m_bytes.substr(std::min<std::size_t>(m_position, m_bytes.size()));
    const std::size_t taken = rest.copy(static_cast<char*>(buffer), count);
    m_position += static_cast<std::uint32_t>(taken);
    return static_cast<std::uint32_t>(taken);
}

void block_file::Write(const void* /*buffer*/, std::uint32_t /*count*/) { CZipException::Raise(EBADF); }

}  // namespace vrl_v2
