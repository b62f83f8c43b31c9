#pragma once

#include <string>
#include <vector>

#include "codegen/class_plan.h"
#include "codegen/schema_model.h"

/// The reference pages: what a user of the format wants to know, with links, ready to be printed.
namespace vrl_codegen {

/// A row of a table; cells are Markdown.
struct reference_row {
    std::string number;
    std::string name;
    std::string type;
    std::string occurs;
    std::string values;
    std::string meaning;
};

struct reference_type {
    std::string title;  ///< a nested type stands behind its owner: "OwnerType/Person"
    std::string class_name;
    std::string meaning;
    std::string extends;  ///< link, or empty
    std::vector<std::string> remarks;
    bool has_text = false;
    reference_row text;
    std::vector<reference_row> attributes;
    bool is_choice = false;
    std::vector<reference_row> children;
    std::vector<std::string> extended_by;  ///< links
    std::vector<std::string> used_in;      ///< links with the element's name
};

struct reference_simple_type {
    std::string title;
    std::string type;
    std::string values;  ///< empty for an enumeration
    std::string meaning;
    std::vector<std::string> literals;
};

struct reference_element {
    std::string name;
    std::string type;  ///< link
    std::vector<std::string> remarks;
    std::string meaning;
    std::vector<std::string> used_in;
};

struct reference_group {
    std::string title;  ///< "Group ColorSpace"
    std::string head;
    std::vector<reference_row> members;  ///< in order of their numbers, from 0
    std::vector<std::string> used_in;
};

struct reference_module {
    std::string name;
    std::string title;  ///< "Module color"
    std::string meaning;
    std::vector<reference_element> elements;
    std::vector<reference_group> groups;
    std::vector<reference_type> types;
    std::vector<reference_simple_type> simple_types;
};

struct reference_plan {
    std::string document_namespace;
    std::vector<reference_module> modules;  ///< those with content, in order of dependence
};

reference_plan plan_reference(const schema& source, const plan& model);

/// The anchor that Markdown gives to a heading.
std::string anchor_of(const std::string& title);

}  // namespace vrl_codegen
