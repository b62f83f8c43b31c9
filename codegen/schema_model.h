#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

/// The schema as it is written: declarations, facets, documentation and the compiler's own annotations.
/// Nothing here knows about C++.
namespace vrl_codegen {

/// What stands in xs:appinfo, by the element's local name; the value is its one attribute, or empty.
/// The vocabulary is told in schema/README.md.
using annotations = std::map<std::string, std::string>;

inline bool has_note(const annotations& notes, const char* name) { return notes.count(name) != 0; }

struct facets {
    std::optional<std::string> min_inclusive, min_exclusive, max_inclusive, max_exclusive;
    std::optional<unsigned> min_length, max_length;
    std::vector<std::string> enumeration;
    bool has_pattern = false;

    bool has_range() const { return min_inclusive || min_exclusive || max_inclusive || max_exclusive; }
    bool has_length() const { return min_length || max_length; }
    bool operator==(const facets&) const = default;
};

/// A simple type resolved down to the XML Schema built-in that it restricts, with all facets met on the way.
struct simple_type {
    std::string name;      ///< empty for an anonymous restriction and for a built-in
    std::string built_in;  ///< "double", "string", "dateTime", ...
    std::string module;    ///< of a named one in `schema::simple_types`
    facets limits;
    std::string documentation;
};

// Every declaration knows its place, "file:line".

struct attribute_declaration {
    std::string name;
    std::string place;
    simple_type type;
    bool required = false;
    std::optional<std::string> default_value;
    annotations notes;
    std::string documentation;
};

struct element_declaration {
    enum class form { simple, named_type, anonymous_type, reference, any };

    std::string name;  ///< local name; of the element referred to, for a reference
    std::string place;
    form kind = form::simple;
    simple_type simple;
    std::string type_key;  ///< in `schema::types`; of a reference, the type of the element referred to
    unsigned min_occurs = 1;
    bool repeated = false;
    bool nillable = false;
    annotations notes;
    std::string documentation;
};

struct complex_type {
    enum class content { empty, sequence, choice, simple };

    std::string key;           ///< the name, or for an anonymous type "owner/element"
    std::string name;          ///< empty for an anonymous type
    std::string element_name;  ///< for an anonymous type: the element that it belongs to
    std::string module;
    std::string place;
    std::string base;  ///< name of the base type, if it derives by extension
    bool is_abstract = false;
    content kind = content::empty;
    simple_type text;  ///< for content::simple
    std::vector<attribute_declaration> attributes;
    std::vector<element_declaration> elements;
    annotations notes;
    std::string documentation;
};

struct global_element {
    std::string name;
    std::string module;
    std::string place;
    std::string type_key;
    bool anonymous = false;
    std::string substitution_group;
    bool is_abstract = false;
    bool nillable = false;
    annotations notes;
    std::string documentation;
};

struct schema_module {
    std::string name;
    std::string documentation;
};

struct schema {
    std::string target_namespace;
    std::vector<schema_module> modules;  ///< in order of inclusion
    std::vector<simple_type> simple_types;
    std::vector<complex_type> types;  ///< in document order, anonymous ones ahead of their owner
    std::vector<global_element> elements;

    /// Null when there is none.
    const complex_type* find_type(const std::string& key) const;
    const global_element* find_element(const std::string& name) const;
    /// Whether the element is the head of a substitution group.
    bool is_head(const std::string& name) const;
};

}  // namespace vrl_codegen
