#ifndef VRL_FLAT_BASE_H
#define VRL_FLAT_BASE_H

/*
 * The flat layer: plain C functions for callers in any language. The convention, once for all of them:
 *
 * 1. Handles. An object crosses as one machine pointer. What CSharp_new_, _clone, _factory and
 *    CSharp_Vrl_writeString return belongs to the caller, who frees it once with the CSharp_delete_ of its
 *    class. A handle from _get_, _back_ or _assign_ points into its parent and stays good until the parent,
 *    or that place in it, changes or is freed; it is never freed by itself.
 * 2. Numbers. Integers have fixed widths. A truth value is an int32_t: 0 is false, anything else true; a
 *    result is 0 or 1. Enumerations and result codes are int32_t.
 * 3. Wide text goes in as zero-terminated UTF-16, null standing for the empty text, and comes out as a
 *    block that belongs to the caller and carries its length (see vrl_free_string).
 * 4. Byte text goes in zero-terminated; null is reported as "null string". A `char*` result is a block that
 *    belongs to the caller; a `const char*` result belongs to the library.
 * 5. Nulls. A function that needs an object and gets null calls the ArgumentNullException callback (row 1
 *    of the argument table) with a message such as "vrl_v2::ColorType const & type is null", does nothing
 *    else, and returns 0 or null. A CSharp_delete_ takes null in silence.
 * 6. Threads. The layer has no lock: register the callbacks once, first; then one thread for one document.
 */

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#else
#include <uchar.h>
#endif

#if defined(_WIN32)
#if defined(VRL_BUILDING)
#define VRL_FLAT_API __declspec(dllexport)
#else
#define VRL_FLAT_API __declspec(dllimport)
#endif
#else
#define VRL_FLAT_API __attribute__((visibility("default")))
#endif

typedef void (*vrl_exception_callback)(const char* message);
typedef void (*vrl_argument_exception_callback)(const char* message, const char* parameter);
typedef char* (*vrl_string_callback)(const char* text);

/* Eleven callbacks, in the order of the general table. Stored, and never called. */
VRL_FLAT_API void SWIGRegisterExceptionCallbacks_VrlModule(
    vrl_exception_callback application, vrl_exception_callback arithmetic,
    vrl_exception_callback divide_by_zero, vrl_exception_callback index_out_of_range,
    vrl_exception_callback invalid_cast, vrl_exception_callback invalid_operation, vrl_exception_callback io,
    vrl_exception_callback null_reference, vrl_exception_callback out_of_memory,
    vrl_exception_callback overflow, vrl_exception_callback system);
/* Three callbacks, in the order of the argument table. Only the second is ever called. */
VRL_FLAT_API void SWIGRegisterExceptionArgumentCallbacks_VrlModule(
    vrl_argument_exception_callback argument, vrl_argument_exception_callback argument_null,
    vrl_argument_exception_callback argument_out_of_range);
/* Stored, and never called: texts come out as blocks that carry their length. */
VRL_FLAT_API void SWIGRegisterStringCallback_VrlModule(vrl_string_callback callback);

/*
 * A text that the library gave: its bytes, a zero unit behind them, and in the four bytes ahead of the text
 * its length in bytes. The block comes from malloc and starts `prefix` bytes ahead of the text: 4 where a
 * classic Mono runtime is in the process, the size of a pointer otherwise, so that the runtime's own
 * marshaller can free it. Callers that are no such runtime free it here; null is taken in silence.
 */
VRL_FLAT_API void vrl_free_string(void* text);
/*
 * Overrides the prefix for a runtime that the layer doesn't know: 4 or 8; anything else is ignored. Call it
 * before the first text is asked for: a text is freed with the prefix in force.
 */
VRL_FLAT_API void vrl_set_string_prefix(int32_t bytes);

/*
 * One of the three texts of entry `i` of a Revision: `which` is 0 for the namespace, 1 for the name, 2 for
 * the value. A text of the caller's; null for a null handle, or when there is no such entry or text.
 */
VRL_FLAT_API char* vrl_revision_any(void* revision, uint32_t i, int32_t which);

#ifdef __cplusplus
}
#endif

#endif
