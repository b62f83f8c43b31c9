#include "platform/entropy.h"

#include <unistd.h>

#include <algorithm>

namespace vrl_platform {
namespace {

// getentropy gives at most this much in one call.
constexpr std::size_t k_largest_draw = 256;

class posix_entropy : public entropy_source {
public:
    bool fill(void* buffer, std::size_t size) override {
        for (std::size_t done = 0; done < size;) {
            const std::size_t count = std::min(size - done, k_largest_draw);
            if (::getentropy(static_cast<char*>(buffer) + done, count) != 0) return false;
            done += count;
        }
        return true;
    }
};

}  // namespace

entropy_source& native_entropy() {
    static posix_entropy source;
    return source;
}

}  // namespace vrl_platform
