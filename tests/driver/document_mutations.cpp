#include "tests/driver/document_mutations.h"

#include <libxml/parser.h>
#include <libxml/tree.h>

#include <memory>
#include <vector>

#include "runtime/error_codes.h"

namespace vrl_driver {
namespace {

using namespace qbxV2;

const xmlChar* as_xml(const char* text) { return reinterpret_cast<const xmlChar*>(text); }

xmlNode* next_element(xmlNode* node) {
    for (node = node->next; node != nullptr; node = node->next) {
        if (node->type == XML_ELEMENT_NODE) return node;
    }
    return nullptr;
}

bool has_elements(xmlNode* node) { return xmlFirstElementChild(node) != nullptr; }

bool is_outermost(xmlNode* node) { return node->parent->type != XML_ELEMENT_NODE; }

bool remove_element(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (is_outermost(node)) return false;
    xmlUnlinkNode(node);
    xmlFreeNode(node);
    return true;
}

bool double_element(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (is_outermost(node)) return false;
    return xmlAddNextSibling(node, xmlCopyNode(node, 1)) != nullptr;
}

bool swap_with_next(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (is_outermost(node)) return false;
    xmlNode* next = next_element(node);
    if (next == nullptr || xmlStrEqual(next->name, node->name)) return false;
    xmlUnlinkNode(node);
    return xmlAddNextSibling(next, node) != nullptr;
}

bool rename_element(void* element) {
    xmlNodeSetName(static_cast<xmlNode*>(element), as_xml("Unheard"));
    return true;
}

bool leave_namespace(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    xmlSetNs(node, nullptr);
    return true;
}

bool add_stranger_first(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (!has_elements(node)) return false;
    xmlNode* stranger = xmlNewDocNode(node->doc, node->ns, as_xml("Stranger"), nullptr);
    return xmlAddPrevSibling(xmlFirstElementChild(node), stranger) != nullptr;
}

bool add_stranger_last(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (!has_elements(node)) return false;
    return xmlAddChild(node, xmlNewDocNode(node->doc, node->ns, as_xml("Stranger"), nullptr)) != nullptr;
}

bool add_element_to_text(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (has_elements(node)) return false;
    return xmlAddChild(node, xmlNewDocNode(node->doc, node->ns, as_xml("Stranger"), nullptr)) != nullptr;
}

bool add_text_last(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (!has_elements(node)) return false;
    return xmlAddChild(node, xmlNewText(as_xml("stray text"))) != nullptr;
}

bool add_attribute(void* element) {
    return xmlNewProp(static_cast<xmlNode*>(element), as_xml("Unheard"), as_xml("of")) != nullptr;
}

bool remove_first_attribute(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    return node->properties != nullptr && xmlRemoveProp(node->properties) == 0;
}

bool spoil_first_attribute(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (node->properties == nullptr) return false;
    return xmlSetProp(node, node->properties->name, as_xml("\x7E nonsense")) != nullptr;
}

bool spoil_text(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (has_elements(node)) return false;
    xmlNodeSetContent(node, as_xml("~ nonsense"));
    return true;
}

bool exaggerate_text(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    if (has_elements(node)) return false;
    xmlNodeSetContent(node, as_xml("1e300"));
    return true;
}

bool empty_out(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    xmlNodeSetContent(node, nullptr);
    return true;
}

bool nil_it(void* element) {
    auto* node = static_cast<xmlNode*>(element);
    xmlNs* xsi = xmlSearchNs(node->doc, node, as_xml("xsi"));
    xmlNodeSetContent(node, nullptr);
    return xmlNewNsProp(node, xsi, as_xml("nil"), as_xml("true")) != nullptr;
}

void collect(xmlNode* node, std::vector<xmlNode*>& all) {
    all.push_back(node);
    for (xmlNode* child = xmlFirstElementChild(node); child != nullptr; child = next_element(child)) {
        collect(child, all);
    }
}

std::vector<xmlNode*> elements_of(xmlDoc* doc) {
    std::vector<xmlNode*> all;
    collect(xmlDocGetRootElement(doc), all);
    return all;
}

std::string path_of(xmlNode* node) {
    xmlChar* path = xmlGetNodePath(node);
    std::string text = reinterpret_cast<const char*>(path);
    xmlFree(path);
    return text;
}

std::string text_of(xmlDoc* doc) {
    xmlChar* bytes = nullptr;
    int size = 0;
    xmlDocDumpMemory(doc, &bytes, &size);
    std::string text(reinterpret_cast<const char*>(bytes), static_cast<std::size_t>(size));
    xmlFree(bytes);
    return text;
}

using document_pointer = std::unique_ptr<xmlDoc, decltype(&xmlFreeDoc)>;

}  // namespace

const std::vector<mutation>& mutations() {
    // An element that its place does not expect leaves something missing, or an end that is none.
    static const std::set<int> k_unknown_element = {EQBX_BAD_END_OF_ELEMENT, EQBX_ELEMENT_NOT_FOUND,
                                                    EQBX_MANDATORY_ELEMENT_MISSING, EQBX_UNKNOWN_ELEMENT};
    static const std::set<int> k_emptied = {EQBX_LENGTH_TOO_SHORT, EQBX_UNEXPECTED_EMPTY_ELEMENT,
                                            EQBX_VALUE_BAD_FORMAT, EQBX_VALUE_NOT_ENUMERATED};
    static const std::vector<mutation> all = {
        {"an element is missing",
         {EQBX_MANDATORY_ELEMENT_MISSING, EQBX_UNEXPECTED_EMPTY_ELEMENT},
         remove_element},
        {"an element stands twice",
         {EQBX_BAD_END_OF_ELEMENT, EQBX_MANDATORY_ELEMENT_MISSING},
         double_element},
        {"two elements stand in the wrong order",
         {EQBX_BAD_END_OF_ELEMENT, EQBX_MANDATORY_ELEMENT_MISSING},
         swap_with_next},
        {"an element has a name that the format does not know", k_unknown_element, rename_element},
        {"an element stands in no namespace", k_unknown_element, leave_namespace},
        {"a stranger stands first", k_unknown_element, add_stranger_first},
        {"a stranger stands last", {EQBX_BAD_END_OF_ELEMENT}, add_stranger_last},
        {"an element stands where text belongs",
         {EQBX_BAD_END_OF_ELEMENT, EQBX_ELEMENT_VALUE_UNREADABLE},
         add_element_to_text},
        {"text stands where elements belong", {EQBX_BAD_END_OF_ELEMENT}, add_text_last},
        {"an attribute has a name that the format does not know", {EQBX_UNEXPECTED_ATTRIBUTE}, add_attribute},
        {"an attribute is missing", {EQBX_REQUIRED_ATTRIBUTE_MISSING}, remove_first_attribute},
        {"an attribute has a senseless value",
         {EQBX_VALUE_BAD_FORMAT, EQBX_VALUE_NOT_ENUMERATED},
         spoil_first_attribute},
        {"an element has a senseless value",
         {EQBX_VALUE_BAD_FORMAT, EQBX_VALUE_NOT_ENUMERATED, EQBX_BAD_END_OF_ELEMENT, EQBX_LENGTH_TOO_LONG},
         spoil_text},
        {"an element has an enormous value",
         {EQBX_VALUE_BAD_FORMAT, EQBX_VALUE_NOT_ENUMERATED, EQBX_VALUE_TOO_LARGE, EQBX_BAD_END_OF_ELEMENT,
          EQBX_LENGTH_TOO_LONG},
         exaggerate_text},
        {"an element is empty", k_emptied, empty_out},
        {"an element is nil", k_emptied, nil_it},
    };
    return all;
}

void for_each_mutation(
    const mutation& m, const std::string& document,
    const std::function<void(const std::string& path, const std::string& mutated)>& visit) {
    const document_pointer original(
        xmlReadMemory(document.data(), static_cast<int>(document.size()), nullptr, nullptr, XML_PARSE_NONET),
        &xmlFreeDoc);
    const std::size_t count = elements_of(original.get()).size();
    for (std::size_t i = 0; i < count; ++i) {
        const document_pointer doc(xmlCopyDoc(original.get(), 1), &xmlFreeDoc);
        xmlNode* element = elements_of(doc.get())[i];
        const std::string path = path_of(element);
        if (m.apply(element)) visit(path, text_of(doc.get()));
    }
}

}  // namespace vrl_driver
