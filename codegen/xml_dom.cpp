#include "codegen/xml_dom.h"

#include <libxml/parser.h>

namespace vrl_codegen {
namespace {

std::string text_of(const xmlChar* text) {
    return text == nullptr ? std::string() : std::string(reinterpret_cast<const char*>(text));
}

std::string take(xmlChar* text) {
    std::string copy = text_of(text);
    xmlFree(text);
    return copy;
}

const xmlChar* as_xml(const char* text) { return reinterpret_cast<const xmlChar*>(text); }

}  // namespace

schema_error::schema_error(const xmlNode* where, const std::string& what)
    : schema_error(place_of(where), what) {}

schema_error::schema_error(const std::string& place, const std::string& what)
    : std::runtime_error(place + ": " + what) {}

void complaint::note(const char* file, long line, const char* message) {
    if (!what.empty()) return;
    place = place_of(file != nullptr ? file : path, line);
    what = message != nullptr ? message : "cannot be read";
    what.erase(what.find_last_not_of('\n') + 1);
}

document parse_file(const std::string& path) {
    complaint first{path, std::string(), std::string()};
    xmlSetStructuredErrorFunc(&first, note_complaint);
    document doc(xmlReadFile(path.c_str(), nullptr, XML_PARSE_NONET));
    xmlSetStructuredErrorFunc(nullptr, nullptr);
    if (doc == nullptr) throw schema_error(first.place, first.what);
    return doc;
}

const xmlNode* root_of(const document& doc) { return xmlDocGetRootElement(doc.get()); }

std::string local_name(const xmlNode* node) { return text_of(node->name); }

std::string namespace_of(const xmlNode* node) {
    return node->ns == nullptr ? std::string() : text_of(node->ns->href);
}

std::string place_of(const std::string& path, long line) {
    return path.substr(path.find_last_of('/') + 1).append(":").append(std::to_string(line));
}

std::string place_of(const xmlNode* node) { return place_of(text_of(node->doc->URL), xmlGetLineNo(node)); }

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

std::string namespace_of_name(const xmlNode* node, const std::string& qualified) {
    const std::size_t colon = qualified.find(':');
    const std::string prefix = colon == std::string::npos ? std::string() : qualified.substr(0, colon);
    const xmlNs* found =
        xmlSearchNs(node->doc, const_cast<xmlNode*>(node), prefix.empty() ? nullptr : as_xml(prefix.c_str()));
    return found == nullptr ? std::string() : text_of(found->href);
}

}  // namespace vrl_codegen
