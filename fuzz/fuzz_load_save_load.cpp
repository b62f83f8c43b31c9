#include <cstddef>
#include <cstdint>
#include <string>

#include "V2/Vrl.h"
#include "fuzz/finding.h"

// What was loaded and saved loads again, and saves to the same text.

namespace {

/// Whether half of a surrogate pair is in the text: such a unit is read from UTF-16 and from a character
/// reference, and written as it stands, but no UTF-8 input may hold it.
bool holds_lone_surrogate(const std::string& utf8) {
    for (std::size_t at = utf8.find('\xED'); at != std::string::npos; at = utf8.find('\xED', at + 1)) {
        if (at + 1 < utf8.size() && static_cast<unsigned char>(utf8[at + 1]) >= 0xA0) return true;
    }
    return false;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string given(reinterpret_cast<const char*>(data), size);
    vrl_v2::Vrl document;
    if (document.unmarshal(given) != qbxV2::EQBX_NO_ERROR) return 0;
    std::string saved;
    if (document.marshal(&saved) != qbxV2::EQBX_NO_ERROR || holds_lone_surrogate(saved)) return 0;

    vrl_v2::Vrl again;
    const qbxV2::eqbx_error loaded = again.unmarshal(saved);
    if (loaded != qbxV2::EQBX_NO_ERROR) {
        fuzz::report_finding("saved, then refused with " + std::to_string(loaded) + ":\n" + saved);
    }
    std::string saved_again;
    if (again.marshal(&saved_again) != qbxV2::EQBX_NO_ERROR)
        fuzz::report_finding("not saved again:\n" + saved);
    fuzz::require_equal("saved again, against saved", saved_again, saved);
    return 0;
}
