#pragma once

#include <cstddef>

namespace vrl_platform {

class entropy_source {
public:
    entropy_source() = default;
    entropy_source(const entropy_source&) = delete;
    entropy_source& operator=(const entropy_source&) = delete;
    virtual ~entropy_source() = default;

    /// Fills the whole buffer with bytes that nobody can predict. False when the system has none to give.
    virtual bool fill(void* buffer, std::size_t size) = 0;
};

/// The system's own source. Lives as long as the process.
entropy_source& native_entropy();

}  // namespace vrl_platform
