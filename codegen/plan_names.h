#pragma once

#include <map>
#include <string>

#include "codegen/schema_model.h"

namespace vrl_codegen {

/// A part of a name that C++ can take: everything else becomes an underscore.
std::string identifier(const std::string& text);
bool is_identifier(const std::string& name);

/// "member_literal", as the enumerator of an enumerated text is called.
std::string enumerator(const std::string& member, const std::string& literal);

/// The class that holds any one member of a substitution group.
std::string group_class_name(const std::string& head);

/// Which class belongs to which declaration. Throws `schema_error` when two want the same name.
class class_names {
public:
    explicit class_names(const schema& source);

    const std::string& of_type(const std::string& key) const { return m_of_type.at(key); }

private:
    void take(const std::string& name, const std::string& place, const std::string& what);

    std::map<std::string, std::string> m_taken;  ///< by name: who has it
    std::map<std::string, std::string> m_of_type;
};

}  // namespace vrl_codegen
