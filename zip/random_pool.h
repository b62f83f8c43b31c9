#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

#include "platform/clock.h"
#include "platform/entropy.h"

/// Random bytes for the salts of enciphered entries: entropy, stirred with SHA-1.
///
/// Threads  not locked. Threads that write enciphered entries at the same time need a pool each.
/// Source   the random pool of the WinZip AES scheme's reference code; FIPS 180-4 for the compression
/// function.
class CZipRandomPool {
public:
    static constexpr std::size_t k_halfSize = 260;
    using Half = std::array<std::uint8_t, k_halfSize>;

    /// Both must outlive the pool. Where the entropy source gives nothing, the clock seeds a generator
    /// instead.
    CZipRandomPool(vrl_platform::entropy_source& entropy, vrl_platform::clock& clock);

    void Read(std::uint8_t* out, std::size_t size);

private:
    void Update();
    void Draw();

    vrl_platform::entropy_source& m_entropy;
    vrl_platform::clock& m_clock;
    Half m_first = {};
    Half m_second = {};
    std::size_t m_position = 0;
};
