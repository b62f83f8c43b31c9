#include "zip/mem_file.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>

#include "zip/bytes.h"
#include "zip/exception.h"

using ZipArchiveLib::k_largestNumber;

CZipMemFile::CZipMemFile(void* block, std::uint32_t size, std::uint32_t growStep)
    : m_growStep(growStep),
      m_bufferSize(size),
      m_length(size),
      m_data(static_cast<std::uint8_t*>(block)),
      m_ownsData(false) {}

bool CZipMemFile::Open(const std::string& /*path*/, unsigned /*flags*/, bool /*throwOnError*/) {
    return true;
}

void CZipMemFile::Free() {
    if (m_ownsData) std::free(m_data);
    m_growStep = m_position = m_bufferSize = m_length = 0;
    m_data = nullptr;
    m_ownsData = true;
}

void CZipMemFile::Grow(std::uint64_t size) {
    if (size <= m_bufferSize) return;
    if (m_growStep == 0 || size > k_largestNumber) CZipException::Raise(CZipException::zlibMemory);
    const std::uint64_t steps = (size - m_bufferSize + m_growStep - 1) / m_growStep;
    const auto grown = std::min(m_bufferSize + steps * m_growStep, k_largestNumber);
    void* block = std::realloc(m_ownsData ? m_data : nullptr, static_cast<std::size_t>(grown));
    if (block == nullptr) CZipException::Raise(CZipException::zlibMemory);
    auto* data = static_cast<std::uint8_t*>(block);
    if (!m_ownsData) std::copy_n(m_data, m_bufferSize, data);
    // Data that is reached by seeking ahead of it must not be what the heap left there.
    std::memset(data + m_bufferSize, 0, static_cast<std::size_t>(grown - m_bufferSize));
    m_data = data;
    m_ownsData = true;
    m_bufferSize = static_cast<std::uint32_t>(grown);
}

std::uint32_t CZipMemFile::Seek(std::int64_t offset, SeekOrigin origin) {
    std::int64_t base = 0;
    if (origin == current)
        base = m_position;
    else if (origin == end)
        base = m_length;
    else if (origin != begin)
        return m_position;
    if (offset < -base || offset > static_cast<std::int64_t>(k_largestNumber) - base)
        CZipException::Raise(CZipException::zlibMemory);
    const std::int64_t position = base + offset;
    Grow(static_cast<std::uint64_t>(position));
    m_position = static_cast<std::uint32_t>(position);
    return m_position;
}

void CZipMemFile::SetLength(std::uint64_t length) {
    if (length > k_largestNumber) CZipException::Raise(CZipException::zlibMemory);
    // Intended: a length above the buffer makes room and leaves position and length where they are.
    if (length > m_bufferSize)
        Grow(length);
    else
        m_position = m_length = static_cast<std::uint32_t>(length);
}

std::uint32_t CZipMemFile::Read(void* buffer, std::uint32_t count) {
    if (m_position >= m_length) return 0;
    const std::uint32_t taken = std::min(count, m_length - m_position);
    std::copy_n(m_data + m_position, taken, static_cast<std::uint8_t*>(buffer));
    m_position += taken;
    return taken;
}

void CZipMemFile::Write(const void* buffer, std::uint32_t count) {
    if (count == 0) return;
    const std::uint64_t past = std::uint64_t{m_position} + count;
    Grow(past);
    std::copy_n(static_cast<const std::uint8_t*>(buffer), count, m_data + m_position);
    m_position = static_cast<std::uint32_t>(past);
    m_length = std::max(m_length, m_position);
}
