#pragma once

#include <cstdint>

namespace vrl_platform {

/// The `rand` of the Windows C runtime, with its state in an object instead of in the process.
///
/// Everywhere the same sequence for the same seed, and a host program's own `rand` is left alone.
/// For headers that must differ from file to file; nothing secret may rest on it.
class c_random {
public:
    static constexpr unsigned max = 0x7FFF;

    explicit c_random(std::int64_t seed) : m_state(static_cast<std::uint32_t>(seed)) {}

    /// 0 to `max`.
    unsigned next() {
        m_state = m_state * 214013U + 2531011U;
        return (m_state >> 16) & max;
    }

private:
    std::uint32_t m_state;
};

}  // namespace vrl_platform
