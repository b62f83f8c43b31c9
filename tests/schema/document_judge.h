#pragma once

#include <string>

namespace schema_tests {

/// The full name of a file of the schema.
std::string schema_file(const std::string& name);

/// What libxml2 has to say of the schema file `name` when it compiles it: empty if nothing.
std::string complaints_about_schema(const std::string& name);

/// What libxml2 has to say of a document under vrl.xsd: empty if the document is valid.
std::string complaints(const std::string& document);

}  // namespace schema_tests
