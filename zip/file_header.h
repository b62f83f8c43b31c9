#pragma once

#include <cstdint>
#include <memory>
#include <string>

#include "zip/auto_buffer.h"
#include "zip/encryption.h"
#include "zip/extra_field.h"
#include "zip/names.h"

class CZipStorage;

/// Checks on opening and reading that a caller can switch off, as a bit mask of those switched off.
namespace CZipChecks {
inline constexpr std::uint32_t crc = 0x01;          ///< CRC of the extracted data
inline constexpr std::uint32_t method = 0x02;       ///< local against central method
inline constexpr std::uint32_t sizes = 0x04;        ///< local against central sizes
inline constexpr std::uint32_t localCrc = 0x08;     ///< local against central CRC
inline constexpr std::uint32_t flags = 0x10;        ///< local against central low four flag bits
inline constexpr std::uint32_t descriptor = 0x100;  ///< data descriptor against central record
inline constexpr std::uint32_t ignoredAtFirst = descriptor;
}  // namespace CZipChecks

/// One entry of an archive: its records in the file, and its properties.
///
/// Sizes    of 32 bits; there is no ZIP64.
/// Names    in the file with slashes, here with backslashes, in the system's code page.
/// Failure  CZipException, with the codes told at each operation; reading and checking tell by false.
/// Source   APPNOTE 4.3 and 4.4; the WinZip AES specification for record 0x9901.
class CZipFileHeader {
public:
    static constexpr std::uint16_t stored = 0;
    static constexpr std::uint16_t deflated = 8;
    static constexpr std::uint16_t bzip2 = 12;
    static constexpr std::uint16_t wireAes = 99;
    /// AES entries shorter than this are AE-2: their CRC would tell too much about them.
    static constexpr std::uint32_t aesVersion2Below = 20;

    CZipFileHeader() = default;
    CZipFileHeader(const CZipFileHeader& other);
    CZipFileHeader(CZipFileHeader&&) = default;
    CZipFileHeader& operator=(const CZipFileHeader& other);
    CZipFileHeader& operator=(CZipFileHeader&&) = default;
    virtual ~CZipFileHeader() = default;

    std::uint8_t GetMadeByVersion() const { return m_madeByVersion; }
    std::uint8_t GetSystem() const { return m_system; }
    std::uint16_t GetVersionNeeded() const { return m_versionNeeded; }
    std::uint16_t GetFlags() const { return m_flags; }
    std::uint16_t GetMethod() const { return m_method; }
    std::uint16_t GetModificationTime() const { return m_modificationTime; }
    std::uint16_t GetModificationDate() const { return m_modificationDate; }
    std::uint32_t GetCrc() const { return m_crc; }
    std::uint32_t GetCompressedSize() const { return m_compressedSize; }
    std::uint32_t GetUncompressedSize() const { return m_uncompressedSize; }
    std::uint16_t GetDiskStart() const { return m_diskStart; }
    std::uint16_t GetInternalAttributes() const { return m_internalAttributes; }
    std::uint32_t GetLocalCompressedSize() const { return m_localCompressedSize; }
    std::uint32_t GetLocalUncompressedSize() const { return m_localUncompressedSize; }
    std::uint32_t GetOffset() const { return m_offset; }
    const CZipExtraField& GetLocalExtra() const { return m_localExtra; }
    const CZipExtraField& GetCentralExtra() const { return m_centralExtra; }
    CZipExtraField& GetLocalExtra() { return m_localExtra; }
    CZipExtraField& GetCentralExtra() { return m_centralExtra; }
    std::uint32_t GetExternalAttributes() const { return m_externalAttributes; }
    std::uint16_t GetLocalFileNameSize() const { return m_localFileNameSize; }
    std::uint8_t GetEncryptionMethod() const { return m_encryptionMethod; }
    bool IsAesVersion2() const { return m_aesVersion2; }
    bool IsNameInExtra() const { return m_nameInExtra; }
    std::uint32_t GetNameCodePage() const { return m_nameCodePage; }
    std::uint32_t GetCommentCodePage() const { return m_commentCodePage; }
    const CZipAutoBuffer& GetStoredComment() const { return m_comment; }
    /// Empty once the name has been decoded; written again when the header is.
    const CZipAutoBuffer& GetStoredName() const { return m_storedName; }

    bool IsEncrypted() const { return m_encryptionMethod != CZipEncryption::none; }
    bool IsAes() const { return CZipEncryption::IsAes(m_encryptionMethod); }
    bool HasDataDescriptor() const;
    /// The compressed data alone, without what encryption adds. CZipException 101, with this path, when there
    /// is less than that.
    std::uint32_t GetDataSize(const std::string& archivePath = {}) const;
    /// The CRC as it stands in records: 0 under AE-2.
    std::uint32_t GetStoredCrc() const { return m_aesVersion2 ? 0 : m_crc; }

    void SetFlags(std::uint16_t flags) { m_flags = flags; }
    void SetMethod(std::uint16_t method) { m_method = method; }
    void SetCrc(std::uint32_t crc) { m_crc = crc; }
    void SetCompressedSize(std::uint32_t size) { m_compressedSize = size; }
    void SetUncompressedSize(std::uint32_t size) { m_uncompressedSize = size; }
    void SetPlace(std::uint16_t disk, std::uint32_t offset);
    void SetSystem(std::uint8_t system) { m_system = system; }
    void SetEncryptionMethod(std::uint8_t method) { m_encryptionMethod = method; }
    void SetStrings(const CZipStringSettings& settings);

    /// The decoded name. The stored bytes are given up for it.
    const std::string& GetFileName() const;
    void SetFileName(const std::string& name);
    /// The comment in the system's code page.
    std::string GetComment() const;
    void SetComment(const std::string& comment);

    /// Seconds since 1970, from local time of two seconds' precision; -1 when it cannot be told.
    std::int64_t GetTime() const;
    void SetTime(std::int64_t time);

    /// Attributes in the numbering of DOS. An entry of a system that the engine does not know is a folder
    /// (0x10) if its name ends in a separator, else a file (0x20).
    std::uint32_t GetAttributes() const;
    /// 117 when the header's system is not known.
    void SetAttributes(std::uint32_t attributes);
    bool IsDirectory() const;
    /// Gives the entry to another system, with its attributes converted. 117 when that one is not known.
    void ConvertToSystem(std::uint8_t system);

    /// Reads a central record, its signature included unless `signatureRead`. False for a bad one.
    [[nodiscard]] bool ReadCentral(CZipStorage& storage, const CZipStringSettings& settings,
                                   bool signatureRead);
    /// Reads the local header and compares. False when there is none or the two contradict each other; the
    /// storage is then anywhere, else at the entry's data.
    [[nodiscard]] bool CheckLocal(CZipStorage& storage, std::uint32_t ignoredChecks);
    /// Reads the data descriptor from here. False when it contradicts the central record.
    [[nodiscard]] bool CheckDescriptor(CZipStorage& storage) const;

    /// Gets a new entry ready: flags for `level`, version, no sizes and no CRC. The sizes that were preset go
    /// into the local header that is written next.
    void Prepare(int level, bool segmented);
    /// Gets a copied entry ready, whose data is known.
    void PrepareCopy(bool segmented);
    /// 110 when the name or the extra field is too long.
    void WriteLocal(CZipStorage& storage);
    /// Writes CRC and sizes into the local header and comes back.
    void UpdateLocal(CZipStorage& storage);
    void WriteDescriptor(CZipStorage& storage) const;
    /// 110 when the name, the comment or the extra field is too long.
    void WriteCentral(CZipStorage& storage);

    /// As written to this storage. 110 as above, from both.
    std::uint32_t GetLocalRecordSize(const CZipStorage& storage);
    std::uint32_t GetCentralRecordSize(const CZipStorage& storage);
    std::uint32_t GetDescriptorSize(bool segmented) const;

private:
    struct AesRecord;

    void StoreName();
    std::uint16_t GetWireMethod() const { return IsAes() ? wireAes : m_method; }
    bool NeedsNamesRecord() const;
    bool ReadNamesRecord();
    void WriteNamesRecord();
    static bool ParseAesRecord(const CZipExtraRecord& record, AesRecord& out);
    void ReadCentralAesRecord();
    void WriteAesRecord(CZipExtraField& extra) const;
    bool CheckLocalAesRecord(std::uint16_t localFlags, std::uint16_t& localMethod);
    bool CheckLocalNumbers(const std::uint8_t* record, std::uint32_t ignoredChecks);
    void SetVersionNeeded();
    void AddCentralRecords();
    void DropCentralRecords();

    std::uint8_t m_madeByVersion = 0;
    std::uint8_t m_system = 0;
    std::uint16_t m_versionNeeded = 0;
    std::uint16_t m_flags = 0;
    std::uint16_t m_method = deflated;
    std::uint16_t m_modificationTime = 0;
    std::uint16_t m_modificationDate = 0;
    std::uint32_t m_crc = 0;
    std::uint32_t m_compressedSize = 0;
    std::uint32_t m_uncompressedSize = 0;
    std::uint16_t m_diskStart = 0;
    std::uint16_t m_internalAttributes = 0;
    std::uint32_t m_localCompressedSize = 0;
    std::uint32_t m_localUncompressedSize = 0;
    std::uint32_t m_offset = 0;
    CZipExtraField m_localExtra;
    CZipExtraField m_centralExtra;
    std::uint32_t m_externalAttributes = 0;
    std::uint16_t m_localFileNameSize = 0;
    std::uint8_t m_encryptionMethod = CZipEncryption::none;
    bool m_aesVersion2 = false;
    mutable CZipAutoBuffer m_storedName;
    mutable std::unique_ptr<std::string> m_fileName;
    bool m_nameInExtra = false;
    std::uint32_t m_nameCodePage = CZipStringSettings::defaultNameCodePage;
    std::uint32_t m_commentCodePage = 0;
    CZipAutoBuffer m_comment;
};
