#include "zip/zip_archive.h"

#include <algorithm>
#include <cstring>

#include "zip/aes_cryptograph.h"
#include "zip/attributes.h"
#include "zip/crc32_cryptograph.h"
#include "zip/file_helpers.h"
#include "zip/path_component.h"

CZipArchive::CZipArchive(const CZipEnvironment& environment)
    : m_environment(environment), m_storage(environment) {
    m_directory.Init(m_storage, m_callbacks, m_stringSettings);
}

bool CZipArchive::Open(const char* path, int mode, int volumeSize) {
    if (!IsClosed()) return false;
    m_storage.Open(path, mode, volumeSize);
    FinishOpening(mode);
    return true;
}

bool CZipArchive::Open(CZipAbstractFile& file, int mode) {
    if (!IsClosed()) return false;
    m_storage.Open(file, mode);
    FinishOpening(mode);
    return true;
}

void CZipArchive::FinishOpening(int mode) {
    m_password.Release();
    m_state = idle;
    m_rootPath.clear();
    m_directory.Init(m_storage, m_callbacks, m_stringSettings);
    m_directory.SetCopyBufferSize(m_copyBufferSize);
    m_systemCompatibility = ZipArchiveLib::SystemId::dos;
    if (mode != CZipStorage::openExisting && mode != CZipStorage::openReadOnly) return;
    m_directory.Read(m_exhaustiveRead);
    if (GetCount() == 0) return;
    const std::uint8_t system = m_directory.GetHeader(0).GetSystem();
    if (ZipArchiveLib::IsValidSystem(system)) m_systemCompatibility = system;
}

void CZipArchive::Close(int afterException, bool updateTimeStamp) {
    if (IsClosed() && (afterException == 0 || !m_storage.HasFile())) return;
    if (m_state == reading)
        CloseEntry(nullptr, afterException != 0);
    else if (m_state == writing)
        CloseNewEntry(afterException != 0);
    if (afterException != 1 && !IsClosed()) m_directory.Write();
    const std::int64_t newest = updateTimeStamp ? GetNewestTime() : -1;
    m_directory.Close();
    m_stringSettings.Reset();
    const std::string path = m_storage.Close(afterException != 0);
    if (newest != -1 && !path.empty()) ZipArchiveLib::SetFileTime(m_environment, path, newest);
}

std::int64_t CZipArchive::GetNewestTime() {
    std::int64_t newest = -1;
    for (std::uint16_t i = 0; i < GetCount(); ++i)
        newest = std::max(newest, m_directory.GetHeader(i).GetTime());
    return newest;
}

CZipFileHeader* CZipArchive::GetEntryHeader(std::uint16_t index) {
    if (IsClosed() || !m_directory.IsValidIndex(index)) return nullptr;
    return &m_directory.GetHeader(index);
}

std::uint16_t CZipArchive::FindEntry(const std::string& name) {
    return IsClosed() ? k_noIndex : m_directory.FindEntry(name, m_caseSensitive);
}

void CZipArchive::MakeCryptograph(std::uint8_t method) {
    if (m_cryptograph && m_cryptograph->CanHandle(method)) return;
    m_cryptograph.reset();
    if (method == CZipEncryption::none) return;
    if (CZipEncryption::IsAes(method))
        m_cryptograph = std::make_unique<CZipAesCryptograph>(method, m_environment.pool);
    else
        m_cryptograph = std::make_unique<CZipCrc32Cryptograph>(m_environment.clock);
}

void CZipArchive::MakeCompressor(std::uint16_t method) {
    if (!m_compressor || !m_compressor->SupportsMethod(method)) {
        m_compressor.reset();
        if (method == CZipFileHeader::bzip2)
            m_compressor = std::make_unique<ZipArchiveLib::CBzip2Compressor>(m_storage);
        else if (method == CZipFileHeader::stored || method == CZipFileHeader::deflated)
            m_compressor = std::make_unique<ZipArchiveLib::CDeflateCompressor>(m_storage);
    }
    if (!m_compressor || m_compressor->GetOptions() == nullptr) return;
    const auto* options = GetCompressorOptions(m_compressor->GetOptions()->GetType());
    if (options != nullptr) m_compressor->ApplyOptions(*options);
}

bool CZipArchive::SetCompressionMethod(std::uint16_t method) {
    if (m_state == writing) return false;
    if (method != CZipFileHeader::deflated && method != CZipFileHeader::bzip2) return false;
    m_compressionMethod = method;
    return true;
}

void CZipArchive::SetCompressorOptions(const CZipCompressor::COptions& options) {
    m_compressorOptions[options.GetType()] = options.Clone();
}

const CZipCompressor::COptions* CZipArchive::GetCompressorOptions(int type) const {
    const auto found = m_compressorOptions.find(type);
    return found == m_compressorOptions.end() ? nullptr : found->second.get();
}

bool CZipArchive::SetPassword(const char* password) {
    if (m_state != idle) return false;
    if (password == nullptr)
        m_password.Release();
    else
        m_password.Assign(password, static_cast<std::uint32_t>(std::strlen(password)));
    return true;
}

bool CZipArchive::SetEncryptionMethod(std::uint8_t method) {
    const bool known = method == CZipEncryption::none || method == CZipEncryption::traditional ||
                       CZipEncryption::IsAes(method);
    if (m_state != idle || !known) return false;
    m_encryptionMethod = method;
    return true;
}

void CZipArchive::SetCaseSensitive(bool caseSensitive) {
    m_caseSensitive = caseSensitive;
    m_compare = caseSensitive ? ZipArchiveLib::CompareNames : ZipArchiveLib::CompareNamesWithoutCase;
}

void CZipArchive::SetRootPath(const std::string& path) {
    m_rootPath = CZipPathComponent::WithoutTrailingSeparators(path, vrl_platform::path_separator());
}

bool CZipArchive::SetSystemCompatibility(std::uint8_t system) {
    if (m_state != idle || !ZipArchiveLib::IsValidSystem(system)) return false;
    m_systemCompatibility = system;
    return true;
}

void CZipArchive::SetCopyBufferSize(std::uint32_t size) {
    m_copyBufferSize = size;
    m_directory.SetCopyBufferSize(size);
}

void CZipArchive::SetCallback(CZipCallbackType type, CZipProgressCallback* callback) {
    if (callback == nullptr)
        m_callbacks.erase(type);
    else
        m_callbacks[type] = callback;
}

void CZipArchive::SetVolumeCallbacks(CZipVolumeCallback* spannedCallback, CZipVolumeCallback* splitCallback) {
    m_storage.SetCallbacks(spannedCallback, splitCallback);
}
