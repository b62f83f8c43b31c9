#pragma once

#include <cstdint>

#include "zip/auto_buffer.h"

class CZipFileHeader;
class CZipStorage;

/// What enciphers and deciphers one entry on its way to and from the storage.
class CZipCryptograph {
public:
    CZipCryptograph() = default;
    CZipCryptograph(const CZipCryptograph&) = delete;
    CZipCryptograph& operator=(const CZipCryptograph&) = delete;

    /// Reads the encryption header. False for a wrong password, as far as that can be told here.
    virtual bool BeginDecode(const CZipAutoBuffer& password, CZipFileHeader& header,
                             CZipStorage& storage) = 0;
    /// Writes the encryption header and adds it to the entry's compressed size.
    virtual void BeginEncode(const CZipAutoBuffer& password, CZipFileHeader& header,
                             CZipStorage& storage) = 0;
    /// In place, as is `Encode`.
    virtual void Decode(std::uint8_t* buffer, std::uint32_t size) = 0;
    virtual void Encode(std::uint8_t* buffer, std::uint32_t size) = 0;
    virtual void EndDecode(CZipFileHeader& header, CZipStorage& storage);
    virtual void EndEncode(CZipFileHeader& header, CZipStorage& storage);
    virtual bool CanHandle(std::uint8_t method) const;
    virtual ~CZipCryptograph() = default;
};
