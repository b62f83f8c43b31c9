#include <array>
#include <cstdio>

#include "zip/exception.h"
#include "zip/file_helpers.h"
#include "zip/path_component.h"
#include "zip/storage.h"

namespace {

constexpr unsigned k_spannedVolumeLimit = 999;
constexpr unsigned k_splitVolumeLimit = 65535;

std::string Numbered(const char* format, unsigned number) {
    std::array<char, 32> text = {};
    std::snprintf(text.data(), text.size(), format, number);
    return text.data();
}

}  // namespace

// The folder of the archive as the system takes it, never empty.
std::string CZipStorage::Folder() const {
    const char separator = vrl_platform::path_separator();
    const std::string folder = CZipPathComponent(m_archivePath, separator).GetFilePath();
    return folder.empty() ? "." : folder;
}

// The volumes lie beside the archive. The last one of a finished archive has the name that the caller gave;
// until then it is not known which one that will be.
std::string CZipStorage::VolumePath(std::uint16_t volume) const {
    const char separator = vrl_platform::path_separator();
    CZipPathComponent path(m_archivePath, separator);
    const unsigned number = volume + 1U;
    if (!m_newSegmented && volume == m_lastVolume)
        path.SetFileExtension(m_lastVolumeExtension);
    else
        path.SetFileExtension(Numbered(number < 100 ? "z%.2u" : "z%u", number));
    const bool hasFolder = !path.GetFilePath().empty();
    return hasFolder ? path.GetFullPath() : std::string(".") + separator + path.GetFullPath();
}

void CZipStorage::NextVolume(std::uint32_t needed) {
    Flush();
    if (m_bytesWritten != 0) {
        const unsigned limit = m_segmentation == spanned ? k_spannedVolumeLimit : k_splitVolumeLimit;
        if (m_currentVolume + 1U >= limit) Raise(CZipException::tooManyVolumes);
        ++m_currentVolume;
        m_bytesWritten = 0;
    }
    if (m_file != nullptr) m_file->Close();
    CreateVolume(needed);
    m_freeSpace = m_segmentation == spanned ? ZipArchiveLib::GetFreeSpace(m_environment, Folder())
                                            : static_cast<std::uint32_t>(m_volumeSize);
}

void CZipStorage::CreateVolume(std::uint32_t needed) {
    const std::string path = m_segmentation == split ? VolumePath(m_currentVolume) : m_archivePath;
    if (m_callback != nullptr)
        CreateVolumeWithCallback(path, needed);
    else if (m_segmentation == spanned)
        CZipException::Raise(CZipException::noVolumeCallback, path);
    else
        m_internalFile.Open(path, CZipFile::createNew, true);
    m_file = &m_internalFile;
}

void CZipStorage::CreateVolumeWithCallback(std::string path, std::uint32_t needed) {
    CZipVolumeCallback::Request request{CZipVolumeCallback::writeVolume, needed, path, m_currentVolume + 1};
    for (;;) {
        if (!m_callback->RequestVolume(request)) CZipException::Raise(CZipException::stoppedByCallback, path);
        if (m_segmentation == split) path = request.path;
        request.path = path;
        const std::string label = Numbered("pkback# %.3u", m_currentVolume + 1U);
        if (ZipArchiveLib::FileExists(m_environment, path) != 0 ||
            (m_segmentation == spanned && !m_environment.volumes.set_label(path, label))) {
            request.code = CZipVolumeCallback::nameExists;
        } else if (m_internalFile.Open(path, CZipFile::createNew, false)) {
            return;
        } else {
            request.code = CZipVolumeCallback::cannotCreate;
        }
    }
}

void CZipStorage::SetLastVolume(std::uint16_t volume) {
    if (volume != 0) {
        if (m_stream || volume == k_closedVolume) Raise(CZipException::badStructure);
        const bool removable =
            m_segmentation == suggestedSpanned && m_environment.volumes.is_removable(m_archivePath);
        if (removable && m_spannedCallback == nullptr) Raise(CZipException::noSpannedCallback);
        m_segmentation = removable ? spanned : split;
        m_callback = removable ? m_spannedCallback : m_splitCallback;
    } else {
        m_segmentation = none;
    }
    m_lastVolume = volume;
    m_currentVolume = volume;
}

std::string CZipStorage::AskForVolume(std::uint16_t volume) const {
    CZipVolumeCallback::Request request{CZipVolumeCallback::readVolume, 0, m_archivePath, volume + 1};
    if (m_segmentation == spanned) {
        if (m_callback == nullptr) Raise(CZipException::noVolumeCallback);
        if (!m_callback->RequestVolume(request))
            CZipException::Raise(CZipException::stoppedByCallback, request.path);
        return m_archivePath;
    }
    request.path = VolumePath(volume);
    if (volume == m_lastVolume) request.volume = -1;
    while (m_callback != nullptr) {
        if (!m_callback->RequestVolume(request))
            CZipException::Raise(CZipException::stoppedByCallback, request.path);
        if (ZipArchiveLib::FileExists(m_environment, request.path) != 0) break;
        request.code = CZipVolumeCallback::fileMissing;
    }
    return request.path;
}

void CZipStorage::ChangeVolume(std::uint16_t volume) {
    if (volume == m_currentVolume || !IsSegmented()) return;
    const std::string path = AskForVolume(volume);
    m_internalFile.Open(path, CZipFile::openReadOnly, true);
    m_currentVolume = volume;
}

void CZipStorage::NextVolumeForReading() {
    if (m_currentVolume >= m_lastVolume) Raise(CZipException::badStructure);
    ChangeVolume(static_cast<std::uint16_t>(m_currentVolume + 1));
}

void CZipStorage::FinishSplit() {
    Flush();
    const std::string written = m_file->GetFilePath();
    m_file->Close();
    if (written != m_archivePath) {
        if (ZipArchiveLib::FileExists(m_environment, m_archivePath) != 0) {
            CZipVolumeCallback::Request request{CZipVolumeCallback::nameExists, 0, m_archivePath,
                                                m_currentVolume + 1};
            if (m_callback != nullptr && !m_callback->RequestVolume(request))
                CZipException::Raise(CZipException::stoppedByCallback, m_archivePath);
            ZipArchiveLib::RemoveFile(m_environment, m_archivePath, true);
        }
        ZipArchiveLib::RenameFile(m_environment, written, m_archivePath, true);
    }
    m_newSegmented = false;
    m_lastVolume = m_currentVolume;
    if (m_currentVolume == 0) m_segmentation = none;
    m_internalFile.Open(m_archivePath, IsSegmented() ? CZipFile::openReadOnly : CZipFile::openExisting, true);
}
