#include "codegen/schema_grammar.h"

#include <libxml/xmlschemas.h>

#include <map>
#include <memory>
#include <set>

namespace vrl_codegen {
namespace {

using names = std::set<std::string>;

/// What an element of XML Schema may carry and hold.
struct construct {
    names attributes;
    names children;
};

/// Keyed by name; where the parent matters, by "parent/name", which is looked up first.
const std::map<std::string, construct>& constructs() {
    static const names type_content = {"annotation",     "sequence",      "choice",
                                       "complexContent", "simpleContent", "attribute"};
    static const std::map<std::string, construct> known = {
        {"schema",
         {{"targetNamespace", "elementFormDefault", "attributeFormDefault"},
          {"annotation", "include", "simpleType", "complexType", "element"}}},
        {"include", {{"schemaLocation"}, {}}},
        {"schema/element",
         {{"name", "type", "abstract", "substitutionGroup", "nillable"}, {"annotation", "complexType"}}},
        {"schema/complexType", {{"name", "abstract"}, type_content}},
        {"schema/simpleType", {{"name"}, {"annotation", "restriction"}}},
        {"complexType", {{}, type_content}},
        {"complexContent", {{}, {"extension"}}},
        {"simpleContent", {{}, {"extension"}}},
        {"complexContent/extension", {{"base"}, {"sequence", "attribute"}}},
        {"simpleContent/extension", {{"base"}, {"attribute"}}},
        {"sequence", {{}, {"element", "any"}}},
        {"choice", {{}, {"element"}}},
        {"sequence/element",
         {{"name", "type", "ref", "minOccurs", "maxOccurs", "nillable"},
          {"annotation", "simpleType", "complexType"}}},
        {"choice/element", {{"name", "type"}, {"annotation", "simpleType", "complexType"}}},
        {"any", {{"namespace", "processContents", "minOccurs", "maxOccurs"}, {"annotation"}}},
        {"attribute", {{"name", "type", "use", "default"}, {"annotation", "simpleType"}}},
        {"simpleType", {{}, {"restriction"}}},
        {"restriction",
         {{"base"},
          {"minInclusive", "minExclusive", "maxInclusive", "maxExclusive", "length", "minLength", "maxLength",
           "enumeration", "pattern"}}},
        {"minInclusive", {{"value"}, {}}},
        {"minExclusive", {{"value"}, {}}},
        {"maxInclusive", {{"value"}, {}}},
        {"maxExclusive", {{"value"}, {}}},
        {"length", {{"value"}, {}}},
        {"minLength", {{"value"}, {}}},
        {"maxLength", {{"value"}, {}}},
        {"enumeration", {{"value"}, {}}},
        {"pattern", {{"value"}, {}}},
        {"annotation", {{}, {"documentation", "appinfo"}}},
    };
    return known;
}

/// Attributes of which the compiler doesn't know all values that XML Schema allows.
const std::map<std::string, names>& known_values() {
    static const std::map<std::string, names> known = {
        {"elementFormDefault", {"qualified"}},
        {"attributeFormDefault", {"unqualified"}},
        {"abstract", {"true", "false"}},
        {"nillable", {"true", "false"}},
        {"minOccurs", {"0", "1"}},
        {"maxOccurs", {"1", "unbounded"}},
        {"use", {"required", "optional"}},
        {"namespace", {"##any"}},
        {"processContents", {"skip"}},
    };
    return known;
}

/// An annotation of the compiler's own: where it stands, keyed as above, and the attribute that it needs.
struct note {
    names places;
    std::string attribute;
};

const std::map<std::string, note>& known_notes() {
    static const std::map<std::string, note> known = {
        {"polymorphic", {{"schema/complexType"}, ""}},
        {"class", {{"element/complexType"}, "name"}},
        {"owned", {{"sequence/element"}, ""}},
        {"read-optional", {{"sequence/element"}, ""}},
        {"no-presence", {{"sequence/element"}, ""}},
        {"always-written", {{"extension/attribute", "complexType/attribute"}, ""}},
        {"initial", {{"sequence/element"}, "value"}},
        {"empty-ok", {{"schema/complexType", "element/complexType"}, ""}},
        {"optional-text", {{"schema/complexType", "element/complexType"}, ""}},
        {"no-standalone", {{"schema/element"}, ""}},
        {"document", {{"schema/element"}, ""}},
    };
    return known;
}

std::string in_context(const xmlNode* node) { return local_name(node->parent) + "/" + local_name(node); }

bool is_xs(const xmlNode* node) { return namespace_of(node) == k_xs_namespace; }

const construct& construct_of(const xmlNode* node) {
    const bool outermost = node->parent->type != XML_ELEMENT_NODE;
    auto found = constructs().find(outermost ? local_name(node) : in_context(node));
    if (found == constructs().end()) found = constructs().find(local_name(node));
    if (found == constructs().end() || !is_xs(node) || outermost != (local_name(node) == "schema")) {
        throw schema_error(node, "unknown construct " + local_name(node));
    }
    return found->second;
}

void check_attributes(const xmlNode* node, const names& known) {
    for (const xmlAttr* found = node->properties; found != nullptr; found = found->next) {
        const std::string name = reinterpret_cast<const char*>(found->name);
        if (found->ns != nullptr || known.count(name) == 0) {
            const std::string owner = local_name(node);
            throw schema_error(node,
                               std::string("unknown attribute ").append(name).append(" of ").append(owner));
        }
        const auto values = known_values().find(name);
        const std::string value = attribute(node, name.c_str());
        if (values != known_values().end() && values->second.count(value) == 0) {
            throw schema_error(node,
                               std::string("unknown value '").append(value).append("' of ").append(name));
        }
    }
}

void check_note(const xmlNode* node, const xmlNode* holder) {
    const std::string name = local_name(node);
    const auto found = known_notes().find(name);
    if (found == known_notes().end() || namespace_of(node) != k_note_namespace) {
        throw schema_error(node, "unknown annotation " + name);
    }
    const note& known = found->second;
    if (known.places.count(in_context(holder)) == 0) {
        throw schema_error(node, "the annotation " + name + " means nothing on " + in_context(holder));
    }
    check_attributes(node, known.attribute.empty() ? names() : names{known.attribute});
    if (!known.attribute.empty() && attribute(node, known.attribute.c_str()).empty()) {
        throw schema_error(node, "the annotation " + name + " needs the attribute " + known.attribute);
    }
    if (!child_elements(node).empty()) throw schema_error(node, "the annotation " + name + " holds nothing");
}

void check_annotation(const xmlNode* node) {
    for (const xmlNode* part : child_elements(node)) {
        if (local_name(part) != "appinfo") continue;
        check_attributes(part, {});
        for (const xmlNode* found : child_elements(part)) check_note(found, node->parent);
    }
}

void check_node(const xmlNode* node) {
    const construct& known = construct_of(node);
    check_attributes(node, known.attributes);
    for (const xmlNode* child : child_elements(node)) {
        const std::string name = local_name(child);
        if (!is_xs(child) || known.children.count(name) == 0) {
            throw schema_error(child, "unknown construct " + name + " in " + local_name(node));
        }
        if (local_name(node) != "annotation") check_node(child);
    }
    if (local_name(node) == "annotation") check_annotation(node);
}

struct release {
    void operator()(xmlSchema* p) const { xmlSchemaFree(p); }
    void operator()(xmlSchemaParserCtxt* p) const { xmlSchemaFreeParserCtxt(p); }
};

}  // namespace

void check_is_schema(const std::string& path) {
    complaint first{path, std::string(), std::string()};
    const std::unique_ptr<xmlSchemaParserCtxt, release> context(xmlSchemaNewParserCtxt(path.c_str()));
    xmlSchemaSetParserStructuredErrors(context.get(), note_complaint, &first);
    const std::unique_ptr<xmlSchema, release> compiled(xmlSchemaParse(context.get()));
    if (!first.what.empty()) throw schema_error(first.place, first.what);
    if (compiled == nullptr) throw schema_error(place_of(path, 0), "is no schema");
}

void check_is_known(const document& module) { check_node(root_of(module)); }

}  // namespace vrl_codegen
