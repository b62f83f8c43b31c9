#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>

#include "zip/auto_buffer.h"
#include "zip/bzip2_compressor.h"
#include "zip/callbacks.h"
#include "zip/central_directory.h"
#include "zip/compressor.h"
#include "zip/cryptograph.h"
#include "zip/deflate_compressor.h"
#include "zip/encryption.h"
#include "zip/environment.h"
#include "zip/exception.h"
#include "zip/file_header.h"
#include "zip/mem_file.h"
#include "zip/storage.h"

/// What `AddFile` does on its own, as a bit mask.
namespace CZipSmartFlags {
inline constexpr unsigned plainFolders = 1;     ///< no password for folders
inline constexpr unsigned plainEmptyFiles = 2;  ///< no password for empty files
inline constexpr unsigned storeSmallFiles = 4;  ///< files under 5 bytes are stored
inline constexpr unsigned storeIfLarger = 8;    ///< a file that compression makes larger is stored
inline constexpr unsigned stageInMemory = 16;   ///< with 8: what has to be tried first is tried in memory
inline constexpr unsigned forDocuments = 7;
inline constexpr unsigned secondAttempt = 0xF000;  ///< how a file comes back that compression made larger
}  // namespace CZipSmartFlags

/// A file to be added.
struct CZipNewFile {
    std::string path;
    /// The entry's name; empty takes it from the path.
    std::string name;
    int level = -1;
    /// The whole path becomes the name, not its last part alone.
    bool fullPath = false;
    unsigned smartFlags = CZipSmartFlags::forDocuments;
    std::uint32_t bufferSize = 65536;
    /// The entry to take the place of; 65535 for none.
    std::uint16_t replacedIndex = 65535;
};

/// A ZIP archive: opened, read or written entry by entry, closed.
///
/// Reading  `Open`, then for each entry `OpenEntry`, `ReadEntry` as needed, `CloseEntry`; then `Close`.
/// Writing  `Open`, `SetCompressionMethod`, `AddFile` for each file, `Close`.
/// Failure  what the state forbids gives false; anything else raises CZipException, and then the only
/// meaningful call
///          is `Close` with its flag set. A new archive left so is not a valid one.
/// Paths    narrow, in the system's 8-bit code page, ending at the first zero byte.
/// Limits   65535 entries, 32-bit sizes and offsets; no ZIP64 (code 120).
/// Threads  one object for one thread; see CZipRandomPool for AES.
/// Source   PKWARE APPNOTE; the WinZip AES specification.
class CZipArchive {
public:
    static constexpr std::uint16_t k_noIndex = 65535;

    enum State : int { reading = -1, idle = 0, writing = 1 };

    explicit CZipArchive(const CZipEnvironment& environment = CZipEnvironment::System());
    CZipArchive(const CZipArchive&) = delete;
    CZipArchive& operator=(const CZipArchive&) = delete;
    /// An archive that is still open gets no directory.
    virtual ~CZipArchive() = default;

    /// Sees that there is the cryptograph for a method: none for 255.
    virtual void MakeCryptograph(std::uint8_t method);
    /// Sees that there is the compressor for a method; none for one that is not known.
    virtual void MakeCompressor(std::uint16_t method);

    /// Opens an archive: mode 0 existing, 1 existing and read-only, 2 new, 3 new in volumes, 4 new behind
    /// what the file holds already. False, and nothing changed, when this object is open.
    bool Open(const char* path, int mode, int volumeSize = 0);
    /// The same on a caller's file, which must outlive the opening and is not closed.
    bool Open(CZipAbstractFile& file, int mode);
    /// Writes the directory unless `afterException` is 1 (or nothing has changed), and closes.
    void Close(int afterException = 0, bool updateTimeStamp = false);
    bool IsClosed() const { return m_storage.IsClosed(); }

    std::uint16_t GetCount() const { return m_directory.GetCount(); }
    /// Null when closed or when there is no such entry. Belongs to the archive, until it is closed.
    CZipFileHeader* GetEntryHeader(std::uint16_t index);
    /// 65535 when there is none. Compares with or without regard to case, as set for the archive.
    std::uint16_t FindEntry(const std::string& name);

    /// False when closed, when there is no such entry, when one is open, while volumes are being written, and
    /// for a method that is not supported. 112 for a wrong or a missing password, 101 for a bad local header.
    bool OpenEntry(std::uint16_t index);
    /// Gives the number of bytes read; 0 at the end, for nothing to read into, and when no entry is open for
    /// reading. To learn that an entry ends where it says, ask for one byte more.
    std::uint32_t ReadEntry(void* buffer, std::uint32_t size);
    /// Ends reading. 1 all is well; 0 nothing was open; -1 not all declared bytes have been read, or there
    /// were none; -2 time and attributes could not be given to `targetPath`. 102 for another CRC, 119 for
    /// another authentication code, which an AES entry left in the middle has too. After an exception only
    /// lets go.
    int CloseEntry(const char* targetPath = nullptr, bool afterException = false);

    /// 8 or 12, for new entries. False, and nothing changed, for any other and while an entry is written.
    bool SetCompressionMethod(std::uint16_t method);
    /// Adds a file, or a folder as an entry without data. False when it cannot be found or opened.
    bool AddFile(const char* path, int level = -1, bool fullPath = false,
                 unsigned smartFlags = CZipSmartFlags::forDocuments, std::uint32_t bufferSize = 65536);
    bool AddFile(const CZipNewFile& file);

    /// Begins a new entry; with a source path, time and attributes are its. With an index to replace, the
    /// header's preset sizes must be those that the entry will have.
    bool OpenNewEntry(const CZipFileHeader& header, int level, const char* sourcePath = nullptr,
                      std::uint16_t replacedIndex = k_noIndex);
    /// False unless an entry is being written.
    bool WriteNewEntry(const void* buffer, std::uint32_t size);
    bool CloseNewEntry(bool afterException = false);
    /// Copies an entry of another archive with its data as it stands. An empty name keeps the entry's own;
    /// without `keepSystem` the entry goes over to this archive's system.
    bool CopyEntryFrom(CZipArchive& source, std::uint16_t index, const std::string& name = {},
                       std::uint16_t replacedIndex = k_noIndex, bool keepSystem = false);

    /// Null or empty clears it. False while an entry is open. Every `Open` clears it, too.
    bool SetPassword(const char* password);
    const CZipAutoBuffer& GetPassword() const { return m_password; }
    /// A number of CZipEncryption. False for any other and while an entry is open.
    bool SetEncryptionMethod(std::uint8_t method);
    std::uint8_t GetEncryptionMethod() const { return m_encryptionMethod; }
    std::uint16_t GetCompressionMethod() const { return m_compressionMethod; }
    /// Kept as a copy, for every compressor of the kind made from then on.
    void SetCompressorOptions(const CZipCompressor::COptions& options);
    /// Null when none of this type have been set.
    const CZipCompressor::COptions* GetCompressorOptions(int type) const;

    State GetState() const { return m_state; }
    bool GetRemoveDriveLetter() const { return m_removeDriveLetter; }
    void SetRemoveDriveLetter(bool remove) { m_removeDriveLetter = remove; }
    bool GetExhaustiveRead() const { return m_exhaustiveRead; }
    void SetExhaustiveRead(bool exhaustive) { m_exhaustiveRead = exhaustive; }
    bool GetCaseSensitive() const { return m_caseSensitive; }
    void SetCaseSensitive(bool caseSensitive);
    CZipCompare GetCompare() const { return m_compare; }
    bool GetAutoFlush() const { return m_autoFlush; }
    void SetAutoFlush(bool autoFlush) { m_autoFlush = autoFlush; }
    const std::string& GetRootPath() const { return m_rootPath; }
    void SetRootPath(const std::string& path);
    const std::string& GetTemporaryPath() const { return m_temporaryPath; }
    void SetTemporaryPath(const std::string& path) { m_temporaryPath = path; }
    std::uint8_t GetSystemCompatibility() const { return m_systemCompatibility; }
    /// False for a system whose attributes are not known.
    bool SetSystemCompatibility(std::uint8_t system);
    std::uint32_t GetCopyBufferSize() const { return m_copyBufferSize; }
    void SetCopyBufferSize(std::uint32_t size);
    const CZipStringSettings& GetStringSettings() const { return m_stringSettings; }
    void SetStringSettings(const CZipStringSettings& settings) { m_stringSettings = settings; }
    /// Not owned; null takes the one registered away.
    void SetCallback(CZipCallbackType type, CZipProgressCallback* callback);
    void SetVolumeCallbacks(CZipVolumeCallback* spannedCallback, CZipVolumeCallback* splitCallback);

    CZipStorage& GetStorage() { return m_storage; }
    CZipCentralDir& GetCentralDir() { return m_directory; }
    const CZipCompressor* GetCompressor() const { return m_compressor.get(); }
    const CZipCryptograph* GetCryptograph() const { return m_cryptograph.get(); }

private:
    void FinishOpening(int mode);
    bool CanBeginEntry(std::uint16_t replacedIndex) const;
    bool IsSupported(std::uint16_t method) const;
    void BeginDecoding(CZipFileHeader& header);
    void CheckCrc(const CZipFileHeader& header) const;
    bool DressTarget(const char* path, const CZipFileHeader& header) const;
    std::int64_t GetNewestTime();

    struct AddedFile;
    std::string NameFromPath(const std::string& path, bool fullPath) const;
    bool AddFolder(const CZipFileHeader& header, const CZipNewFile& file);
    bool AddContents(AddedFile& added);
    bool TakeIn(AddedFile& added);
    [[noreturn]] void StopAdding(const AddedFile& added);
    std::optional<bool> AddStaged(const AddedFile& added);
    void PrepareStaging(CZipArchive& staging) const;
    bool AddAgainStored(const AddedFile& added);
    bool LastEntryGrew();

    const CZipEnvironment& m_environment;
    bool m_removeDriveLetter = true;
    bool m_exhaustiveRead = false;
    CZipCallbacks m_callbacks;
    bool m_caseSensitive = false;
    CZipCompare m_compare = ZipArchiveLib::CompareNamesWithoutCase;
    CZipStorage m_storage;
    CZipCentralDir m_directory;
    State m_state = idle;
    bool m_autoFlush = false;
    std::string m_rootPath;
    std::string m_temporaryPath;
    CZipAutoBuffer m_password;
    std::uint8_t m_systemCompatibility = 0;
    std::uint8_t m_encryptionMethod = CZipEncryption::traditional;
    std::uint16_t m_compressionMethod = CZipFileHeader::deflated;
    CZipAutoBuffer m_copyBuffer;
    std::uint32_t m_copyBufferSize = 65536;
    CZipStringSettings m_stringSettings;
    std::map<int, std::unique_ptr<CZipCompressor::COptions>> m_compressorOptions;

protected:
    std::unique_ptr<CZipCryptograph> m_cryptograph;
    std::unique_ptr<CZipCompressor> m_compressor;
};
