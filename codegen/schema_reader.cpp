#include "codegen/schema_reader.h"

#include <algorithm>
#include <set>
#include <utility>

#include "codegen/schema_grammar.h"
#include "codegen/xml_dom.h"

namespace vrl_codegen {
namespace {

bool is(const xmlNode* node, const char* name) { return local_name(node) == name; }

const xmlNode* child(const xmlNode* node, const char* name) {
    for (const xmlNode* found : child_elements(node)) {
        if (is(found, name)) return found;
    }
    return nullptr;
}

void read_notes(const xmlNode* appinfo, annotations& notes) {
    for (const xmlNode* note : child_elements(appinfo)) {
        notes[local_name(note)] = attribute(note, has_attribute(note, "name") ? "name" : "value");
    }
}

void read_annotation(const xmlNode* node, annotations& notes, std::string& documentation) {
    for (const xmlNode* annotation : child_elements(node)) {
        if (!is(annotation, "annotation")) continue;
        for (const xmlNode* part : child_elements(annotation)) {
            if (is(part, "appinfo")) {
                read_notes(part, notes);
            } else {
                if (!documentation.empty()) documentation += ' ';
                documentation += folded_text(part);
            }
        }
    }
}

/// A bound takes the place of the one that was inherited on its side, be it open or closed.
void set_bound(std::optional<std::string>& bound, std::optional<std::string>& other,
               const std::string& value) {
    bound = value;
    other.reset();
}

void read_facet(const xmlNode* node, facets& limits) {
    const std::string value = attribute(node, "value");
    const auto number = [node, &value] {
        if (value.size() > 9) throw schema_error(node, "a length of " + value + " is beyond all texts");
        return static_cast<unsigned>(std::stoul(value));
    };
    if (is(node, "minInclusive")) set_bound(limits.min_inclusive, limits.min_exclusive, value);
    if (is(node, "minExclusive")) set_bound(limits.min_exclusive, limits.min_inclusive, value);
    if (is(node, "maxInclusive")) set_bound(limits.max_inclusive, limits.max_exclusive, value);
    if (is(node, "maxExclusive")) set_bound(limits.max_exclusive, limits.max_inclusive, value);
    if (is(node, "minLength") || is(node, "length")) limits.min_length = number();
    if (is(node, "maxLength") || is(node, "length")) limits.max_length = number();
    if (is(node, "enumeration")) limits.enumeration.push_back(value);
    if (is(node, "pattern")) limits.has_pattern = true;
}

/// Leans on the two checks ahead of it: what is read here is valid and known.
class reader {
public:
    schema read(const std::string& path) {
        load(path);
        check_is_schema(path);
        for (const auto& [module, doc] : m_documents) {
            m_module = module;
            for (const xmlNode* node : child_elements(root_of(doc))) read_global(node);
        }
        resolve_references();
        return std::move(m_schema);
    }

private:
    void load(const std::string& path) {
        const std::string folder = path.substr(0, path.find_last_of('/') + 1);
        const std::string file = path.substr(folder.size());
        const std::string module = file.substr(0, file.find('.'));
        if (!m_seen.insert(module).second) return;
        document doc = parse_file(path);
        check_is_known(doc);
        const xmlNode* root = root_of(doc);
        m_schema.target_namespace = attribute(root, "targetNamespace");
        for (const xmlNode* node : child_elements(root)) {
            if (is(node, "include")) load(folder + attribute(node, "schemaLocation"));
            if (is(node, "simpleType")) m_simple_types[attribute(node, "name")] = node;
        }
        annotations none;
        schema_module read{module, std::string()};
        read_annotation(root, none, read.documentation);
        m_schema.modules.push_back(std::move(read));
        m_documents.emplace_back(module, std::move(doc));
    }

    void read_global(const xmlNode* node) {
        if (is(node, "simpleType"))
            m_schema.simple_types.push_back(read_simple_type(node, attribute(node, "name")));
        if (is(node, "complexType")) read_complex_type(node, attribute(node, "name"), std::string());
        if (is(node, "element")) read_global_element(node);
    }

    void read_global_element(const xmlNode* node) {
        global_element element;
        element.name = attribute(node, "name");
        element.module = m_module;
        element.place = place_of(node);
        element.substitution_group = without_prefix(attribute(node, "substitutionGroup"));
        element.is_abstract = attribute(node, "abstract") == "true";
        element.nillable = attribute(node, "nillable") == "true";
        read_annotation(node, element.notes, element.documentation);
        if (const xmlNode* type = child(node, "complexType")) {
            element.anonymous = true;
            element.type_key = read_complex_type(type, std::string(), "/" + element.name);
        } else if (is_complex(node)) {
            element.type_key = without_prefix(attribute(node, "type"));
        } else {
            throw schema_error(node, "the global element " + element.name + " needs a complex type");
        }
        m_schema.elements.push_back(std::move(element));
    }

    /// Gives the key of the type.
    std::string read_complex_type(const xmlNode* node, const std::string& name, const std::string& key) {
        complex_type type;
        type.name = name;
        type.key = name.empty() ? key : name;
        type.element_name = key.substr(key.find_last_of('/') + 1);
        type.module = m_module;
        type.place = place_of(node);
        type.is_abstract = attribute(node, "abstract") == "true";
        read_annotation(node, type.notes, type.documentation);
        read_content(node, type);
        m_schema.types.push_back(std::move(type));
        return m_schema.types.back().key;
    }

    void read_content(const xmlNode* node, complex_type& type) {
        for (const xmlNode* part : child_elements(node)) {
            if (is(part, "attribute")) type.attributes.push_back(read_attribute(part));
            if (is(part, "sequence")) read_particles(part, complex_type::content::sequence, type);
            if (is(part, "choice")) read_particles(part, complex_type::content::choice, type);
            if (is(part, "complexContent")) {
                const xmlNode* extension = child(part, "extension");
                type.base = without_prefix(attribute(extension, "base"));
                read_content(extension, type);
            }
            if (is(part, "simpleContent")) {
                const xmlNode* extension = child(part, "extension");
                type.kind = complex_type::content::simple;
                type.text = resolve_simple(extension, attribute(extension, "base"));
                read_content(extension, type);
            }
        }
    }

    void read_particles(const xmlNode* node, complex_type::content kind, complex_type& type) {
        type.kind = kind;
        for (const xmlNode* particle : child_elements(node)) {
            type.elements.push_back(read_particle(particle, type));
        }
    }

    element_declaration read_particle(const xmlNode* node, const complex_type& owner) {
        element_declaration element;
        element.place = place_of(node);
        read_annotation(node, element.notes, element.documentation);
        element.min_occurs = attribute(node, "minOccurs") == "0" ? 0 : 1;
        element.repeated = attribute(node, "maxOccurs") == "unbounded";
        element.nillable = attribute(node, "nillable") == "true";
        if (is(node, "any")) {
            element.name = "any";
            element.kind = element_declaration::form::any;
        } else if (has_attribute(node, "ref")) {
            element.kind = element_declaration::form::reference;
            element.name = without_prefix(attribute(node, "ref"));
        } else {
            element.name = attribute(node, "name");
            read_type_of_element(node, owner, element);
        }
        return element;
    }

    void read_type_of_element(const xmlNode* node, const complex_type& owner, element_declaration& element) {
        if (const xmlNode* type = child(node, "complexType")) {
            element.kind = element_declaration::form::anonymous_type;
            element.type_key = read_complex_type(type, std::string(), owner.key + "/" + element.name);
        } else if (is_complex(node)) {
            element.kind = element_declaration::form::named_type;
            element.type_key = without_prefix(attribute(node, "type"));
        } else {
            element.simple = simple_type_of(node);
        }
    }

    attribute_declaration read_attribute(const xmlNode* node) {
        attribute_declaration declared;
        declared.name = attribute(node, "name");
        declared.place = place_of(node);
        declared.required = attribute(node, "use") == "required";
        if (has_attribute(node, "default")) declared.default_value = attribute(node, "default");
        read_annotation(node, declared.notes, declared.documentation);
        declared.type = simple_type_of(node);
        return declared;
    }

    /// Whether the attribute `type` names a complex type, which may be read later.
    bool is_complex(const xmlNode* node) const {
        const std::string type = attribute(node, "type");
        return !type.empty() && namespace_of_name(node, type) != k_xs_namespace &&
               m_simple_types.count(without_prefix(type)) == 0;
    }

    simple_type simple_type_of(const xmlNode* node) {
        if (const xmlNode* type = child(node, "simpleType")) return read_simple_type(type, std::string());
        if (has_attribute(node, "type")) return resolve_simple(node, attribute(node, "type"));
        throw schema_error(node, attribute(node, "name") + " has no type");
    }

    simple_type resolve_simple(const xmlNode* node, const std::string& type) {
        const std::string name = without_prefix(type);
        if (namespace_of_name(node, type) != k_xs_namespace) {
            const auto found = m_simple_types.find(name);
            if (found == m_simple_types.end()) throw schema_error(node, name + " is no simple type");
            return read_simple_type(found->second, name);
        }
        simple_type built_in;
        built_in.built_in = name;
        return built_in;
    }

    simple_type read_simple_type(const xmlNode* node, const std::string& name) {
        const xmlNode* restriction = child(node, "restriction");
        simple_type type = resolve_simple(restriction, attribute(restriction, "base"));
        type.name = name;
        type.module = m_module;
        annotations none;
        std::string documentation;
        read_annotation(node, none, documentation);
        if (!documentation.empty()) type.documentation = documentation;
        // Literals of the base are those that are left over: the restriction lists all that it still allows.
        if (child(restriction, "enumeration") != nullptr) type.limits.enumeration.clear();
        for (const xmlNode* facet : child_elements(restriction)) read_facet(facet, type.limits);
        return type;
    }

    void resolve_references() {
        for (complex_type& type : m_schema.types) {
            for (element_declaration& element : type.elements) {
                if (element.kind != element_declaration::form::reference) continue;
                const global_element& referred = *m_schema.find_element(element.name);
                element.type_key = referred.type_key;
            }
        }
    }

    schema m_schema;
    std::string m_module;
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

bool schema::is_head(const std::string& name) const {
    return std::any_of(elements.begin(), elements.end(),
                       [&name](const global_element& element) { return element.substitution_group == name; });
}

schema read_schema(const std::string& path) { return reader().read(path); }

}  // namespace vrl_codegen
