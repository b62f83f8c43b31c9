#include "tests/examples/declarations.h"

#include <libxml/parser.h>

#include <cstring>
#include <filesystem>
#include <stdexcept>

namespace vrl_test {
namespace {

bool is(const xmlNode* node, const char* name) {
    return node->type == XML_ELEMENT_NODE &&
           std::strcmp(reinterpret_cast<const char*>(node->name), name) == 0;
}

std::string attribute(const xmlNode* node, const char* name) {
    xmlChar* value = xmlGetNoNsProp(node, reinterpret_cast<const xmlChar*>(name));
    std::string text = value != nullptr ? reinterpret_cast<const char*>(value) : "";
    xmlFree(value);
    return text;
}

/// The local part: all names of the schema are in one namespace.
std::string local(const std::string& name) { return name.substr(name.find(':') + 1); }

std::string name_of(const xmlNode* node) { return reinterpret_cast<const char*>(node->name); }

/// The names of the declarations around one, outermost first.
std::string path_of(const xmlNode* declaration) {
    std::string path;
    for (const xmlNode* node = declaration; node != nullptr && node->type == XML_ELEMENT_NODE;
         node = node->parent) {
        const std::string name = attribute(node, "name");
        if (!name.empty()) path.insert(0, path.empty() ? name : name + '/');
    }
    return path;
}

}  // namespace

declarations::declarations(const std::string& schema_folder) {
    for (const auto& entry : std::filesystem::directory_iterator(schema_folder)) {
        if (entry.path().extension() == ".xsd") add_module(entry.path().string());
    }
}

void declarations::add_module(const std::string& path) {
    m_modules.emplace_back(xmlReadFile(path.c_str(), nullptr, 0));
    if (m_modules.back() == nullptr) throw std::runtime_error("cannot read " + path);
    const xmlNode* root = xmlDocGetRootElement(m_modules.back().get());
    for (const xmlNode* node = root->children; node != nullptr; node = node->next) {
        if (is(node, "element")) m_elements[attribute(node, "name")] = node;
        if (is(node, "complexType")) m_types[attribute(node, "name")] = node;
    }
    note(root, std::filesystem::path(path).filename().string());
}

void declarations::note(const xmlNode* declaration, const std::string& module) {
    const bool declares = is(declaration, "element") || is(declaration, "attribute");
    if (declares && !attribute(declaration, "name").empty() && attribute(declaration, "abstract") != "true") {
        m_declared[declaration] = module + ": " + path_of(declaration);
    }
    for (const xmlNode* node = declaration->children; node != nullptr; node = node->next) note(node, module);
}

void declarations::use(const std::string& document_path) {
    const std::unique_ptr<xmlDoc, free_document> document(xmlReadFile(document_path.c_str(), nullptr, 0));
    if (document == nullptr) throw std::runtime_error("cannot read " + document_path);
    const xmlNode* root = xmlDocGetRootElement(document.get());
    walk(root, m_elements.at(name_of(root)));
}

void declarations::walk(const xmlNode* element, const xmlNode* declaration) {
    m_used.insert(declaration);
    const xmlNode* type = instance_type(element, declaration);
    for (const xmlAttr* given = element->properties; given != nullptr; given = given->next) {
        if (given->ns != nullptr) continue;  // xsi:nil and xsi:type, which the schema need not declare
        const std::string name = reinterpret_cast<const char*>(given->name);
        const xmlNode* found = type != nullptr ? find(type, "attribute", name) : nullptr;
        if (found == nullptr) throw std::runtime_error("attribute not declared: " + name);
        m_used.insert(found);
    }
    for (const xmlNode* child = element->children; child != nullptr; child = child->next) {
        if (child->type == XML_ELEMENT_NODE) walk_child(child, type);
    }
}

void declarations::walk_child(const xmlNode* child, const xmlNode* type) {
    const std::string name = name_of(child);
    const xmlNode* found = type != nullptr ? find(type, "element", name) : nullptr;
    if (found == nullptr && type != nullptr && find(type, "any", "") != nullptr) found = m_elements.at(name);
    if (found == nullptr) throw std::runtime_error("element not declared: " + name);
    walk(child, found);
}

const xmlNode* declarations::type_of(const xmlNode* declaration) const {
    const auto named = m_types.find(local(attribute(declaration, "type")));
    if (named != m_types.end()) return named->second;
    for (const xmlNode* node = declaration->children; node != nullptr; node = node->next) {
        if (is(node, "complexType")) return node;
    }
    return nullptr;
}

const xmlNode* declarations::instance_type(const xmlNode* element, const xmlNode* declaration) const {
    for (const xmlAttr* given = element->properties; given != nullptr; given = given->next) {
        if (given->ns != nullptr && std::strcmp(reinterpret_cast<const char*>(given->name), "type") == 0) {
            return m_types.at(local(reinterpret_cast<const char*>(given->children->content)));
        }
    }
    return type_of(declaration);
}

const xmlNode* declarations::base_of(const xmlNode* type) const {
    for (const xmlNode* content = type->children; content != nullptr; content = content->next) {
        if (!is(content, "complexContent") && !is(content, "simpleContent")) continue;
        for (const xmlNode* node = content->children; node != nullptr; node = node->next) {
            const auto base = m_types.find(local(attribute(node, "base")));
            if (is(node, "extension") && base != m_types.end()) return base->second;
        }
    }
    return nullptr;
}

const xmlNode* declarations::find(const xmlNode* type, const char* kind, const std::string& name) const {
    for (; type != nullptr; type = base_of(type)) {
        if (const xmlNode* found = find_within(type, kind, name)) return found;
    }
    return nullptr;
}

/// Looks through compositors, but not into the types of the elements that it meets.
const xmlNode* declarations::find_within(const xmlNode* node, const char* kind,
                                         const std::string& name) const {
    for (const xmlNode* inner = node->children; inner != nullptr; inner = inner->next) {
        const std::string reference = local(attribute(inner, "ref"));
        if (is(inner, kind) && reference.empty() && attribute(inner, "name") == name) return inner;
        if (is(inner, "element")) {
            const xmlNode* found = reference.empty() ? nullptr : find_by_reference(reference, name);
            if (found != nullptr) return found;
        } else if (const xmlNode* found = find_within(inner, kind, name)) {
            return found;
        }
    }
    return nullptr;
}

/// A reference stands for the element itself and for all that can substitute it.
const xmlNode* declarations::find_by_reference(const std::string& reference, const std::string& name) const {
    const auto found = m_elements.find(name);
    if (found == m_elements.end()) return nullptr;
    const bool substitutes = local(attribute(found->second, "substitutionGroup")) == reference;
    return name == reference || substitutes ? found->second : nullptr;
}

std::vector<std::string> declarations::unused() const {
    std::vector<std::string> names;
    for (const auto& [declaration, name] : m_declared) {
        if (m_used.count(declaration) == 0) names.push_back(name);
    }
    return names;
}

}  // namespace vrl_test
