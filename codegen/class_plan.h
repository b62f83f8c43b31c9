#pragma once

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
    std::string parameter;  ///< as passed in and out: by value or, of a structured type, by const reference
    std::string limits;     ///< the constant that holds its facets: "k_Percentage"
    facets facet;

    bool is_enumerated() const { return !facet.enumeration.empty(); }
};

/// A constant of a generated source that holds facets.
struct limits_plan {
    enum class form { none, range, length, whole, literals };

    std::string name;
    form kind = form::none;
    bool collapsed = false;  ///< white space is collapsed on reading
    facets facet;
    std::string lowest, highest;  ///< of a whole number

    bool operator==(const limits_plan&) const = default;
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

    bool operator==(const row_range&) const = default;
};

struct member_plan {
    std::string name;
    member_kind kind = member_kind::value;
    bool required = false;        ///< for a list: needs an entry
    bool read_optional = false;   ///< required, but absence is no error on reading
    bool has_presence = true;     ///< false: outside the cardinality test, always written
    bool always_written = false;  ///< an attribute that is written whether or not it is set
    bool ends_nil = false;        ///< setting it ends the nil state of its class
    bool holds_choice = false;    ///< an object of a choice class
    value_plan value;
    std::string class_name;  ///< of an object or group
    std::string initial;     ///< initial value in storage, as the schema writes it; empty for the type's own
    std::string token;
    row_range next;
    std::string documentation;

    bool is_child() const { return kind != member_kind::attribute && kind != member_kind::text; }
    bool is_list() const;
    bool is_group() const { return kind == member_kind::group || kind == member_kind::group_list; }
    /// A single member has `isset` and `unset` exactly where the format lets it be absent.
    bool has_presence_accessors() const;
    /// Whether its absence in a document is an error.
    bool demanded_on_reading() const { return required && !read_optional; }
    /// Whether its absence in an object is an error.
    bool demanded_on_writing() const { return required && has_presence; }
};

enum class class_kind { type, element, choice, group, root };

/// What stands between the tags of a class's element, its own class's share of it.
enum class content_kind { none, text, children, choice, any };

struct group_member_plan {
    std::string element;
    std::string class_name;
    std::string token;
    bool is_head = false;
};

struct class_plan {
    std::string name;
    class_kind kind = class_kind::type;
    content_kind content = content_kind::none;
    std::string module;
    std::string place;     ///< of the declaration, "file:line"
    std::string base;      ///< empty if none
    std::string xml_name;  ///< local name of the element or type that a report names
    bool polymorphic = false;
    std::string identity;       ///< of a polymorphic class: whose `id` its element tells
    bool has_identity = false;  ///< has an `id` of its own
    bool declares_namespaces = true;
    bool nillable = false;
    std::string renamed_text;  ///< how a nillable element whose type has text passes it under its own name
    bool accepts_empty = false;
    bool text_only = false;                 ///< simple content, own or inherited
    bool text_required = true;              ///< false: the text may be absent on writing
    bool standalone = false;                ///< the overloads that read and write whole documents
    bool declares_members = true;           ///< false for a thin element class
    bool base_requires_attributes = false;  ///< an ancestor has attributes that a document must give
    std::vector<member_plan> members;       ///< attributes, then text or children
    row_range first_names;
    std::vector<group_member_plan> group;  ///< of a group class
    std::string head;                      ///< of a group class: the head's type class
    int none_state = 0;                    ///< of a choice or group class
    std::vector<std::string> factory;      ///< type classes that the family's `factory` makes
    std::string documentation;

    std::vector<const member_plan*> attributes() const;
    std::vector<const member_plan*> required_attributes() const;
    std::vector<const member_plan*> children() const;
    /// Null when the class has no text of its own.
    const member_plan* text() const;

    // Which steps of reading and writing the class has of its own; the others are its base's. A class
    // without a base has all of them.
    bool has_own_attribute_reading() const { return base.empty() || nillable || !attributes().empty(); }
    bool has_own_attributes() const { return base.empty() || !attributes().empty(); }
    bool has_own_content() const { return base.empty() || content != content_kind::none; }

    bool is_document() const { return kind == class_kind::root; }
    bool has_initial_values() const;
    /// Whether a constructor calls `init`, which the document's class has by hand.
    bool has_init() const { return is_document() || has_initial_values(); }
};

struct module_plan {
    std::string name;
    std::vector<std::string> depends_on;  ///< modules that hold base classes
    std::vector<const class_plan*> classes;
    std::vector<limits_plan> limits;
};

/// The number of a name in one of its roles: "a_Name" as an attribute, "e_Name" as an element.
struct token_plan {
    std::string name;
    unsigned number = 0;
};

/// Modules point to classes, so a plan moves but isn't copied.
struct plan {
    plan() = default;
    plan(const plan&) = delete;
    plan& operator=(const plan&) = delete;
    plan(plan&&) = default;
    plan& operator=(plan&&) = default;

    std::string document_namespace;
    std::vector<class_plan> classes;   ///< bases ahead of what derives from them
    std::vector<module_plan> modules;  ///< in order of dependence
    std::vector<token_plan> tokens;

    /// Null when there is none.
    const class_plan* find(const std::string& name) const;
};

/// Throws `schema_error` when the schema asks for something that no class can be.
plan make_plan(const schema& source);

}  // namespace vrl_codegen
