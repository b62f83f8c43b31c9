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

struct facets {
    std::optional<std::string> min_inclusive, min_exclusive, max_inclusive, max_exclusive;
    std::optional<unsigned> min_length, max_length;
    std::vector<std::string> enumeration;
    bool has_pattern = false;

    bool has_range() const { return min_inclusive || min_exclusive || max_inclusive || max_exclusive; }
};

/// A simple type resolved down to the XML Schema built-in that it restricts, with all facets met on the way.
struct simple_type {
    std::string name;      ///< empty for an anonymous restriction and for a built-in
    std::string built_in;  ///< "double", "string", "dateTime", ...
    facets limits;
    std::string documentation;
};

struct attribute_declaration {
    std::string name;
    simple_type type;
    bool required = false;
    std::optional<std::string> default_value;
    annotations notes;
    std::string documentation;
};

struct complex_type;

struct element_declaration {
    enum class form { simple, named_type, anonymous_type, reference, any };

    std::string name;  ///< local name; of the element referred to, for a reference
    form kind = form::simple;
    simple_type simple;
    std::string type_name;           ///< for named_type
    std::string anonymous_type_key;  ///< for anonymous_type: key in `schema::types`
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
    std::string base;  ///< name of the base type, if it derives by extension
    bool is_abstract = false;
    content kind = content::empty;
    simple_type text;  ///< for content::simple, unless a base has it
    std::vector<attribute_declaration> attributes;
    std::vector<element_declaration> elements;
    annotations notes;
    std::string documentation;
};

struct global_element {
    std::string name;
    std::string module;
    std::string type_key;
    bool anonymous = false;
    std::string substitution_group;
    bool is_abstract = false;
    bool nillable = false;
    annotations notes;
    std::string documentation;
};

struct schema {
    std::string target_namespace;
    std::vector<std::string> modules;  ///< in order of inclusion
    std::vector<complex_type> types;   ///< in document order, anonymous ones ahead of their owner
    std::vector<global_element> elements;

    const complex_type* find_type(const std::string& key) const;
    const global_element* find_element(const std::string& name) const;
};

}  // namespace vrl_codegen
