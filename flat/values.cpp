#include "flat/values.h"

#include "V2/Vrl.h"

namespace vrl_flat {

void* new_any_info(const char* ns, const char* name, const char* value) {
    if (ns == nullptr || name == nullptr || value == nullptr) {
        report_argument_null(k_null_text);
        return nullptr;
    }
    return make<qbxV2::c_any_info>(std::string(ns), std::string(name), std::string(value));
}

void* new_document_result(const char16_t* document, std::int32_t error) {
    return make<vrl_v2::XMLDocumentResult>(wide(document), static_cast<qbxV2::eqbx_error>(error));
}

int compare_part(const std::string& text, const char* other, std::uint32_t pos, std::uint32_t count) {
    if (other == nullptr) {
        report_argument_null(k_null_text);
        return 0;
    }
    return text.compare(pos, count, other);
}

}  // namespace vrl_flat

extern "C" char* vrl_revision_any(void* revision, uint32_t i, int32_t which) {
    const auto* const self = static_cast<vrl_v2::Revision*>(revision);
    if (self == nullptr || i >= self->size_any() || which < 0 || which > 2) return nullptr;
    std::string texts[3];
    self->get_any(i, &texts[0], &texts[1], &texts[2]);
    return vrl_flat::new_text(texts[which]);
}
