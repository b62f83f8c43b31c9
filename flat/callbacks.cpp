#include "flat/callbacks.h"

#include <string>

#include "flat/vrl_flat_base.h"

namespace vrl_flat {
namespace {

// Codes are fixed by position. All pointers are null until a managed caller registers its own.
vrl_exception_callback g_exceptions[11];
vrl_argument_exception_callback g_argument_exceptions[3];
vrl_string_callback g_string_callback;

constexpr int k_argument_null = 1;

}  // namespace

void report_argument_null(const char* message) {
    // A caller that forgot to register gets the null result without the exception, and not a crash.
    if (g_argument_exceptions[k_argument_null] != nullptr) {
        g_argument_exceptions[k_argument_null](message, nullptr);
    }
}

void report_null(const char* type, const char* reference) {
    report_argument_null((std::string(type) + reference).c_str());
}

}  // namespace vrl_flat

extern "C" {

void SWIGRegisterExceptionCallbacks_VrlModule(
    vrl_exception_callback application, vrl_exception_callback arithmetic,
    vrl_exception_callback divide_by_zero, vrl_exception_callback index_out_of_range,
    vrl_exception_callback invalid_cast, vrl_exception_callback invalid_operation, vrl_exception_callback io,
    vrl_exception_callback null_reference, vrl_exception_callback out_of_memory,
    vrl_exception_callback overflow, vrl_exception_callback system) {
    const vrl_exception_callback given[] = {
        application, arithmetic,     divide_by_zero, index_out_of_range, invalid_cast, invalid_operation,
        io,          null_reference, out_of_memory,  overflow,           system};
    for (int code = 0; code < 11; ++code) vrl_flat::g_exceptions[code] = given[code];
}

void SWIGRegisterExceptionArgumentCallbacks_VrlModule(vrl_argument_exception_callback argument,
                                                      vrl_argument_exception_callback argument_null,
                                                      vrl_argument_exception_callback argument_out_of_range) {
    vrl_flat::g_argument_exceptions[0] = argument;
    vrl_flat::g_argument_exceptions[vrl_flat::k_argument_null] = argument_null;
    vrl_flat::g_argument_exceptions[2] = argument_out_of_range;
}

void SWIGRegisterStringCallback_VrlModule(vrl_string_callback callback) {
    vrl_flat::g_string_callback = callback;
}

}  // extern "C"
