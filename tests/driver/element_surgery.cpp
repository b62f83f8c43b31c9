#include "tests/driver/element_surgery.h"

#include <libxml/parser.h>
#include <libxml/tree.h>

#include <stdexcept>

#include "V2/format.h"

namespace vrl_driver {
namespace {

const xmlChar* as_xml(const std::string& text) { return reinterpret_cast<const xmlChar*>(text.c_str()); }

}  // namespace

struct element_surgery::tree {
    xmlDoc* doc;
    xmlNode* element;

    xmlNode* child(const std::string& local_name) const {
        for (xmlNode* node = element->children; node != nullptr; node = node->next) {
            if (node->type == XML_ELEMENT_NODE && xmlStrEqual(node->name, as_xml(local_name))) return node;
        }
        return nullptr;
    }

    /// As escaped text: what stands between the tags, whatever it is.
    void put_text(xmlNode* node, const std::string& text) const {
        xmlNodeSetContent(node, nullptr);
        xmlNodeAddContent(node, as_xml(text));
    }
};

element_surgery::element_surgery(const std::string& xml) {
    const std::string whole = std::string("<w xmlns:Vrl=\"") + vrl_v2::k_document_namespace_uri +
                              "\" xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\">" + xml + "</w>";
    xmlDoc* doc =
        xmlReadMemory(whole.data(), static_cast<int>(whole.size()), nullptr, nullptr, XML_PARSE_NONET);
    if (doc == nullptr) throw std::runtime_error("not well formed: " + xml);
    xmlNode* element = xmlDocGetRootElement(doc)->children;
    while (element != nullptr && element->type != XML_ELEMENT_NODE) element = element->next;
    m_tree = new tree{doc, element};
}

element_surgery::~element_surgery() {
    xmlFreeDoc(m_tree->doc);
    delete m_tree;
}

bool element_surgery::has_elements() const { return xmlChildElementCount(m_tree->element) != 0; }

bool element_surgery::has_child(const std::string& local_name) const {
    return m_tree->child(local_name) != nullptr;
}

void element_surgery::remove_children(const std::string& local_name) {
    while (xmlNode* node = m_tree->child(local_name)) {
        xmlUnlinkNode(node);
        xmlFreeNode(node);
    }
}

void element_surgery::set_child_text(const std::string& local_name, const std::string& text) {
    m_tree->put_text(m_tree->child(local_name), text);
}

void element_surgery::set_attribute(const std::string& name, const std::string& text) {
    xmlSetProp(m_tree->element, as_xml(name), as_xml(text));
}

void element_surgery::remove_attribute(const std::string& name) {
    xmlUnsetProp(m_tree->element, as_xml(name));
}

void element_surgery::set_text(const std::string& text) { m_tree->put_text(m_tree->element, text); }

void element_surgery::remove_content() { xmlNodeSetContent(m_tree->element, nullptr); }

std::string element_surgery::xml() const {
    xmlBuffer* buffer = xmlBufferCreate();
    xmlNodeDump(buffer, m_tree->doc, m_tree->element, 0, 0);
    std::string text = reinterpret_cast<const char*>(xmlBufferContent(buffer));
    xmlBufferFree(buffer);
    return text;
}

}  // namespace vrl_driver
