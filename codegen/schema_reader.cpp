#include "codegen/schema_reader.h"

#include <algorithm>
#include <set>

#include "codegen/xml_dom.h"

namespace vrl_codegen {
namespace {

constexpr const char k_xs[] = "http://www.w3.org/2001/XMLSchema";
constexpr const char k_annotations[] = "urn:vrl:codegen";

class reader {
public:
    schema read(const std::string& path) {
        load(path);
        for (const auto& [module, doc] : m_documents) {
            for (const xmlNode* node : child_elements(root_of(doc))) read_global(module, node);
        }
        return std::move(m_schema);
    }

private:
    void load(const std::string& path) {
        const std::string folder = path.substr(0, path.find_last_of('/') + 1);
        const std::string file = path.substr(folder.size());
        const std::string module = file.substr(0, file.find('.'));
        if (!m_seen.insert(module).second) return;
        document doc = parse_file(path);
        const xmlNode* root = root_of(doc);
        if (!is_xs(root, "schema")) throw schema_error(root, "expected xs:schema");
        m_schema.target_namespace = attribute(root, "targetNamespace");
        for (const xmlNode* node : child_elements(root)) {
            if (is_xs(node, "include")) load(folder + attribute(node, "schemaLocation"));
            if (is_xs(node, "simpleType")) m_simple_types[attribute(node, "name")] = node;
        }
        m_schema.modules.push_back(module);
        m_documents.emplace_back(module, std::move(doc));
    }

    static bool is_xs(const xmlNode* node, const char* name) {
        return namespace_of(node) == k_xs && local_name(node) == name;
    }

    void read_global(const std::string& module, const xmlNode* node) {
        if (is_xs(node, "include") || is_xs(node, "simpleType") || is_xs(node, "annotation")) return;
        if (is_xs(node, "complexType")) {
            read_complex_type(module, node, attribute(node, "name"));
        } else if (is_xs(node, "element")) {
            read_global_element(module, node);
        } else {
            throw schema_error(node, "unknown declaration xs:" + local_name(node));
        }
    }

    void read_global_element(const std::string& module, const xmlNode* node) {
        global_element element;
        element.name = attribute(node, "name");
        element.module = module;
        element.type_key = without_prefix(attribute(node, "type"));
        element.substitution_group = without_prefix(attribute(node, "substitutionGroup"));
        element.is_abstract = attribute(node, "abstract") == "true";
        element.nillable = attribute(node, "nillable") == "true";
        read_annotation(node, element.notes, element.documentation);
        for (const xmlNode* child : child_elements(node)) {
            if (!is_xs(child, "complexType")) continue;
            element.anonymous = true;
            element.type_key = "/" + element.name;
            complex_type& type = read_complex_type(module, child, std::string(), element.type_key);
            type.element_name = element.name;
        }
        if (element.type_key.empty()) throw schema_error(node, "a global element needs a type");
        m_schema.elements.push_back(std::move(element));
    }

    complex_type& read_complex_type(const std::string& module, const xmlNode* node, const std::string& name,
                                    const std::string& key = std::string()) {
        complex_type type;
        type.name = name;
        type.key = name.empty() ? key : name;
        type.module = module;
        type.is_abstract = attribute(node, "abstract") == "true";
        read_annotation(node, type.notes, type.documentation);
        read_content(module, node, type);
        m_schema.types.push_back(std::move(type));
        return m_schema.types.back();
    }

    void read_content(const std::string& module, const xmlNode* node, complex_type& type) {
        for (const xmlNode* child : child_elements(node)) {
            if (is_xs(child, "annotation")) continue;
            if (is_xs(child, "attribute")) {
                type.attributes.push_back(read_attribute(child));
            } else if (is_xs(child, "sequence") || is_xs(child, "choice")) {
                type.kind =
                    is_xs(child, "choice") ? complex_type::content::choice : complex_type::content::sequence;
                for (const xmlNode* particle : child_elements(child)) {
                    if (is_xs(particle, "annotation")) continue;
                    type.elements.push_back(read_particle(module, particle, type));
                }
            } else if (is_xs(child, "complexContent")) {
                read_extension(module, child, type);
            } else if (is_xs(child, "simpleContent")) {
                type.kind = complex_type::content::simple;
                read_extension(module, child, type);
            } else {
                throw schema_error(child, "unknown content xs:" + local_name(child));
            }
        }
    }

    void read_extension(const std::string& module, const xmlNode* node, complex_type& type) {
        for (const xmlNode* extension : child_elements(node)) {
            if (is_xs(extension, "annotation")) continue;
            if (!is_xs(extension, "extension")) throw schema_error(extension, "only xs:extension is known");
            const std::string base = attribute(extension, "base");
            if (is_xs(node, "simpleContent")) {
                type.text = resolve_simple(extension, base);
            } else {
                type.base = without_prefix(base);
            }
            read_content(module, extension, type);
        }
    }

    element_declaration read_particle(const std::string& module, const xmlNode* node,
                                      const complex_type& owner) {
        element_declaration element;
        read_annotation(node, element.notes, element.documentation);
        if (has_attribute(node, "minOccurs")) {
            element.min_occurs = static_cast<unsigned>(std::stoul(attribute(node, "minOccurs")));
        }
        if (has_attribute(node, "maxOccurs")) {
            const std::string most = attribute(node, "maxOccurs");
            if (most != "unbounded" && most != "1") throw schema_error(node, "maxOccurs is 1 or unbounded");
            element.repeated = most == "unbounded";
        }
        if (element.min_occurs > 1) throw schema_error(node, "minOccurs is 0 or 1");
        if (is_xs(node, "any")) {
            element.name = "any";
            element.kind = element_declaration::form::any;
        } else if (is_xs(node, "element")) {
            read_local_element(module, node, owner, element);
        } else {
            throw schema_error(node, "unknown particle xs:" + local_name(node));
        }
        return element;
    }

    void read_local_element(const std::string& module, const xmlNode* node, const complex_type& owner,
                            element_declaration& element) {
        element.nillable = attribute(node, "nillable") == "true";
        if (has_attribute(node, "ref")) {
            element.kind = element_declaration::form::reference;
            element.name = without_prefix(attribute(node, "ref"));
            return;
        }
        element.name = attribute(node, "name");
        if (has_attribute(node, "type")) {
            const std::string type = attribute(node, "type");
            if (is_simple(node, type)) {
                element.simple = resolve_simple(node, type);
            } else {
                element.kind = element_declaration::form::named_type;
                element.type_name = without_prefix(type);
            }
            return;
        }
        for (const xmlNode* child : child_elements(node)) {
            if (is_xs(child, "simpleType")) element.simple = read_simple_type(child, std::string());
            if (is_xs(child, "complexType")) {
                element.kind = element_declaration::form::anonymous_type;
                element.anonymous_type_key = owner.key + "/" + element.name;
                complex_type& type =
                    read_complex_type(module, child, std::string(), element.anonymous_type_key);
                type.element_name = element.name;
            }
        }
        if (element.kind == element_declaration::form::simple && element.simple.built_in.empty()) {
            throw schema_error(node, "the element " + element.name + " has no type");
        }
    }

    attribute_declaration read_attribute(const xmlNode* node) {
        attribute_declaration declared;
        declared.name = attribute(node, "name");
        declared.required = attribute(node, "use") == "required";
        if (has_attribute(node, "default")) declared.default_value = attribute(node, "default");
        read_annotation(node, declared.notes, declared.documentation);
        if (has_attribute(node, "type")) {
            declared.type = resolve_simple(node, attribute(node, "type"));
        } else {
            for (const xmlNode* child : child_elements(node)) {
                if (is_xs(child, "simpleType")) declared.type = read_simple_type(child, std::string());
            }
        }
        if (declared.type.built_in.empty()) throw schema_error(node, "an attribute needs a simple type");
        return declared;
    }

    static std::string namespace_of_name(const xmlNode* node, const std::string& qualified) {
        const std::size_t colon = qualified.find(':');
        const std::string prefix = colon == std::string::npos ? std::string() : qualified.substr(0, colon);
        const xmlNs* found =
            xmlSearchNs(node->doc, const_cast<xmlNode*>(node),
                        prefix.empty() ? nullptr : reinterpret_cast<const xmlChar*>(prefix.c_str()));
        return found == nullptr ? std::string() : reinterpret_cast<const char*>(found->href);
    }

    bool is_simple(const xmlNode* node, const std::string& type) const {
        return namespace_of_name(node, type) == k_xs || m_simple_types.count(without_prefix(type)) != 0;
    }

    simple_type resolve_simple(const xmlNode* node, const std::string& type) {
        const std::string name = without_prefix(type);
        if (namespace_of_name(node, type) == k_xs) {
            simple_type built_in;
            built_in.built_in = name;
            return built_in;
        }
        const auto found = m_simple_types.find(name);
        if (found == m_simple_types.end()) throw schema_error(node, "no simple type " + type);
        return read_simple_type(found->second, name);
    }

    simple_type read_simple_type(const xmlNode* node, const std::string& name) {
        for (const xmlNode* restriction : child_elements(node)) {
            if (is_xs(restriction, "annotation")) continue;
            if (!is_xs(restriction, "restriction")) {
                throw schema_error(restriction, "only xs:restriction is known");
            }
            simple_type type = resolve_simple(restriction, attribute(restriction, "base"));
            type.name = name;
            annotations unused;
            read_annotation(node, unused, type.documentation);
            for (const xmlNode* facet : child_elements(restriction)) read_facet(facet, type.limits);
            return type;
        }
        throw schema_error(node, "a simple type needs a restriction");
    }

    static void read_facet(const xmlNode* node, facets& limits) {
        const std::string name = local_name(node);
        const std::string value = attribute(node, "value");
        if (name == "minInclusive") {
            limits.min_inclusive = value;
        } else if (name == "minExclusive") {
            limits.min_exclusive = value;
        } else if (name == "maxInclusive") {
            limits.max_inclusive = value;
        } else if (name == "maxExclusive") {
            limits.max_exclusive = value;
        } else if (name == "minLength") {
            limits.min_length = static_cast<unsigned>(std::stoul(value));
        } else if (name == "maxLength") {
            limits.max_length = static_cast<unsigned>(std::stoul(value));
        } else if (name == "length") {
            limits.min_length = limits.max_length = static_cast<unsigned>(std::stoul(value));
        } else if (name == "enumeration") {
            limits.enumeration.push_back(value);
        } else if (name == "pattern") {
            limits.has_pattern = true;
        } else {
            throw schema_error(node, "unknown facet xs:" + name);
        }
    }

    static void read_annotation(const xmlNode* node, annotations& notes, std::string& documentation) {
        for (const xmlNode* annotation : child_elements(node)) {
            if (!is_xs(annotation, "annotation")) continue;
            for (const xmlNode* part : child_elements(annotation)) {
                if (is_xs(part, "documentation")) {
                    if (!documentation.empty()) documentation += ' ';
                    documentation += folded_text(part);
                } else if (is_xs(part, "appinfo")) {
                    read_notes(part, notes);
                }
            }
        }
    }

    static void read_notes(const xmlNode* appinfo, annotations& notes) {
        static const std::set<std::string> known = {
            "polymorphic",    "class",   "owned",    "read-optional", "no-presence", "no-standalone",
            "always-written", "initial", "empty-ok", "optional-text", "document"};
        for (const xmlNode* note : child_elements(appinfo)) {
            const std::string name = local_name(note);
            if (namespace_of(note) != k_annotations || known.count(name) == 0) {
                throw schema_error(note, "unknown annotation " + name);
            }
            const std::string value =
                has_attribute(note, "name") ? attribute(note, "name") : attribute(note, "value");
            notes[name] = value;
        }
    }

    schema m_schema;
    std::set<std::string> m_seen;
    std::vector<std::pair<std::string, document>> m_documents;
    std::map<std::string, const xmlNode*> m_simple_types;
};

}  // namespace

const complex_type* schema::find_type(const std::string& key) const {
    const auto found = std::find_if(types.begin(), types.end(),
                                    [&key](const complex_type& type) { return type.key == key; });
    return found == types.end() ? nullptr : &*found;
}

const global_element* schema::find_element(const std::string& name) const {
    const auto found = std::find_if(elements.begin(), elements.end(),
                                    [&name](const global_element& element) { return element.name == name; });
    return found == elements.end() ? nullptr : &*found;
}

schema read_schema(const std::string& path) { return reader().read(path); }

}  // namespace vrl_codegen
