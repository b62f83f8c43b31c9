#pragma once

#include <new>
#include <string>

#include "flat/convention.h"
#include "runtime/values.h"

/// What the value classes of the runtime need beside the convention.
namespace vrl_flat {

#define VRL_FLAT_VALUE_CLASS(name)                      \
    template <>                                         \
    struct class_name<qbxV2::name> {                    \
        static constexpr char text[] = "qbxV2::" #name; \
    }
VRL_FLAT_VALUE_CLASS(c_any_info);
VRL_FLAT_VALUE_CLASS(c_big_int);
VRL_FLAT_VALUE_CLASS(c_binary);
VRL_FLAT_VALUE_CLASS(c_decimal);
VRL_FLAT_VALUE_CLASS(c_date);
VRL_FLAT_VALUE_CLASS(c_datetime);
VRL_FLAT_VALUE_CLASS(c_time);
VRL_FLAT_VALUE_CLASS(c_gday);
VRL_FLAT_VALUE_CLASS(c_gmonth);
VRL_FLAT_VALUE_CLASS(c_gmonthday);
VRL_FLAT_VALUE_CLASS(c_gyear);
VRL_FLAT_VALUE_CLASS(c_gyearmonth);
VRL_FLAT_VALUE_CLASS(c_duration);
VRL_FLAT_VALUE_CLASS(c_pattern);
VRL_FLAT_VALUE_CLASS(c_pattern_null);
#undef VRL_FLAT_VALUE_CLASS

template <>
struct class_name<vrl_v2::XMLDocumentResult> {
    static constexpr char text[] = "vrl_v2::XMLDocumentResult";
};

// As members of the model these two go by the names of its own types.
template <>
struct reference_name<qbxV2::c_datetime> {
    static constexpr char text[] = "qbxV2::tc_datetime";
};
template <>
struct reference_name<qbxV2::c_binary> {
    static constexpr char text[] = "qbxV2::tc_binary";
};

/// A native flag crosses as the one byte that it is; null asks for none.
inline bool* as_flag(std::uint8_t* overflow) { return reinterpret_cast<bool*>(overflow); }

template <class C>
void* make_from_text(const char* text) {
    return with_text(text, [&] { return new (std::nothrow) C(text); });
}

/// For a class that stands for the absence of what it is given.
template <class C>
void* make_ignoring(const char*) {
    return make<C>();
}

/// A value class is told by its own name where it is swapped.
template <class C>
void swap_values(void* self, void* other) {
    if (other == nullptr) {
        report_null(class_name<C>::text, k_null_reference);
        return;
    }
    call<C>(self, [&](C& o) { o.swap(*static_cast<C*>(other)); });
}

void* new_any_info(const char* ns, const char* name, const char* value);
void* new_document_result(const char16_t* document, std::int32_t error);

/// Intended: the three texts are temporaries of the call, so what it fills in doesn't reach the caller.
template <class Revision>
void get_any(void* self, std::uint32_t i, const char* ns, const char* name, const char* value) {
    if (ns == nullptr || name == nullptr || value == nullptr) {
        report_argument_null(k_null_text);
        return;
    }
    call<Revision>(self, [&](Revision& o) {
        std::string texts[3] = {ns, name, value};
        o.get_any(i, &texts[0], &texts[1], &texts[2]);
    });
}

/// 0 when `other` equals the part of `text` from `pos` on, of at most `count` bytes.
int compare_part(const std::string& text, const char* other, std::uint32_t pos, std::uint32_t count);

/// A test of <cctype>: no value below 1 passes, nor one that no byte has.
inline std::int32_t classify(std::int32_t c, int (*test)(int)) {
    return c >= 1 && c <= 0xFF && test(c) != 0 ? 1 : 0;
}

}  // namespace vrl_flat
