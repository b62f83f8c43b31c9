#pragma once

#include <cstdio>
#include <memory>
#include <string>
#include <type_traits>
#include <vector>

#include "flat/vrl_flat.h"
#include "runtime/values.h"

/// The C functions of every class and member, as tables that one piece of code can walk.
namespace vrl_flat_driver {

struct flat_member {
    const char* name = "";
    const char* class_name = nullptr;  ///< of a group's member

    // Simple values, as the text that a document has for them; for a list: append, and the entry `i`.
    int32_t (*set)(void* self, const std::string& text) = nullptr;
    std::string (*get)(void* self, uint32_t i) = nullptr;
    int32_t (*insert)(void* self, uint32_t i, const std::string& text) = nullptr;
    int32_t (*set_at)(void* self, uint32_t i, const std::string& text) = nullptr;
    int32_t (*isset)(void* self) = nullptr;
    void (*unset)(void* self) = nullptr;
    /// The functions that store a text or a structured value, called with null for it.
    std::vector<int32_t (*)(void* self)> given_null;
    int32_t (*getenum)(void* self) = nullptr;
    int32_t (*setenum)(void* self, int32_t number) = nullptr;

    // Objects.
    void* (*reach)(void* self, uint32_t i) = nullptr;
    void* (*assign)(void* self, uint32_t i, void* value) = nullptr;
    void* (*back)(void* self) = nullptr;
    int32_t (*append)(void* self) = nullptr;
    int32_t (*insert_object)(void* self, uint32_t i) = nullptr;

    // Lists.
    uint32_t (*size)(void* self) = nullptr;
    void (*erase)(void* self, uint32_t i) = nullptr;
    void (*clear)(void* self) = nullptr;
};

struct flat_class {
    const char* name = "";
    void* (*create)() = nullptr;
    void* (*copy)(void* other) = nullptr;
    void (*destroy)(void* self) = nullptr;
    void* (*upcast)(void* self) = nullptr;
    void (*swap)(void* self, void* other) = nullptr;
    void (*reset)(void* self) = nullptr;
    int32_t (*is_occurs_ok)(void* self) = nullptr;
    int32_t (*getchosen)(void* self) = nullptr;
    int32_t (*isnil)(void* self) = nullptr;
    void (*setnil)(void* self) = nullptr;
    int32_t (*marshal)(void* self, const char* path) = nullptr;
    int32_t (*unmarshal_path)(void* self, const char* path) = nullptr;
    int32_t (*unmarshal_bytes)(void* self, const char* bytes, uint32_t length) = nullptr;
    void* (*clone)(void* self) = nullptr;
    const char* (*getid)(void* self) = nullptr;
    int32_t (*has_id)(void* self, const char* id) = nullptr;
    const char* (*id_get)() = nullptr;
    void (*id_set)(const char* id) = nullptr;
    void* (*factory)(int32_t ns_id, const char* type_name) = nullptr;
    std::vector<flat_member> members;
};

const std::vector<flat_class>& flat_classes();

/// The text of a block that the library gave, which is freed.
std::string taken_text(char16_t* text);
std::string taken_text(char* bytes);
/// The value behind a handle that belongs to its parent.
std::string written(const qbxV2::c_datetime& value);
std::string written(const qbxV2::c_binary& value);
template <class T>
std::string text_of(void* value) {
    return value == nullptr ? "(null)" : written(*static_cast<const T*>(value));
}
template <class T>
std::enable_if_t<std::is_arithmetic<T>::value, std::string> taken_text(T value) {
    if constexpr (std::is_floating_point<T>::value) {
        char text[64];
        std::snprintf(text, sizeof text, "%.14g", value);
        return text;
    } else {
        return std::to_string(value);
    }
}

/// A text of a document as what a setter takes, kept for the time of the call.
template <class T>
class crossing_holder {
public:
    explicit crossing_holder(T value) : m_value(value) {}
    T get() const { return m_value; }

private:
    T m_value;
};
template <>
class crossing_holder<const char16_t*> {
public:
    explicit crossing_holder(std::u16string text) : m_text(std::move(text)) {}
    const char16_t* get() const { return m_text.c_str(); }

private:
    std::u16string m_text;
};
template <>
class crossing_holder<void*> {
public:
    explicit crossing_holder(std::shared_ptr<void> object) : m_object(std::move(object)) {}
    void* get() const { return m_object.get(); }

private:
    std::shared_ptr<void> m_object;
};

std::u16string utf16(const std::string& text);
/// A date where the text has the form of one, bytes in base64 otherwise.
std::shared_ptr<void> date_or_bytes(const std::string& text);

template <class T>
crossing_holder<T> crossing_value(const std::string& text, int32_t (*)(void*, T)) {
    if constexpr (std::is_same<T, const char16_t*>::value) {
        return crossing_holder<T>(utf16(text));
    } else if constexpr (std::is_same<T, void*>::value) {
        return crossing_holder<T>(date_or_bytes(text));
    } else if constexpr (std::is_floating_point<T>::value) {
        return crossing_holder<T>(std::stod(text));
    } else if (text == "true" || text == "false") {
        return crossing_holder<T>(static_cast<T>(text == "true" ? 1 : 0));
    } else {
        return crossing_holder<T>(static_cast<T>(std::stoll(text)));
    }
}

}  // namespace vrl_flat_driver
