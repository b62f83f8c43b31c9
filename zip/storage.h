#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "zip/auto_buffer.h"
#include "zip/callbacks.h"
#include "zip/environment.h"
#include "zip/file.h"

/// Where an entry lies in its volume, and what its local header says once its data descriptor is gone.
struct CZipEntryExtent {
    std::uint32_t offset;
    std::uint16_t flags;
    std::uint32_t crc;
    std::uint32_t compressedSize;
    std::uint32_t uncompressedSize;
    bool keepsDescriptor;
};

/// The bytes of an archive, on one file or on several volumes: writes are gathered, reads go over volume
/// ends.
///
/// Failure  CZipException: errno and path from the file; its own codes as told at each operation.
/// Offsets  those of the archive's records: on volume 0 they count from the end of what stands before the
/// archive.
///          What would pass 32 bits is refused with EFBIG.
class CZipStorage {
public:
    enum OpenMode : int {
        openExisting = 0,
        openReadOnly = 1,
        create = 2,
        createSegmented = 3,
        createAppend = 4
    };
    /// The last two stand only between the opening of an archive and the reading of its directory.
    enum Segmentation : int { none = 0, spanned = 1, split = 2, suggestedSpanned = 3, suggestedSplit = 4 };

    static constexpr std::uint16_t k_closedVolume = 65535;
    static constexpr int k_spannedVolumeSize = -1;
    static constexpr std::uint32_t k_descriptorSize = 16;

    explicit CZipStorage(const CZipEnvironment& environment)
        : m_environment(environment), m_internalFile(environment.files) {}
    CZipStorage(const CZipStorage&) = delete;
    CZipStorage& operator=(const CZipStorage&) = delete;
    virtual ~CZipStorage() = default;

    /// `volumeSize` 0 asks for one file or, when opening, suggests removable disks; -1 asks for such disks,
    /// any other number for volumes of that many bytes.
    /// 103 no callback for removable disks, 107 the drive is not removable, 100 no such mode.
    void Open(const std::string& path, int mode, int volumeSize);
    /// Works on a caller's file, which is not closed here and has no volumes.
    void Open(CZipAbstractFile& file, int mode);
    /// Gives the archive's path. After an exception nothing more is written.
    std::string Close(bool afterException);

    /// Reads `size` bytes. 101 when they are not there, or not on one volume though `atOnce`.
    std::uint32_t Read(void* buffer, std::uint32_t size, bool atOnce);
    /// With `atOnce` the block is not divided between volumes.
    void Write(const void* buffer, std::uint32_t size, bool atOnce);
    void Flush();
    /// Goes to another volume for what has to be on one. Nothing to do in an archive that has one only.
    void AssureFree(std::uint32_t size);

    void Seek(std::uint32_t offset, CZipAbstractFile::SeekOrigin origin = CZipAbstractFile::begin);
    /// Goes to the end of the file, with the write buffer emptied.
    void SeekToEnd();
    std::uint32_t GetPosition() const;
    /// The length of the present file, less what stands before the archive.
    std::uint32_t GetLength() const;
    /// Cuts the file at an offset and goes there.
    void Truncate(std::uint32_t offset);

    /// The position in the file of the last signature that begins in the `distance` bytes before its end or
    /// before `before`; -1 when there is none. 101 when a block cannot be read.
    std::int64_t FindSignature(const std::uint8_t (&signature)[4], std::uint32_t distance);
    std::int64_t FindSignature(const std::uint8_t (&signature)[4], std::uint32_t distance,
                               std::uint32_t before);

    /// Opens another volume for reading. Nothing happens in an archive that has one only.
    void ChangeVolume(std::uint16_t volume);
    /// Tells what the end record says: the number of the volume that it stands on. 101 when there can be
    /// none.
    void SetLastVolume(std::uint16_t volume);
    /// Turns the volume of a new archive that has only one into a plain file: without the marker at its begin
    /// and without data descriptors. `entries`, in file order, get their new offsets and flags. False, with
    /// nothing changed, when the volume cannot be mapped.
    bool RemoveDataDescriptors(std::vector<CZipEntryExtent>& entries);
    /// Gives the last volume of a new split archive the archive's name. 104 stopped by the callback, 115,
    /// 116.
    void FinishSplit();

    bool IsClosed() const { return m_currentVolume == k_closedVolume; }
    bool HasFile() const { return m_file != nullptr; }
    bool IsSegmented() const { return m_segmentation == spanned || m_segmentation == split; }
    bool IsNewSegmented() const { return m_newSegmented; }
    bool IsReadOnly() const { return m_readOnly; }
    bool IsStream() const { return m_stream; }
    int GetSegmentation() const { return m_segmentation; }
    std::uint16_t GetCurrentVolume() const { return m_currentVolume; }
    std::uint16_t GetLastVolume() const { return m_lastVolume; }
    const std::string& GetLastVolumeExtension() const { return m_lastVolumeExtension; }
    int GetVolumeSize() const { return m_volumeSize; }
    std::uint32_t GetBytesBefore() const { return m_bytesBefore; }
    void SetBytesBefore(std::uint32_t bytes) { m_bytesBefore = bytes; }
    std::uint32_t GetFreeVolumeSpace() const;
    /// Bytes on this volume, whether they wait in the write buffer or not.
    std::uint32_t GetVolumeBytes() const { return m_bytesWritten + m_bytesInBuffer; }
    std::uint32_t GetWriteBufferSize() const { return m_writeBufferSize; }
    std::uint32_t GetSearchBufferSize() const { return m_searchBufferSize; }
    /// Sizes of 1 byte at least; the write buffer's holds from the next opening on.
    void SetBufferSizes(std::uint32_t write, std::uint32_t search);
    void SetCallbacks(CZipVolumeCallback* spannedCallback, CZipVolumeCallback* splitCallback);
    /// The path of the present volume, or the archive's when no file is open.
    std::string GetFilePath() const;
    const std::string& GetArchivePath() const { return m_archivePath; }
    const CZipEnvironment& GetEnvironment() const { return m_environment; }

private:
    void Reset(const std::string& path);
    void OpenByMode(int mode, int volumeSize);
    void OpenSegmented(int volumeSize);
    void OpenFile(const std::string& path, unsigned flags);
    void BeginAppending();
    [[noreturn]] void Raise(int code) const;

    std::uint32_t ReadOn(std::uint8_t* buffer, std::uint32_t size, std::uint32_t done);
    void WriteThroughBuffer(const std::uint8_t* bytes, std::uint32_t size);
    void EmptyBuffer(const std::uint8_t* bytes, std::uint32_t size);
    bool RaiseFreeSpace(std::uint32_t needed);
    void SeekOverVolumes(std::uint32_t offset);
    std::int64_t SearchBlocks(const std::uint8_t (&signature)[4], std::int64_t end, std::int64_t stop);

    std::string VolumePath(std::uint16_t volume) const;
    std::string Folder() const;
    void NextVolume(std::uint32_t needed);
    void CreateVolume(std::uint32_t needed);
    void CreateVolumeWithCallback(std::string path, std::uint32_t needed);
    std::string AskForVolume(std::uint16_t volume) const;
    void NextVolumeForReading();

    const CZipEnvironment& m_environment;
    CZipAbstractFile* m_file = nullptr;
    int m_volumeSize = 0;
    std::string m_lastVolumeExtension = "zip";
    std::uint32_t m_bytesInBuffer = 0;
    std::uint32_t m_freeSpace = 0;
    CZipAutoBuffer m_writeBuffer;
    std::uint32_t m_bytesWritten = 0;
    bool m_newSegmented = false;
    std::uint16_t m_currentVolume = k_closedVolume;
    std::uint16_t m_lastVolume = 0;
    bool m_stream = false;
    bool m_readOnly = false;
    std::uint32_t m_bytesBefore = 0;
    std::uint32_t m_writeBufferSize = 65536;
    std::uint32_t m_searchBufferSize = 32768;
    int m_segmentation = none;
    CZipVolumeCallback* m_spannedCallback = nullptr;
    CZipVolumeCallback* m_splitCallback = nullptr;
    CZipVolumeCallback* m_callback = nullptr;
    std::string m_archivePath;
    CZipFile m_internalFile;
};
