#pragma once

#include <cstdint>
#include <new>
#include <string>
#include <type_traits>

#include "flat/callbacks.h"
#include "flat/class_names.h"
#include "flat/strings.h"
#include "flat/vrl_flat_base.h"

/// How every flat function is made: one call of the function behind it, with what crosses turned on the way
/// in and on the way out, and a null told before anything is called.
namespace vrl_flat {

// What crosses on the way out.
inline double crossing(double value) { return value; }
inline float crossing(float value) { return value; }
inline std::int32_t crossing(bool value) { return value ? 1 : 0; }
inline std::int32_t crossing(int value) { return value; }
inline std::uint32_t crossing(unsigned value) { return value; }
inline std::int32_t crossing(long value) { return static_cast<std::int32_t>(value); }
inline std::uint32_t crossing(unsigned long value) { return static_cast<std::uint32_t>(value); }
inline std::uint8_t crossing(unsigned char value) { return value; }
inline const char* crossing(const char* value) { return value; }
inline char16_t* crossing(const std::wstring& value) { return new_text(value); }
inline char* crossing(const std::string& value) { return new_text(value); }
template <class T, std::enable_if_t<std::is_enum<T>::value, int> = 0>
std::int32_t crossing(T value) {
    return static_cast<std::int32_t>(value);
}
template <class T, std::enable_if_t<std::is_class<T>::value, int> = 0>
void* crossing(T& object) {
    return const_cast<std::remove_const_t<T>*>(&object);
}
template <class T, std::enable_if_t<std::is_class<T>::value, int> = 0>
void* crossing(T* object) {
    return object;
}

template <class Call>
using crossed = decltype(crossing(std::declval<Call>()));

/// 0 or null, whatever the function would have returned.
template <class Result>
Result nothing() {
    if constexpr (!std::is_void<Result>::value) return Result();
}

inline constexpr char k_null_reference[] = " & type is null";
inline constexpr char k_null_const_reference[] = " const & type is null";
inline constexpr char k_null_text[] = "null string";

/// Calls `function` with a result that crosses; a call without a result gives none.
template <class Function, class... Arguments>
auto cross(const Function& function, Arguments&... arguments) {
    if constexpr (std::is_void<decltype(function(arguments...))>::value) {
        function(arguments...);
    } else {
        return crossing(function(arguments...));
    }
}

/// Calls `function` on the object behind a handle.
template <class C, class Function>
auto call(void* self, const Function& function) {
    using result = decltype(cross(function, std::declval<C&>()));
    if (self == nullptr) {
        report_null(class_name<C>::text, k_null_reference);
        return nothing<result>();
    }
    return cross(function, *static_cast<C*>(self));
}

/// The same with another object, which crosses as a reference, `T const` for a constant one.
template <class C, class T, class Function>
auto call_with(void* self, void* other, const Function& function) {
    using result = decltype(cross(function, std::declval<C&>(), std::declval<T&>()));
    if (other == nullptr) {
        report_null(reference_name<std::remove_const_t<T>>::text,
                    std::is_const<T>::value ? k_null_const_reference : k_null_reference);
        return nothing<result>();
    }
    return call<C>(self,
                   [&](C& object) -> decltype(auto) { return function(object, *static_cast<T*>(other)); });
}

/// The same with a byte text, which must not be null.
template <class C, class Function>
auto call_with_text(void* self, const char* text, const Function& function) {
    using result = decltype(cross(function, std::declval<C&>()));
    if (text == nullptr) {
        report_argument_null(k_null_text);
        return nothing<result>();
    }
    return call<C>(self, function);
}

/// A function without an object, with a byte text that must not be null.
template <class Function>
auto with_text(const char* text, const Function& function) {
    using result = decltype(cross(function));
    if (text == nullptr) {
        report_argument_null(k_null_text);
        return nothing<result>();
    }
    return cross(function);
}

/// A new object, null when there is no memory.
template <class C, class... Arguments>
void* make(const Arguments&... arguments) {
    return new (std::nothrow) C(arguments...);
}

template <class C>
void* copy(const void* other) {
    if (other == nullptr) {
        report_null(class_name<C>::text, k_null_const_reference);
        return nullptr;
    }
    return make<C>(*static_cast<const C*>(other));
}

template <class C>
void destroy(void* self) {
    delete static_cast<C*>(self);
}

/// All hierarchies are single: the base stands where the object does.
template <class C, class Base>
void* upcast(void* self) {
    return static_cast<Base*>(static_cast<C*>(self));
}

/// Intended: the identity becomes a copy that nobody frees, since objects may still tell the old one.
void replace_identity(char const*& identity, const char* text);

}  // namespace vrl_flat
