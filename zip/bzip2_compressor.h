#pragma once

#include <bzlib.h>

#include "zip/base_lib_compressor.h"

namespace ZipArchiveLib {

/// Method 12 through bzip2. (APPNOTE 4.4.5)
class CBzip2Compressor : public CBaseLibCompressor {
public:
    class COptions : public CBaseLibCompressor::COptions {
    public:
        int GetType() const override { return typeBzip2; }
        std::unique_ptr<CZipCompressor::COptions> Clone() const override;

        /// Half the speed for a third of the memory.
        bool smallMemoryDecompression = false;
    };

    explicit CBzip2Compressor(CZipStorage& storage) : CBaseLibCompressor(storage) {}
    ~CBzip2Compressor() override { ReleaseLibrary(); }

    bool SupportsMethod(std::uint16_t method) const override;
    /// `level` is the block size in steps of 100,000 bytes; -1 stands for 6 and 0 for 1.
    void BeginCompression(int level, CZipFileHeader& header, CZipCryptograph* cryptograph) override;
    void BeginDecompression(CZipFileHeader& header, CZipCryptograph* cryptograph) override;
    void Compress(const void* buffer, std::uint32_t size) override;
    /// 101 when something was asked for and the stream neither delivers nor ends.
    std::uint32_t Decompress(void* buffer, std::uint32_t size) override;
    void EndCompression(bool afterException) override;
    void EndDecompression(bool afterException) override;
    std::uint32_t GetUnusedInput() const override { return m_compressedLeft + m_stream.avail_in; }
    const CZipCompressor::COptions* GetOptions() const override { return &m_options; }
    void ApplyOptions(const CZipCompressor::COptions& options) override;
    int MapLibraryResult(int result) const override;
    bool IsResultAcceptable(int result) const override;

private:
    void PrepareStream();
    void EmptyOutput();
    void Run(int action);
    void FinishCompressing();
    bool DecompressStep();
    void ReleaseLibrary();

    enum class Library { closed, compressing, decompressing };

    COptions m_options;
    bz_stream m_stream = {};
    Library m_library = Library::closed;
};

}  // namespace ZipArchiveLib

/// What the library calls, where it is built without standard output, when it finds itself in a state that it
/// thinks impossible. Raises CZipException 609.
extern "C" void bz_internal_error(int number);
