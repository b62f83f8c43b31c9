#include "codegen/plan_names.h"

#include "codegen/xml_dom.h"

namespace vrl_codegen {

std::string identifier(const std::string& text) {
    std::string name;
    for (const char c : text) {
        const bool letter = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9');
        name.push_back(letter ? c : '_');
    }
    return name;
}

bool is_identifier(const std::string& name) {
    return !name.empty() && !(name.front() >= '0' && name.front() <= '9') && identifier(name) == name;
}

std::string enumerator(const std::string& member, const std::string& literal) {
    return member + "_" + identifier(literal);
}

std::string group_class_name(const std::string& head) { return "sg_" + head; }

class_names::class_names(const schema& source) {
    for (const complex_type& type : source.types) {
        const auto given = type.notes.find("class");
        const std::string name = given != type.notes.end() ? given->second
                                 : !type.name.empty()      ? type.name
                                                           : type.element_name;
        take(name, type.place, "give the type a name of its own with the annotation 'class'");
        m_of_type[type.key] = name;
    }
    for (const global_element& element : source.elements) {
        if (!element.anonymous) take(element.name, element.place, "a global element is a class");
        if (source.is_head(element.name)) {
            take(group_class_name(element.name), element.place, "a substitution group is a class");
        }
    }
    // One class carries the nil flag for all elements of the same name and type.
    std::map<std::string, std::string> nillable;
    for (const complex_type& type : source.types) {
        for (const element_declaration& element : type.elements) {
            if (element.kind != element_declaration::form::named_type || !element.nillable) continue;
            const auto [known, fresh] = nillable.emplace(element.name, element.type_key);
            if (!fresh && known->second == element.type_key) continue;
            take(element.name, element.place, "a nillable element of a named type is a class");
        }
    }
}

void class_names::take(const std::string& name, const std::string& place, const std::string& what) {
    if (!is_identifier(name)) throw schema_error(place, "no class can be called " + name);
    const auto [taken, fresh] = m_taken.emplace(name, place);
    if (!fresh) {
        throw schema_error(place,
                           "the class " + name + " is there already, from " + taken->second + ": " + what);
    }
}

}  // namespace vrl_codegen
