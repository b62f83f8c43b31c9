#include "codegen/plan_checks.h"

#include <map>
#include <set>

#include "codegen/plan_names.h"
#include "codegen/xml_dom.h"

namespace vrl_codegen {
namespace {

using form = element_declaration::form;

void refuse_if(bool refused, const std::string& place, const char* why) {
    if (refused) throw schema_error(place, why);
}

void check_attribute(const attribute_declaration& declared) {
    refuse_if(has_note(declared.notes, "always-written") && !declared.default_value, declared.place,
              "an attribute that is always written needs a default");
}

void check_notes_of_element(const element_declaration& element, const std::string& place) {
    const bool optional = element.min_occurs == 0;
    const bool simple = element.kind == form::simple;
    refuse_if(has_note(element.notes, "read-optional") && optional, place,
              "read-optional means nothing on an element that isn't required");
    refuse_if(has_note(element.notes, "no-presence") && (optional || element.repeated), place,
              "no-presence means nothing on an element that isn't required once");
    refuse_if(has_note(element.notes, "owned") && simple, place,
              "owned means nothing on an element of a simple type");
    refuse_if(has_note(element.notes, "initial") && (!simple || element.repeated), place,
              "initial means nothing but on a single element of a simple type");
}

void check_element(const element_declaration& element, const complex_type& owner) {
    check_notes_of_element(element, element.place);
    refuse_if(element.kind == form::simple && element.nillable, element.place,
              "an element of a simple type can't be nillable");
    refuse_if(element.kind == form::any && (!element.repeated || owner.elements.size() > 1), element.place,
              "xs:any stands alone in its type, and is repeated");
}

void check_type(const complex_type& type, const schema& source) {
    for (const attribute_declaration& declared : type.attributes) check_attribute(declared);
    for (const element_declaration& element : type.elements) check_element(element, type);
    refuse_if(has_note(type.notes, "optional-text") && type.kind != complex_type::content::simple, type.place,
              "optional-text means nothing on a type without text");
    refuse_if(has_note(type.notes, "polymorphic") && !type.base.empty(), type.place,
              "polymorphic stands on the root of a derivation tree");
    if (type.base.empty()) return;
    const complex_type* base = source.find_type(type.base);
    refuse_if(base == nullptr, type.place, "the base has to be a complex type of the schema");
    refuse_if(base->kind == complex_type::content::choice, type.place, "nothing derives from a choice");
    refuse_if(!base->elements.empty() && base->elements.front().kind == form::any, type.place,
              "nothing derives from a type that holds xs:any");
    const bool any = !type.elements.empty() && type.elements.front().kind == form::any;
    refuse_if(any, type.place, "a type that holds xs:any derives from none");
}

void check_global(const global_element& element, const schema& source) {
    refuse_if(has_note(element.notes, "document") && !element.anonymous, element.place,
              "the document element has a type of its own, without a name");
    if (element.substitution_group.empty()) return;
    refuse_if(source.is_head(element.name), element.place,
              "a member of a substitution group can't be the head of another");
}

/// Whatever member a group holds, it holds it in one place, so there has to be a family.
void check_head(const global_element& head, const schema& source) {
    const complex_type* root = source.find_type(head.type_key);
    while (!root->base.empty()) root = source.find_type(root->base);
    refuse_if(!has_note(root->notes, "polymorphic"), head.place,
              "the type of the head of a substitution group has to be polymorphic");
}

/// Accessors are named after members, so a name stands once in a class with all its bases.
void check_accessors(const plan& model, const class_plan& made) {
    std::set<std::string> names;
    for (const class_plan* owner = &made; owner != nullptr; owner = model.find(owner->base)) {
        for (const member_plan& member : owner->members) {
            if (!is_identifier(member.name)) {
                throw schema_error(made.place, "no accessor can be called after " + member.name);
            }
            if (!names.insert(member.name).second) {
                throw schema_error(made.place, made.name + " has two members called " + member.name);
            }
        }
    }
    refuse_if(made.kind == class_kind::choice && names.count("none") != 0, made.place,
              "no option of a choice can be called none");
}

void check_enumerators(const class_plan& made, const member_plan& member) {
    std::map<std::string, std::string> taken{{enumerator(member.name, "no_match"), "the state of no match"}};
    for (const std::string& literal : member.value.facet.enumeration) {
        const auto [known, fresh] = taken.emplace(enumerator(member.name, literal), literal);
        if (fresh) continue;
        throw schema_error(made.place, made.name + "." + member.name + ": the literal " + literal +
                                           " would share an enumerator with " + known->second);
    }
}

}  // namespace

void check_declarations(const schema& source) {
    for (const complex_type& type : source.types) check_type(type, source);
    for (const global_element& element : source.elements) {
        check_global(element, source);
        if (source.is_head(element.name)) check_head(element, source);
    }
}

void check_classes(const plan& model) {
    for (const class_plan& made : model.classes) {
        refuse_if(made.is_document() && made.has_initial_values(), made.place,
                  "what the document starts with is written by hand");
        check_accessors(model, made);
        for (const member_plan& member : made.members) check_enumerators(made, member);
    }
}

}  // namespace vrl_codegen
