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
    /// `place` is "file:line".
    schema_error(const std::string& place, const std::string& what);
};

/// The first error that libxml2 reports about a file; those behind it mostly follow from it.
struct complaint {
    std::string path;  ///< of the file, where libxml2 doesn't name one
    std::string place;
    std::string what;

    /// Any of the texts may be null.
    void note(const char* file, long line, const char* message);
};

/// A handler of structured errors with a `complaint` as its context. Generic, as the constness of the error
/// differs between versions of libxml2.
inline constexpr auto note_complaint = [](void* context, auto* error) {
    static_cast<complaint*>(context)->note(error->file, error->line, error->message);
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
/// "file:line", without the folder.
std::string place_of(const xmlNode* node);
std::string place_of(const std::string& path, long line);
bool has_attribute(const xmlNode* node, const char* name);
/// Empty when absent.
std::string attribute(const xmlNode* node, const char* name);
std::vector<const xmlNode*> child_elements(const xmlNode* node);
/// The text below a node, white space folded, ends trimmed.
std::string folded_text(const xmlNode* node);
/// The part of a qualified name behind the colon.
std::string without_prefix(const std::string& qualified);
/// The namespace that a qualified name in an attribute of `node` stands for; empty for none.
std::string namespace_of_name(const xmlNode* node, const std::string& qualified);

}  // namespace vrl_codegen
