#pragma once

#include <zlib.h>

#include "zip/base_lib_compressor.h"

namespace ZipArchiveLib {

/// Methods 0 (stored) and 8 (deflated) through zlib.
/// Source   RFC 1951.
class CDeflateCompressor : public CBaseLibCompressor {
public:
    class COptions : public CBaseLibCompressor::COptions {
    public:
        int GetType() const override { return typeDeflate; }
        std::unique_ptr<CZipCompressor::COptions> Clone() const override;

        /// Who asks for more than the entry declares learns, by code 101, that its stream goes on.
        bool verifyStreamEnd = true;
    };

    explicit CDeflateCompressor(CZipStorage& storage) : CBaseLibCompressor(storage) {}
    ~CDeflateCompressor() override { ReleaseLibrary(); }

    bool SupportsMethod(std::uint16_t method) const override;
    void BeginCompression(int level, CZipFileHeader& header, CZipCryptograph* cryptograph) override;
    void BeginDecompression(CZipFileHeader& header, CZipCryptograph* cryptograph) override;
    void Compress(const void* buffer, std::uint32_t size) override;
    /// A stream that ends ahead of the declared size, in its own words or because its bytes do, delivers what
    /// there is; from then on there is nothing.
    std::uint32_t Decompress(void* buffer, std::uint32_t size) override;
    void EndCompression(bool afterException) override;
    void EndDecompression(bool afterException) override;
    std::uint32_t GetUnusedInput() const override { return m_compressedLeft + m_stream.avail_in; }
    const CZipCompressor::COptions* GetOptions() const override { return &m_options; }
    void ApplyOptions(const CZipCompressor::COptions& options) override;
    int MapLibraryResult(int result) const override;
    bool IsResultAcceptable(int result) const override;

private:
    bool IsDeflated() const;
    void PrepareStream();
    void EmptyOutput();
    void Deflate(int flush);
    void StoreInput();
    void FinishDeflating();
    bool FillInput();
    void TakeStored();
    void Inflate();
    bool InflateStep();
    void FinishInput();
    bool InflateDummy();
    void LetStreamEnd();
    void CountDelivered(const std::uint8_t* from);
    void ReleaseLibrary();

    enum class Library { closed, deflating, inflating };

    COptions m_options;
    z_stream m_stream = {};
    Library m_library = Library::closed;
};

}  // namespace ZipArchiveLib
