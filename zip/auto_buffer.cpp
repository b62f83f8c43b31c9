#include "zip/auto_buffer.h"

#include <cstring>
#include <utility>

CZipAutoBuffer::CZipAutoBuffer(const CZipAutoBuffer& other) { Assign(other.m_data, other.m_size); }

CZipAutoBuffer::CZipAutoBuffer(CZipAutoBuffer&& other) noexcept
    : m_data(std::exchange(other.m_data, nullptr)), m_size(std::exchange(other.m_size, 0)) {}

CZipAutoBuffer& CZipAutoBuffer::operator=(const CZipAutoBuffer& other) {
    if (this != &other) Assign(other.m_data, other.m_size);
    return *this;
}

CZipAutoBuffer& CZipAutoBuffer::operator=(CZipAutoBuffer&& other) noexcept {
    std::swap(m_data, other.m_data);
    std::swap(m_size, other.m_size);
    return *this;
}

std::uint8_t* CZipAutoBuffer::Allocate(std::uint32_t size, bool zero) {
    if (size != m_size) {
        Release();
        if (size != 0) m_data = new std::uint8_t[size];
        m_size = size;
    }
    if (zero && m_size != 0) std::memset(m_data, 0, m_size);
    return m_data;
}

void CZipAutoBuffer::Release() {
    delete[] m_data;
    m_data = nullptr;
    m_size = 0;
}

void CZipAutoBuffer::Assign(const void* bytes, std::uint32_t size) {
    Allocate(size);
    if (size != 0) std::memcpy(m_data, bytes, size);
}
