#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "codegen/schema_model.h"

/// The classes that follow from the schema: every decision of the compiler is made here, so that the
/// emitters only print.
namespace vrl_codegen {

enum class value_kind { number, text, boolean, integer, unsigned_integer, byte, date_time, binary };

/// The stored form of a simple value.
struct value_plan {
    value_kind kind = value_kind::text;
    std::string type;       ///< as stored: "double", "std::wstring", "qbxV2::c_datetime"
    std::string parameter;  ///< as passed in and, for structured values, out: "std::wstring const&"
    std::string limits;     ///< the expression that names its facets: "k_Percentage"
    facets facet;
};

/// A constant of a generated source that holds facets.
struct limits_plan {
    std::string name;
    std::string definition;
};

enum class member_kind {
    attribute,
    text,
    value,   ///< single child of simple type
    object,  ///< single child of class type
    group,   ///< single member of a substitution group
    value_list,
    object_list,
    group_list,
    any_list,
    value_option,
    object_option,
};

/// Which rows of a class's table of names may follow: [first, last).
struct row_range {
    unsigned first = 0;
    unsigned last = 0;
};

struct member_plan {
    std::string name;
    member_kind kind = member_kind::value;
    bool required = false;       ///< for a list: needs an entry
    bool read_optional = false;  ///< required, but absence is no error on reading
    bool has_presence = true;    ///< false: outside the cardinality test, always written
    bool always_written = false;
    bool holds_choice = false;  ///< an object of a choice class
    value_plan value;
    std::string class_name;  ///< of an object or group
    std::string initial;     ///< initial value in storage, as a C++ literal; empty for the type's own
    std::string token;
    row_range next;
    std::string documentation;

    /// A single member has `isset` and `unset` exactly where the format lets it be absent.
    bool has_presence_accessors() const;
};

enum class class_kind { type, element, choice, group, root };

struct group_member_plan {
    std::string element;
    std::string class_name;
    std::string token;
    bool is_head = false;
};

struct class_plan {
    std::string name;
    class_kind kind = class_kind::type;
    std::string module;
    std::string base;      ///< empty if none
    std::string xml_name;  ///< local name of the element or type that a report names
    bool polymorphic = false;
    bool root_of_family = false;
    bool declares_namespaces = true;
    bool nillable = false;
    bool accepts_empty = false;
    bool text_only = false;            ///< simple content, own or inherited
    bool text_required = true;         ///< false: the text may be absent on writing
    bool standalone = false;           ///< the overloads that read and write whole documents
    bool declares_members = true;      ///< false for a thin element class
    std::vector<member_plan> members;  ///< attributes, then text or children
    row_range first_names;
    std::vector<group_member_plan> group;  ///< of a group class
    std::string head;                      ///< of a group class: the head's type class
    int none_state = 0;                    ///< of a choice or group class
    std::vector<std::string> factory;      ///< type classes that the family's `factory` makes
    std::string documentation;

    std::vector<const member_plan*> attributes() const;
    std::vector<const member_plan*> children() const;
    const member_plan* text() const;
};

struct module_plan {
    std::string name;
    std::vector<std::string> depends_on;  ///< modules that hold base classes
    std::vector<const class_plan*> classes;
    std::vector<limits_plan> limits;
};

struct plan {
    std::string document_namespace;
    std::vector<class_plan> classes;   ///< bases ahead of what derives from them
    std::vector<module_plan> modules;  ///< in order of dependence
    std::vector<std::string> tokens;   ///< in order of their numbers

    const class_plan* find(const std::string& name) const;
};

/// Throws `schema_error` when the schema asks for something that no class can be.
plan make_plan(const schema& source);

}  // namespace vrl_codegen
