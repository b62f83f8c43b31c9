#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "zip/auto_buffer.h"
#include "zip/callbacks.h"
#include "zip/file_header.h"
#include "zip/names.h"

class CZipStorage;

/// Compares two names, as strcmp does.
using CZipCompare = int (*)(const std::string& first, const std::string& second);

namespace ZipArchiveLib {

/// By the collation of the C locale.
int CompareNames(const std::string& first, const std::string& second);
/// The same without regard to the case of ASCII letters.
int CompareNamesWithoutCase(const std::string& first, const std::string& second);

}  // namespace ZipArchiveLib

/// What the end record says, and how names are sought. A second archive object can share it.
/// Source   APPNOTE 4.3.16.
struct CZipDirectoryInfo {
    std::uint32_t endRecordPosition = 0;
    std::uint16_t thisDisk = 0;
    std::uint16_t directoryDisk = 0;
    std::uint16_t entriesOnThisDisk = 0;
    std::uint16_t totalEntries = 0;
    std::uint32_t directorySize = 0;
    std::uint32_t directoryOffset = 0;
    /// The directory stands in the file as it is here. Any change ends that.
    bool existsOnDisk = false;
    CZipAutoBuffer comment;
    bool findCaseSensitive = false;
    bool findFastEnabled = false;
    CZipCompare compare = ZipArchiveLib::CompareNamesWithoutCase;
};

/// The entries of an open archive, in the order of their places in the file.
///
/// Failure  CZipException with the archive's path: 101 for every bad structure, 110, 117, 120, 122, and what
///          the storage raises.
class CZipCentralDir {
public:
    static constexpr std::uint16_t k_notFound = 65535;
    static constexpr std::uint16_t k_mostEntries = 65535;
    /// How far from its end a file is searched for the end record: its size and the longest comment.
    static constexpr std::uint32_t k_searchDistance = 65557;

    CZipCentralDir() : m_info(std::make_shared<CZipDirectoryInfo>()) {}
    CZipCentralDir(const CZipCentralDir&) = delete;
    CZipCentralDir& operator=(const CZipCentralDir&) = delete;
    virtual ~CZipCentralDir() = default;

    /// Begins with an empty directory for this storage. All must outlive the directory.
    void Init(CZipStorage& storage, CZipCallbacks& callbacks, CZipStringSettings& settings);
    /// Uses another directory's information block from now on.
    void Share(const CZipCentralDir& other) { m_info = other.m_info; }
    /// The number of directories that use this block.
    long GetShareCount() const { return m_info.use_count(); }

    /// Reads the directory of an existing archive. `exhaustive` also takes in records beyond the declared
    /// count.
    void Read(bool exhaustive);
    /// Writes it, unless it stands in the file unchanged.
    void Write();
    void Close();

    std::uint16_t GetCount() const { return static_cast<std::uint16_t>(m_headers.size()); }
    bool IsValidIndex(std::uint16_t index) const { return index < m_headers.size(); }
    CZipFileHeader& GetHeader(std::uint16_t index) { return *m_headers[index]; }
    const CZipDirectoryInfo& GetInfo() const { return *m_info; }
    CZipDirectoryInfo& GetInfo() { return *m_info; }
    std::uint32_t GetIgnoredChecks() const { return m_ignoredChecks; }
    void SetIgnoredChecks(std::uint32_t checks) { m_ignoredChecks = checks; }

    /// The entry being read or written; null when there is none.
    CZipFileHeader* GetOpenHeader() { return m_open; }
    /// Checks the local header of an entry and goes to its data. 101.
    void OpenEntry(std::uint16_t index);
    /// With `checkDescriptor` compares the data descriptor, if there is one and the check is on; it stands
    /// behind as many bytes as have been left `unread`. 101.
    void CloseEntry(bool checkDescriptor, std::uint32_t unread = 0);

    /// Takes in a new entry and writes its local header. With an index for `replaced`, the place of that
    /// entry becomes as large as the new one's preset sizes tell.
    CZipFileHeader& AddNewEntry(const CZipFileHeader& header, std::uint16_t replaced, int level);
    /// The same for an entry whose data is known and copied.
    CZipFileHeader& AddCopiedEntry(const CZipFileHeader& header, std::uint16_t replaced);
    void CloseNewEntry(bool afterException);
    /// Drops the last entry and cuts the file where it began.
    void RemoveLastEntry();
    /// Takes the directory out of the file, so that entries can be written in its place.
    void RemoveFromDisk();
    /// The bytes that moving entries takes at a time.
    void SetCopyBufferSize(std::uint32_t size) { m_copyBufferSize = size; }

    /// Enables or drops the array for finding entries.
    void EnableFindFast(bool enable, bool caseSensitive);
    /// The entry of this name, or `k_notFound`. Builds the array when it is not there for this way to
    /// compare.
    std::uint16_t FindEntry(const std::string& name, bool caseSensitive);
    /// Takes an entry out of the array; with `shift` the indexes above it fall by one.
    void RemoveFromFindArray(std::uint16_t index, bool shift);
    /// An entry of the array for finding: a header, and its index among all.
    struct FindRecord {
        CZipFileHeader* header;
        std::uint16_t index;
    };
    std::size_t GetFindCount() const { return m_findArray.size(); }
    /// In the order of the decoded names.
    const FindRecord& GetFindRecord(std::size_t place) const { return m_findArray[place]; }

private:
    [[noreturn]] void Raise(int code) const;
    void ReadEndRecord();
    void RefuseZip64() const;
    void LocateDirectory();
    void ReadHeaders(bool exhaustive);
    bool ReadHeader(bool signatureRead);
    void ReadSurplusHeaders();
    void SortHeaders();

    std::uint64_t GetDirectorySize();
    bool TryMakeSingleVolume(std::uint64_t needed);
    void EndSingleVolume();
    void WriteHeaders();
    void WriteEndRecord();

    CZipFileHeader& Insert(const CZipFileHeader& header, std::uint16_t replaced);
    void MakeRoom(std::uint16_t replaced, std::uint64_t size);
    void MoveBytes(std::uint32_t from, std::uint32_t end, std::int64_t distance);
    void MoveBlock(std::uint32_t from, std::uint32_t size, std::int64_t distance, CZipAutoBuffer& buffer);

    void BuildFindArray(bool caseSensitive);
    void InsertIntoFindArray(std::uint16_t index);
    std::vector<FindRecord>::iterator FindPlace(const std::string& name);

    CZipStorage* m_storage = nullptr;
    CZipCallbacks* m_callbacks = nullptr;
    CZipStringSettings* m_settings = nullptr;
    CZipFileHeader* m_open = nullptr;
    std::uint32_t m_ignoredChecks = CZipChecks::ignoredAtFirst;
    std::vector<std::unique_ptr<CZipFileHeader>> m_headers;
    std::vector<FindRecord> m_findArray;
    std::shared_ptr<CZipDirectoryInfo> m_info;
    std::uint32_t m_copyBufferSize = 65536;
};
