#pragma once

#include <libxml/tree.h>

#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

/// The little of libxml2's tree that reading a schema takes.
namespace vrl_codegen {

/// A fault in the schema: file, line, what was wrong.
class schema_error : public std::runtime_error {
public:
    schema_error(const xmlNode* where, const std::string& what);
    explicit schema_error(const std::string& what) : std::runtime_error(what) {}
};

struct document_deleter {
    void operator()(xmlDoc* doc) const { xmlFreeDoc(doc); }
};
using document = std::unique_ptr<xmlDoc, document_deleter>;

/// Throws `schema_error` when the file cannot be read or is not well formed.
document parse_file(const std::string& path);

const xmlNode* root_of(const document& doc);
std::string local_name(const xmlNode* node);
std::string namespace_of(const xmlNode* node);
bool has_attribute(const xmlNode* node, const char* name);
/// Empty when absent.
std::string attribute(const xmlNode* node, const char* name);
std::vector<const xmlNode*> child_elements(const xmlNode* node);
/// The text below a node, white space folded, ends trimmed.
std::string folded_text(const xmlNode* node);
/// The part of a qualified name behind the colon.
std::string without_prefix(const std::string& qualified);

}  // namespace vrl_codegen
