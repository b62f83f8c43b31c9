#pragma once

#include <cstdint>
#include <memory>

#include "zip/auto_buffer.h"

class CZipCryptograph;
class CZipFileHeader;
class CZipStorage;

/// Turns the bytes of one entry into its compressed stream and back, and keeps CRC and sizes.
///
/// Use      Begin, then Compress or Decompress as often as needed, then End; the same object serves one
///          entry after the other.
/// Failure  CZipException: the library's code as `MapLibraryResult` tells it, 101 for a stream that does not
/// end where
///          its entry does, EFBIG for sizes that a record cannot hold, and what the storage raises.
class CZipCompressor {
public:
    /// What a caller can set for a kind of compressor.
    class COptions {
    public:
        enum Type : int { typeDeflate = 1, typeBzip2 = 2 };
        static constexpr std::uint32_t k_defaultBufferSize = 0x20000;

        virtual int GetType() const = 0;
        virtual std::unique_ptr<COptions> Clone() const = 0;
        virtual ~COptions() = default;

        /// 0 stands for the default.
        std::uint32_t bufferSize = k_defaultBufferSize;

    protected:
        COptions() = default;
        COptions(const COptions&) = default;
        COptions& operator=(const COptions&) = default;
    };

    explicit CZipCompressor(CZipStorage& storage) : m_storage(storage) {}
    CZipCompressor(const CZipCompressor&) = delete;
    CZipCompressor& operator=(const CZipCompressor&) = delete;

    virtual bool SupportsMethod(std::uint16_t method) const = 0;
    /// `header` and, if there is one, `cryptograph` must live until the end of the entry.
    virtual void BeginCompression(int level, CZipFileHeader& header, CZipCryptograph* cryptograph);
    virtual void BeginDecompression(CZipFileHeader& header, CZipCryptograph* cryptograph);
    virtual void Compress(const void* buffer, std::uint32_t size) = 0;
    /// Gives the number of bytes delivered; fewer than asked for at the end of the entry.
    virtual std::uint32_t Decompress(void* buffer, std::uint32_t size) = 0;
    /// Puts the sizes into the header. After an exception only lets go of what is held.
    virtual void EndCompression(bool afterException) = 0;
    virtual void EndDecompression(bool afterException) = 0;
    /// Null when the kind has none.
    virtual const COptions* GetOptions() const;
    virtual void ApplyOptions(const COptions& options) = 0;
    virtual ~CZipCompressor() = default;
    /// A library's result as a CZipException code.
    virtual int MapLibraryResult(int result) const = 0;
    virtual bool IsResultAcceptable(int result) const = 0;

    /// Bytes that the entry still owes its reader.
    std::uint32_t GetUncompressedLeft() const { return m_uncompressedLeft; }
    /// Bytes of the compressed stream that have not been read from the storage.
    std::uint32_t GetCompressedLeft() const { return m_compressedLeft; }
    /// Those, and what has been read and not used: behind the end of the stream there should be none.
    virtual std::uint32_t GetUnusedInput() const { return m_compressedLeft; }
    /// Of all bytes delivered so far.
    std::uint32_t GetCrc() const { return m_crc; }

    /// Raises unless the result is acceptable.
    void CheckLibraryResult(int result) const;

protected:
    void PrepareBuffer();
    /// Reads the next block of the compressed stream into the work buffer, deciphers it and gives its size; 0
    /// when there is no more.
    std::uint32_t ReadBlock();
    /// Enciphers what is pending in the work buffer and hands it to the storage.
    void WritePending();
    [[noreturn]] void Raise(int code) const;

    CZipStorage& m_storage;
    CZipAutoBuffer m_buffer;
    CZipCryptograph* m_cryptograph = nullptr;
    CZipFileHeader* m_header = nullptr;
    std::uint32_t m_uncompressedLeft = 0;
    /// While writing: the bytes pending in the work buffer.
    std::uint32_t m_compressedLeft = 0;
    std::uint32_t m_crc = 0;
};
