#pragma once

#include <array>

#include "platform/clock.h"
#include "zip/cryptograph.h"

/// Traditional encryption. Broken since 1994; for archives that others wrote or must read.
/// Source   APPNOTE 6.1.
class CZipCrc32Cryptograph : public CZipCryptograph {
public:
    /// The clock must outlive this object.
    explicit CZipCrc32Cryptograph(vrl_platform::clock& clock) : m_clock(clock) {}

    /// Checks one byte: a wrong password passes once in 256 times, and shows by the CRC then.
    bool BeginDecode(const CZipAutoBuffer& password, CZipFileHeader& header, CZipStorage& storage) override;
    /// The header's random bytes follow from the clock's second.
    void BeginEncode(const CZipAutoBuffer& password, CZipFileHeader& header, CZipStorage& storage) override;
    void Decode(std::uint8_t* buffer, std::uint32_t size) override;
    void Encode(std::uint8_t* buffer, std::uint32_t size) override;
    bool CanHandle(std::uint8_t method) const override;

private:
    void InitKeys(const CZipAutoBuffer& password);
    void UpdateKeys(std::uint8_t plain);
    std::uint8_t KeyByte() const;

    vrl_platform::clock& m_clock;
    std::array<std::uint32_t, 3> m_keys = {};
};
