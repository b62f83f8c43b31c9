#include "zip/storage.h"

#include <algorithm>
#include <cerrno>
#include <cstring>

#include "zip/bytes.h"
#include "zip/exception.h"
#include "zip/file_helpers.h"
#include "zip/path_component.h"
#include "zip/record_layout.h"

using ZipArchiveLib::k_largestNumber;

namespace {

constexpr std::uint64_t k_largestSignedOffset = 0x7FFFFFFF;

}  // namespace

void CZipStorage::Raise(int code) const { CZipException::Raise(code, GetFilePath()); }

std::string CZipStorage::GetFilePath() const {
    if (m_file != nullptr && !m_file->IsClosed()) return m_file->GetFilePath();
    return m_archivePath;
}

void CZipStorage::SetBufferSizes(std::uint32_t write, std::uint32_t search) {
    m_writeBufferSize = std::max(write, 1U);
    m_searchBufferSize = std::max(search, 1U);
}

void CZipStorage::SetCallbacks(CZipVolumeCallback* spannedCallback, CZipVolumeCallback* splitCallback) {
    m_spannedCallback = spannedCallback;
    m_splitCallback = splitCallback;
    if (m_segmentation == spanned) m_callback = spannedCallback;
    if (m_segmentation == split) m_callback = splitCallback;
}

void CZipStorage::Reset(const std::string& path) {
    m_writeBuffer.Allocate(m_writeBufferSize);
    m_file = nullptr;
    m_volumeSize = 0;
    m_bytesInBuffer = m_freeSpace = m_bytesWritten = m_bytesBefore = 0;
    m_newSegmented = m_stream = m_readOnly = false;
    m_currentVolume = k_closedVolume;
    m_lastVolume = 0;
    m_segmentation = none;
    m_callback = nullptr;
    m_archivePath = path;
    m_lastVolumeExtension = CZipPathComponent(path, vrl_platform::path_separator()).GetFileExtension();
}

void CZipStorage::OpenFile(const std::string& path, unsigned flags) {
    m_internalFile.Open(path, flags, true);
    m_file = &m_internalFile;
}

void CZipStorage::Open(const std::string& path, int mode, int volumeSize) {
    Reset(path);
    try {
        OpenByMode(mode, volumeSize);
    } catch (...) {
        m_currentVolume = k_closedVolume;
        throw;
    }
}

void CZipStorage::OpenByMode(int mode, int volumeSize) {
    switch (mode) {
        case openExisting:
        case openReadOnly:
            m_readOnly = mode == openReadOnly;
            OpenFile(m_archivePath, m_readOnly ? CZipFile::openReadOnly : CZipFile::openExisting);
            m_segmentation = volumeSize == 0 ? suggestedSpanned : suggestedSplit;
            break;
        case create:
            OpenFile(m_archivePath, CZipFile::createNew);
            m_currentVolume = 0;
            break;
        case createSegmented:
            OpenSegmented(volumeSize);
            break;
        case createAppend:
            OpenFile(m_archivePath, CZipFile::openExisting);
            BeginAppending();
            break;
        default:
            Raise(CZipException::generic);
    }
}

void CZipStorage::Open(CZipAbstractFile& file, int mode) {
    Reset(file.GetFilePath());
    m_file = &file;
    m_stream = true;
    switch (mode) {
        case openExisting:
        case openReadOnly:
            m_readOnly = mode == openReadOnly;
            break;
        case create:
            m_file->SetLength(0);
            m_currentVolume = 0;
            break;
        case createAppend:
            BeginAppending();
            break;
        default:
            Raise(CZipException::generic);
    }
}

void CZipStorage::BeginAppending() {
    m_bytesBefore = m_file->SeekToEnd();
    m_currentVolume = 0;
}

void CZipStorage::OpenSegmented(int volumeSize) {
    m_volumeSize = volumeSize;
    m_segmentation = volumeSize == k_spannedVolumeSize ? spanned : split;
    m_callback = m_segmentation == spanned ? m_spannedCallback : m_splitCallback;
    if (m_segmentation == spanned) {
        if (m_callback == nullptr) Raise(CZipException::noSpannedCallback);
        if (!m_environment.volumes.is_removable(m_archivePath)) Raise(CZipException::notRemovable);
    }
    m_currentVolume = 0;
    m_newSegmented = true;
    NextVolume(sizeof k_segmentSignature);
    AssureFree(sizeof k_segmentSignature);
    Write(k_segmentSignature, sizeof k_segmentSignature, true);
}

std::string CZipStorage::Close(bool afterException) {
    // Whatever fails below, afterwards nothing is open and nothing is held.
    struct Ending {
        CZipStorage& storage;
        ~Ending() {
            storage.m_writeBuffer.Release();
            storage.m_segmentation = none;
            storage.m_currentVolume = k_closedVolume;
            storage.m_file = nullptr;
            storage.m_bytesBefore = storage.m_bytesInBuffer = 0;
            storage.m_newSegmented = false;
        }
    };
    if (m_file == nullptr) return m_archivePath;
    if (!afterException) {
        Flush();
        if (m_newSegmented && m_segmentation == split) FinishSplit();
    }
    const Ending ending{*this};
    std::string path = m_stream ? m_file->GetFilePath() : m_archivePath;
    if (m_stream) return path;
    try {
        if (!afterException && !m_readOnly && (!IsSegmented() || m_newSegmented)) m_file->Flush();
    } catch (...) {
        m_internalFile.Abandon();
        throw;
    }
    m_file->Close();
    return path;
}

std::uint32_t CZipStorage::Read(void* buffer, std::uint32_t size, bool atOnce) {
    if (size == 0) return 0;
    std::uint32_t got = m_file->Read(buffer, size);
    if (got == 0) {
        if (!IsSegmented()) Raise(CZipException::badStructure);
        NextVolumeForReading();
        got = m_file->Read(buffer, size);
        if (got == 0) Raise(CZipException::badStructure);
    }
    if (got == size) return size;
    if (atOnce || !IsSegmented()) Raise(CZipException::badStructure);
    return ReadOn(static_cast<std::uint8_t*>(buffer), size, got);
}

std::uint32_t CZipStorage::ReadOn(std::uint8_t* buffer, std::uint32_t size, std::uint32_t done) {
    while (done < size) {
        NextVolumeForReading();
        const std::uint32_t got = m_file->Read(buffer + done, size - done);
        if (got == 0) Raise(CZipException::badStructure);
        done += got;
    }
    return done;
}

void CZipStorage::Write(const void* buffer, std::uint32_t size, bool atOnce) {
    const auto* bytes = static_cast<const std::uint8_t*>(buffer);
    if (!IsSegmented()) return WriteThroughBuffer(bytes, size);
    while (size != 0) {
        AssureFree(atOnce ? size : 1);
        const std::uint32_t taken = std::min(size, GetFreeVolumeSpace());
        WriteThroughBuffer(bytes, taken);
        bytes += taken;
        size -= taken;
    }
}

void CZipStorage::WriteThroughBuffer(const std::uint8_t* bytes, std::uint32_t size) {
    while (size != 0) {
        if (m_bytesInBuffer == m_writeBuffer.GetSize()) Flush();
        const std::uint32_t taken = std::min(size, m_writeBuffer.GetSize() - m_bytesInBuffer);
        std::memcpy(m_writeBuffer.GetBuffer() + m_bytesInBuffer, bytes, taken);
        m_bytesInBuffer += taken;
        bytes += taken;
        size -= taken;
    }
}

void CZipStorage::Flush() {
    if (m_bytesInBuffer == 0) return;
    if (std::uint64_t{m_file->GetPosition()} + m_bytesInBuffer > k_largestNumber) Raise(EFBIG);
    m_file->Write(m_writeBuffer.GetBuffer(), m_bytesInBuffer);
    if (IsSegmented()) m_bytesWritten += m_bytesInBuffer;
    m_bytesInBuffer = 0;
    if (m_segmentation == spanned) m_freeSpace = ZipArchiveLib::GetFreeSpace(m_environment, Folder());
}

std::uint32_t CZipStorage::GetFreeVolumeSpace() const {
    const std::uint64_t used =
        std::uint64_t{m_bytesInBuffer} + (m_segmentation == split ? m_bytesWritten : 0);
    return used >= m_freeSpace ? 0 : static_cast<std::uint32_t>(m_freeSpace - used);
}

void CZipStorage::AssureFree(std::uint32_t size) {
    if (!IsSegmented()) return;
    while (GetFreeVolumeSpace() < size)
        if (!RaiseFreeSpace(size)) NextVolume(size);
}

// A split volume without any bytes takes whatever must come first, however small the volumes are to be.
bool CZipStorage::RaiseFreeSpace(std::uint32_t needed) {
    if (m_segmentation != split || !m_newSegmented || GetVolumeBytes() != 0) return false;
    m_freeSpace = needed;
    return true;
}

std::uint32_t CZipStorage::GetPosition() const {
    const std::uint64_t position = std::uint64_t{m_file->GetPosition()} + m_bytesInBuffer;
    if (position > k_largestNumber) Raise(EFBIG);
    return static_cast<std::uint32_t>(position - (m_currentVolume == 0 ? m_bytesBefore : 0));
}

std::uint32_t CZipStorage::GetLength() const {
    return m_file->GetLength() - (m_currentVolume == 0 ? m_bytesBefore : 0);
}

void CZipStorage::SeekToEnd() {
    Flush();
    m_file->SeekToEnd();
}

void CZipStorage::Truncate(std::uint32_t offset) {
    Flush();
    m_file->SetLength(std::uint64_t{offset} + m_bytesBefore);
    Seek(offset);
}

void CZipStorage::Seek(std::uint32_t offset, CZipAbstractFile::SeekOrigin origin) {
    if (IsSegmented() && !m_newSegmented && offset != 0 && origin != CZipAbstractFile::end) {
        if (origin == CZipAbstractFile::begin) m_file->SeekToBegin();
        return SeekOverVolumes(offset);
    }
    std::uint64_t target = offset;
    // A memory file would grow up to wherever a damaged record points.
    if (m_stream && origin != CZipAbstractFile::end && offset > m_file->GetLength())
        Raise(CZipException::badStructure);
    if (origin == CZipAbstractFile::begin && m_currentVolume == 0) target += m_bytesBefore;
    // No position is told to the file as a number that a signed 32-bit offset cannot hold: it is taken from
    // the other end then.
    if (origin == CZipAbstractFile::begin && target > k_largestSignedOffset) {
        m_file->Seek(static_cast<std::int64_t>(target) - m_file->GetLength(), CZipAbstractFile::end);
        return;
    }
    m_file->Seek(static_cast<std::int64_t>(target), origin);
}

void CZipStorage::SeekOverVolumes(std::uint32_t offset) {
    std::uint32_t left = m_file->GetLength() - std::min(m_file->GetPosition(), m_file->GetLength());
    while (offset > left) {
        offset -= left;
        NextVolumeForReading();
        left = m_file->GetLength();
    }
    m_file->Seek(offset, CZipAbstractFile::current);
}
