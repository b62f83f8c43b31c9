#pragma once

#include <string>
#include <vector>

#include "V2/Vrl.h"

/// Every class and member of the model, without types: what a test needs to fill, vary and compare all of
/// them by one piece of code. The tables are compiled from the schema like the classes themselves.
namespace vrl_driver {

using qbxV2::eqbx_error;

enum class form {
    attribute,
    text,
    value,
    object,
    group,
    value_list,
    object_list,
    group_list,
    any_list,
    value_option,
    object_option,
};

enum class value_type { number, text, boolean, integer, unsigned_integer, byte, date_time, binary };

/// The facets as the schema writes them; null where there is none.
struct facets {
    const char* min_inclusive = nullptr;
    const char* min_exclusive = nullptr;
    const char* max_inclusive = nullptr;
    const char* max_exclusive = nullptr;
    int min_length = -1;
    int max_length = -1;
    std::vector<const char*> literals;
};

struct member {
    const char* name = "";
    form kind = form::value;
    value_type value = value_type::text;
    bool required = false;
    bool read_optional = false;
    bool has_presence = true;
    bool always_written = false;
    const char* initial = nullptr;
    const char* class_name = nullptr;  ///< of an object or group
    facets limits;

    // Simple values, as the text that a document has for them. For a list: append, and the entry `i`.
    eqbx_error (*set)(void* self, const std::string& text) = nullptr;
    std::string (*get)(const void* self, unsigned i) = nullptr;
    bool (*isset)(const void* self) = nullptr;
    void (*unset)(void* self) = nullptr;
    int (*getenum)(const void* self) = nullptr;
    bool (*setenum)(void* self, int number) = nullptr;
    eqbx_error (*insert)(void* self, unsigned i, const std::string& text) = nullptr;
    eqbx_error (*set_at)(void* self, unsigned i, const std::string& text) = nullptr;

    // Objects: what a mutable getter gives; for a list a new entry, and the entry `i`.
    void* (*make)(void* self) = nullptr;
    const void* (*look)(const void* self, unsigned i) = nullptr;
    void* (*reach)(void* self, unsigned i) = nullptr;
    void* (*assign)(void* self, unsigned i, const void* value) = nullptr;

    // Lists.
    unsigned (*size)(const void* self) = nullptr;
    void (*erase)(void* self, unsigned i) = nullptr;
    void (*clear)(void* self) = nullptr;
};

/// One member of a substitution group: the element and the class that it holds.
struct group_member {
    const char* element;
    const char* class_name;
    bool is_head;
    void* (*make)(void* self);
    const void* (*look)(const void* self);
};

enum class class_form { type, element, choice, group, root };

struct class_description {
    const char* name = "";
    const char* base = nullptr;
    const char* xml_name = "";
    class_form kind = class_form::type;
    bool text_only = false;
    bool text_required = true;
    bool nillable = false;
    bool accepts_empty = false;
    bool polymorphic = false;
    bool standalone = false;
    bool declares_namespaces = false;
    int none_state = 0;
    std::vector<member> members;  ///< declared here, not inherited
    std::vector<group_member> group;
    std::vector<const char*> factory;  ///< classes that `factory` makes, by name

    void* (*create)() = nullptr;
    void (*destroy)(void*) = nullptr;
    void* (*copy)(const void*) = nullptr;
    void (*assign)(void* self, const void* other) = nullptr;
    void (*swap)(void* self, void* other) = nullptr;
    void (*reset)(void* self) = nullptr;
    bool (*is_occurs_ok)(const void* self) = nullptr;
    void* (*to_base)(void* self) = nullptr;
    int (*chosen)(const void* self) = nullptr;
    bool (*is_nil)(const void* self) = nullptr;
    void (*set_nil)(void* self) = nullptr;
    eqbx_error (*marshal)(const void* self, qbxV2::c_xml_writer& out, const char* name) = nullptr;
    eqbx_error (*unmarshal)(void* self, qbxV2::c_xml_reader& reader, const std::string& name) = nullptr;
    eqbx_error (*marshal_string)(const void* self, std::string* text) = nullptr;
    eqbx_error (*unmarshal_string)(void* self, const std::string& text) = nullptr;
    void* (*clone)(const void* self) = nullptr;
    const char* (*getid)(const void* self) = nullptr;
    bool (*has_id)(const void* self, const char* identity) = nullptr;
    const char* (*static_id)() = nullptr;
    const void* (*made_by_factory)(int ns_id, const std::string& name, const char** id) = nullptr;
};

/// All classes, in order of derivation.
const std::vector<class_description>& classes();
/// Ends the test program when there is no such class.
const class_description& find_class(const std::string& name);

// Between stored values and the texts that documents have for them.
void from_text(const std::string& text, double& value);
void from_text(const std::string& text, bool& value);
void from_text(const std::string& text, int& value);
void from_text(const std::string& text, unsigned& value);
void from_text(const std::string& text, unsigned char& value);
void from_text(const std::string& text, std::wstring& value);
void from_text(const std::string& text, qbxV2::c_datetime& value);
void from_text(const std::string& text, qbxV2::c_binary& value);
std::string to_text(double value);
std::string to_text(bool value);
std::string to_text(int value);
std::string to_text(unsigned value);
std::string to_text(unsigned char value);
std::string to_text(const std::wstring& value);
std::string to_text(const qbxV2::c_datetime& value);
std::string to_text(const qbxV2::c_binary& value);

template <class T>
T value_of(const std::string& text) {
    T value{};
    from_text(text, value);
    return value;
}

/// The operations that every class has.
template <class T>
void describe_operations(class_description& c) {
    c.create = []() -> void* { return new T(); };
    c.destroy = [](void* self) { delete static_cast<T*>(self); };
    c.copy = [](const void* self) -> void* { return new T(*static_cast<const T*>(self)); };
    c.assign = [](void* self, const void* other) { *static_cast<T*>(self) = *static_cast<const T*>(other); };
    c.swap = [](void* self, void* other) { static_cast<T*>(self)->swap(*static_cast<T*>(other)); };
    c.reset = [](void* self) { static_cast<T*>(self)->reset(); };
    c.is_occurs_ok = [](const void* self) { return static_cast<const T*>(self)->is_occurs_ok(); };
    c.marshal = [](const void* self, qbxV2::c_xml_writer& out, const char* name) {
        return static_cast<const T*>(self)->marshal(out, name);
    };
}

template <class T>
void describe_reading(class_description& c) {
    c.unmarshal = [](void* self, qbxV2::c_xml_reader& reader, const std::string& name) {
        return static_cast<T*>(self)->unmarshal(reader, name);
    };
}

template <class T>
void describe_standalone(class_description& c) {
    c.marshal_string = [](const void* self, std::string* text) {
        return static_cast<const T*>(self)->marshal(text);
    };
    c.unmarshal_string = [](void* self, const std::string& text) {
        return static_cast<T*>(self)->unmarshal(text);
    };
}

template <class T>
void describe_identity(class_description& c) {
    c.clone = [](const void* self) -> void* { return static_cast<const T*>(self)->clone(); };
    c.getid = [](const void* self) { return static_cast<const T*>(self)->getid(); };
    c.has_id = [](const void* self, const char* identity) {
        return static_cast<const T*>(self)->has_id(identity);
    };
    c.static_id = [] { return static_cast<const char*>(T::id); };
}

template <class T, class Base>
void describe_base(class_description& c) {
    c.to_base = [](void* self) -> void* { return static_cast<Base*>(static_cast<T*>(self)); };
}

}  // namespace vrl_driver
