#include "codegen/xml_dom.h"

#include <libxml/parser.h>

namespace vrl_codegen {
namespace {

std::string text_of(const xmlChar* text) {
    return text == nullptr ? std::string() : std::string(reinterpret_cast<const char*>(text));
}

std::string place_of(const xmlNode* node) {
    std::string file = node->doc != nullptr ? text_of(node->doc->URL) : std::string();
    return file.substr(file.find_last_of('/') + 1) + ":" + std::to_string(xmlGetLineNo(node));
}

std::string take(xmlChar* text) {
    std::string copy = text_of(text);
    xmlFree(text);
    return copy;
}

const xmlChar* as_xml(const char* text) { return reinterpret_cast<const xmlChar*>(text); }

}  // namespace

schema_error::schema_error(const xmlNode* where, const std::string& what)
    : std::runtime_error(place_of(where) + ": " + what) {}

document parse_file(const std::string& path) {
    document doc(xmlReadFile(path.c_str(), nullptr, XML_PARSE_NONET));
    if (!doc || xmlDocGetRootElement(doc.get()) == nullptr) {
        throw schema_error(path + ": cannot be read as XML");
    }
    return doc;
}

const xmlNode* root_of(const document& doc) { return xmlDocGetRootElement(doc.get()); }

std::string local_name(const xmlNode* node) { return text_of(node->name); }

std::string namespace_of(const xmlNode* node) {
    return node->ns == nullptr ? std::string() : text_of(node->ns->href);
}

bool has_attribute(const xmlNode* node, const char* name) {
    return xmlHasProp(node, as_xml(name)) != nullptr;
}

std::string attribute(const xmlNode* node, const char* name) {
    return has_attribute(node, name) ? take(xmlGetProp(node, as_xml(name))) : std::string();
}

std::vector<const xmlNode*> child_elements(const xmlNode* node) {
    std::vector<const xmlNode*> children;
    for (const xmlNode* child = node->children; child != nullptr; child = child->next) {
        if (child->type == XML_ELEMENT_NODE) children.push_back(child);
    }
    return children;
}

std::string folded_text(const xmlNode* node) {
    const std::string raw = take(xmlNodeGetContent(node));
    std::string folded;
    bool pending = false;
    for (const char c : raw) {
        if (c == ' ' || c == '\t' || c == '\n' || c == '\r') {
            pending = !folded.empty();
            continue;
        }
        if (pending) folded.push_back(' ');
        pending = false;
        folded.push_back(c);
    }
    return folded;
}

std::string without_prefix(const std::string& qualified) { return qualified.substr(qualified.find(':') + 1); }

}  // namespace vrl_codegen
