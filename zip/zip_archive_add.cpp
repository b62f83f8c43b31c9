#include <algorithm>

#include "platform/file_names.h"
#include "zip/file.h"
#include "zip/file_helpers.h"
#include "zip/path_component.h"
#include "zip/zip_archive.h"

namespace {

constexpr std::uint32_t k_smallFile = 5;

// Puts a password aside for as long as this lives.
class PasswordAside {
public:
    PasswordAside(CZipAutoBuffer& password, bool wanted) : m_password(password), m_wanted(wanted) {
        if (m_wanted) std::swap(m_password, m_aside);
    }
    PasswordAside(const PasswordAside&) = delete;
    PasswordAside& operator=(const PasswordAside&) = delete;
    ~PasswordAside() {
        if (m_wanted) std::swap(m_password, m_aside);
    }

private:
    CZipAutoBuffer& m_password;
    CZipAutoBuffer m_aside;
    bool m_wanted;
};

// Removes a temporary file when nobody needs it any more.
class TemporaryFile {
public:
    TemporaryFile(const CZipEnvironment& environment, std::string path)
        : m_environment(environment), m_path(std::move(path)) {}
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;
    ~TemporaryFile() { ZipArchiveLib::RemoveFile(m_environment, m_path, false); }

    const std::string& GetPath() const { return m_path; }

private:
    const CZipEnvironment& m_environment;
    std::string m_path;
};

}  // namespace

struct CZipArchive::AddedFile {
    CZipNewFile file;
    CZipFileHeader header;
    std::optional<std::uint32_t> size;

    bool IsReplacement() const { return file.replacedIndex != k_noIndex; }
    /// Whether it is to be stored when compression makes it larger.
    bool ChecksEffect() const {
        return (file.smartFlags & CZipSmartFlags::storeIfLarger) != 0 && file.level != 0 && size;
    }
};

bool CZipArchive::AddFile(const char* path, int level, bool fullPath, unsigned smartFlags,
                          std::uint32_t bufferSize) {
    CZipNewFile file;
    file.path = path;
    file.level = level;
    file.fullPath = fullPath;
    file.smartFlags = smartFlags;
    file.bufferSize = bufferSize;
    return AddFile(file);
}

bool CZipArchive::AddFile(const CZipNewFile& given) {
    if (m_copyBufferSize == 0 || given.bufferSize == 0 || !CanBeginEntry(given.replacedIndex)) return false;
    AddedFile added{given, {}, std::nullopt};
    std::string& path = added.file.path;
    path = CZipPathComponent::WithoutTrailingSeparators(path, vrl_platform::path_separator());
    if (path.empty()) return false;
    const auto attributes = m_environment.names.attributes(path);
    if (!attributes) return false;

    CZipFileHeader& header = added.header;
    header.SetSystem(m_systemCompatibility);
    header.SetAttributes(*attributes);
    header.SetTime(ZipArchiveLib::GetFileTime(m_environment, path).time);
    std::string name = given.name.empty() ? NameFromPath(path, given.fullPath) : given.name;
    const bool isFolder = (*attributes & vrl_platform::file_attribute::folder) != 0;
    if (isFolder && name.back() != '\\') name += '\\';
    header.SetFileName(name);
    return isFolder ? AddFolder(header, added.file) : AddContents(added);
}

std::string CZipArchive::NameFromPath(const std::string& path, bool fullPath) const {
    const char separator = vrl_platform::path_separator();
    const CZipPathComponent parts(path, separator);
    std::string name = parts.GetFileName();
    if (fullPath) {
        name = m_removeDriveLetter ? parts.GetNoDrive() : parts.GetFullPath();
    } else if (!m_rootPath.empty() && path.size() > m_rootPath.size() + 1 &&
               path[m_rootPath.size()] == separator &&
               m_compare(path.substr(0, m_rootPath.size()), m_rootPath) == 0) {
        name = path.substr(m_rootPath.size() + 1);
    }
    std::replace(name.begin(), name.end(), separator, CZipPathComponent::definedSeparator);
    return name;
}

bool CZipArchive::AddFolder(const CZipFileHeader& header, const CZipNewFile& file) {
    const PasswordAside aside(m_password, (file.smartFlags & CZipSmartFlags::plainFolders) != 0);
    return OpenNewEntry(header, file.level, nullptr, file.replacedIndex) && CloseNewEntry(false);
}

bool CZipArchive::AddContents(AddedFile& added) {
    CZipNewFile& file = added.file;
    added.size = ZipArchiveLib::GetFileSize(m_environment, file.path);
    const bool isEmpty = added.size && *added.size == 0;
    const PasswordAside aside(m_password,
                              isEmpty && (file.smartFlags & CZipSmartFlags::plainEmptyFiles) != 0);
    const bool storesSmall = (file.smartFlags & CZipSmartFlags::storeSmallFiles) != 0;
    if (storesSmall && file.level != 0 && added.size && *added.size < k_smallFile) file.level = 0;

    if ((added.ChecksEffect() && m_storage.IsSegmented()) || (added.IsReplacement() && file.level != 0)) {
        if (const auto staged = AddStaged(added)) return *staged;
        // What takes a place of its own size must have a size that is known beforehand.
        if (added.IsReplacement()) file.level = 0;
    }
    if (!TakeIn(added)) return false;
    const bool mayRepeat = added.ChecksEffect() && !m_storage.IsSegmented() && !added.IsReplacement();
    if (!mayRepeat || !LastEntryGrew()) return true;
    m_directory.RemoveLastEntry();
    return AddAgainStored(added);
}

bool CZipArchive::TakeIn(AddedFile& added) {
    CZipFile source(m_environment.files);
    if (!source.Open(added.file.path, CZipFile::openSource, false)) return false;
    const std::uint32_t length = source.GetLength();
    added.header.SetUncompressedSize(length);
    added.header.SetCompressedSize(added.file.level == 0 ? length : 0);
    if (!OpenNewEntry(added.header, added.file.level, nullptr, added.file.replacedIndex)) return false;

    const auto callback = m_callbacks.find(CZipCallbackType::add);
    CZipAutoBuffer buffer(added.file.bufferSize);
    std::uint64_t total = 0;
    std::uint32_t got = 0;
    do {
        got = source.Read(buffer.GetBuffer(), buffer.GetSize());
        total += got;
        // The place that was made for it in the middle of the archive has no room for more.
        if (added.IsReplacement() && total > length)
            CZipException::Raise(CZipException::generic, added.file.path);
        if (got == 0) break;
        WriteNewEntry(buffer.GetBuffer(), got);
        if (callback != m_callbacks.end() && !callback->second->Advance(got)) StopAdding(added);
    } while (got == buffer.GetSize());
    if (added.IsReplacement() && total != length)
        CZipException::Raise(CZipException::generic, added.file.path);
    return CloseNewEntry(false);
}

void CZipArchive::StopAdding(const AddedFile& added) {
    CloseNewEntry(true);
    const bool canUndo = !m_storage.IsSegmented() && !added.IsReplacement();
    if (canUndo) m_directory.RemoveLastEntry();
    CZipException::Raise(canUndo ? CZipException::stoppedCleanly : CZipException::stoppedUnfinished,
                         m_storage.GetFilePath());
}

bool CZipArchive::LastEntryGrew() {
    const CZipFileHeader& last = m_directory.GetHeader(static_cast<std::uint16_t>(GetCount() - 1));
    return last.GetDataSize() > last.GetUncompressedSize();
}

bool CZipArchive::AddAgainStored(const AddedFile& added) {
    CZipNewFile file = added.file;
    file.level = 0;
    file.smartFlags = CZipSmartFlags::secondAttempt;
    return AddFile(file);
}

void CZipArchive::PrepareStaging(CZipArchive& staging) const {
    staging.m_password = m_password;
    staging.m_encryptionMethod = m_encryptionMethod;
    staging.m_compressionMethod = m_compressionMethod;
    for (const auto& [type, options] : m_compressorOptions) staging.SetCompressorOptions(*options);
    staging.m_rootPath = m_rootPath;
    staging.m_stringSettings = m_stringSettings;
    staging.m_systemCompatibility = m_systemCompatibility;
    staging.m_removeDriveLetter = m_removeDriveLetter;
    staging.m_compare = m_compare;
}

std::optional<bool> CZipArchive::AddStaged(const AddedFile& added) {
    constexpr unsigned checksAndMemory = CZipSmartFlags::storeIfLarger | CZipSmartFlags::stageInMemory;
    CZipMemFile memory;
    std::optional<TemporaryFile> temporary;
    CZipArchive staging(m_environment);
    if ((added.file.smartFlags & checksAndMemory) == checksAndMemory) {
        staging.Open(memory, CZipStorage::create);
    } else {
        auto path = ZipArchiveLib::MakeTemporaryFile(m_environment, m_temporaryPath, added.size.value_or(0));
        if (!path) return std::nullopt;
        temporary.emplace(m_environment, std::move(*path));
        staging.Open(temporary->GetPath().c_str(), CZipStorage::create);
    }
    PrepareStaging(staging);
    CZipNewFile file = added.file;
    file.replacedIndex = k_noIndex;
    file.smartFlags &= ~checksAndMemory;
    if (!staging.AddFile(file)) return false;
    if (added.ChecksEffect() && staging.LastEntryGrew()) return AddAgainStored(added);
    const bool copied = CopyEntryFrom(staging, 0, {}, added.file.replacedIndex, true);
    staging.Close(1);
    return copied;
}
