#include "codegen/class_plan.h"

#include <algorithm>
#include <functional>
#include <set>

#include "codegen/plan_members.h"
#include "codegen/plan_tokens.h"
#include "codegen/xml_dom.h"

namespace vrl_codegen {
namespace {

bool has(const annotations& notes, const char* name) { return notes.count(name) != 0; }

class planner {
public:
    explicit planner(const schema& source) : m_source(source) {}

    plan make() {
        m_plan.document_namespace = m_source.target_namespace;
        name_types();
        for (const complex_type& type : m_source.types) plan_type(type);
        for (const global_element& element : m_source.elements) plan_global(element);
        plan_groups();
        plan_nillable_locals();
        finish_classes();
        order_classes();
        plan_modules();
        m_plan.tokens = m_tokens.names();
        return std::move(m_plan);
    }

private:
    // A class for each complex type, named after the type, or after its one element.
    void name_types() {
        std::map<std::string, std::string> taken;
        for (const complex_type& type : m_source.types) {
            const auto given = type.notes.find("class");
            const std::string name = given != type.notes.end() ? given->second
                                     : !type.name.empty()      ? type.name
                                                               : type.element_name;
            if (!taken.emplace(name, type.key).second) {
                throw schema_error("two classes are called " + name + ": give " + type.key +
                                   " a name of its own with the annotation 'class'");
            }
            m_class_names[type.key] = name;
        }
    }

    bool is_polymorphic(const complex_type& type) const {
        if (has(type.notes, "polymorphic")) return true;
        const complex_type* base = m_source.find_type(type.base);
        return base != nullptr && is_polymorphic(*base);
    }

    const simple_type* text_type(const complex_type& type) const {
        if (type.kind == complex_type::content::simple) return &type.text;
        return nullptr;
    }

    void plan_type(const complex_type& type) {
        class_plan made;
        made.name = m_class_names.at(type.key);
        made.module = type.module;
        made.base = type.base.empty() ? std::string() : m_class_names.at(type.base);
        made.xml_name = type.name.empty() ? type.element_name : type.name;
        made.kind = type.kind == complex_type::content::choice ? class_kind::choice : class_kind::type;
        made.polymorphic = is_polymorphic(type);
        made.root_of_family = has(type.notes, "polymorphic");
        made.declares_namespaces = !type.name.empty() || is_global(type);
        made.accepts_empty = has(type.notes, "empty-ok");
        made.text_only = type.kind == complex_type::content::simple;
        made.text_required = !has(type.notes, "optional-text");
        made.documentation = type.documentation;
        plan_attributes(type, made);
        if (const simple_type* text = text_type(type)) {
            member_plan member;
            member.name = made.name;
            member.kind = member_kind::text;
            member.required = made.text_required;
            member.value = m_values.plan_value(*text, made.name, made.name);
            member.documentation = text->documentation;
            made.members.push_back(std::move(member));
        }
        for (const element_declaration& element : type.elements) {
            made.members.push_back(plan_element(element, made));
        }
        m_plan.classes.push_back(std::move(made));
    }

    bool is_global(const complex_type& type) const {
        return std::any_of(m_source.elements.begin(), m_source.elements.end(),
                           [&](const global_element& element) { return element.type_key == type.key; });
    }

    void plan_attributes(const complex_type& type, class_plan& owner) {
        for (const attribute_declaration& declared : type.attributes) {
            member_plan member;
            member.name = declared.name;
            member.kind = member_kind::attribute;
            member.required = declared.required;
            member.always_written = has(declared.notes, "always-written");
            member.value = m_values.plan_value(declared.type, owner.name, declared.name);
            if (declared.default_value) {
                member.initial = value_planner::initial_value(member.value, *declared.default_value);
            }
            member.token = m_tokens.attribute(declared.name);
            member.documentation = described(declared.documentation, declared.type);
            owner.members.push_back(std::move(member));
        }
    }

    static std::string described(const std::string& own, const simple_type& type) {
        return own.empty() ? type.documentation : own;
    }

    member_plan plan_element(const element_declaration& element, const class_plan& owner) {
        member_plan member;
        member.name = element.name;
        member.required = element.min_occurs == 1;
        member.read_optional = has(element.notes, "read-optional");
        member.has_presence = !has(element.notes, "no-presence");
        member.token = m_tokens.element(element.name);
        member.documentation = element.documentation;
        const bool option = owner.kind == class_kind::choice;
        if (element.kind == element_declaration::form::any) {
            member.kind = member_kind::any_list;
        } else if (element.kind == element_declaration::form::simple) {
            member.kind = option             ? member_kind::value_option
                          : element.repeated ? member_kind::value_list
                                             : member_kind::value;
            member.value = m_values.plan_value(element.simple, owner.name, element.name);
            member.documentation = described(element.documentation, element.simple);
            const auto initial = element.notes.find("initial");
            if (initial != element.notes.end()) {
                member.initial = value_planner::initial_value(member.value, initial->second);
            }
        } else if (element.kind == element_declaration::form::reference && is_head(element.name)) {
            member.kind = element.repeated ? member_kind::group_list : member_kind::group;
            member.class_name = "sg_" + element.name;
        } else {
            member.kind = option             ? member_kind::object_option
                          : element.repeated ? member_kind::object_list
                                             : member_kind::object;
            member.class_name = class_of(element);
            const complex_type* type = m_source.find_type(type_key_of(element));
            member.holds_choice = type != nullptr && type->kind == complex_type::content::choice;
        }
        return member;
    }

    bool is_head(const std::string& name) const {
        return std::any_of(m_source.elements.begin(), m_source.elements.end(),
                           [&](const global_element& e) { return e.substitution_group == name; });
    }

    std::string type_key_of(const element_declaration& element) const {
        switch (element.kind) {
            case element_declaration::form::named_type:
                return element.type_name;
            case element_declaration::form::anonymous_type:
                return element.anonymous_type_key;
            default:
                return m_source.find_element(element.name)->type_key;
        }
    }

    std::string class_of(const element_declaration& element) {
        if (element.kind == element_declaration::form::reference) {
            if (m_source.find_element(element.name) == nullptr) {
                throw schema_error("no global element " + element.name);
            }
            return element.name;
        }
        const std::string& type_class = m_class_names.at(type_key_of(element));
        if (!element.nillable) return type_class;
        // A nillable element of a named type is a class of its own, which carries the nil flag.
        if (element.kind == element_declaration::form::named_type) {
            m_nillable_locals[element.name] = type_class;
            return element.name;
        }
        m_nillable_types.insert(type_class);
        return type_class;
    }

    void plan_global(const global_element& element) {
        const bool standalone = !has(element.notes, "no-standalone");
        if (element.anonymous) {
            class_plan& made = *find(m_class_names.at(element.type_key));
            made.standalone = standalone;
            made.nillable = element.nillable;
            if (has(element.notes, "document")) made.kind = class_kind::root;
            if (made.documentation.empty()) made.documentation = element.documentation;
            return;
        }
        class_plan made;
        made.name = element.name;
        made.kind = class_kind::element;
        made.module = element.module;
        made.base = m_class_names.at(element.type_key);
        made.xml_name = element.name;
        made.standalone = standalone;
        made.nillable = element.nillable;
        made.declares_members = element.nillable;
        made.documentation = element.documentation;
        m_plan.classes.push_back(std::move(made));
    }

    void plan_nillable_locals() {
        for (const auto& [element, type_class] : m_nillable_locals) {
            class_plan made;
            made.name = element;
            made.kind = class_kind::element;
            made.module = find(type_class)->module;
            made.base = type_class;
            made.xml_name = element;
            made.nillable = true;
            made.declares_namespaces = false;
            made.documentation = find(type_class)->documentation;
            m_plan.classes.push_back(std::move(made));
        }
        for (const std::string& name : m_nillable_types) find(name)->nillable = true;
    }

    // One class for each substitution group, with the members in order of declaration.
    void plan_groups() {
        for (const global_element& head : m_source.elements) {
            if (!is_head(head.name)) continue;
            class_plan made;
            made.name = "sg_" + head.name;
            made.kind = class_kind::group;
            made.module = head.module;
            made.xml_name = made.name;
            made.head = m_class_names.at(head.type_key);
            made.declares_namespaces = false;
            if (!head.is_abstract) add_group_member(made, head, true);
            for (const global_element& element : m_source.elements) {
                if (element.substitution_group == head.name) add_group_member(made, element, false);
            }
            // Intended: the state below "none" is never set.
            made.none_state = static_cast<int>(made.group.size()) + 1;
            made.documentation = "One object of the substitution group " + head.name + ".";
            m_plan.classes.push_back(std::move(made));
        }
    }

    void add_group_member(class_plan& group, const global_element& element, bool is_head_element) {
        group.group.push_back({element.name, m_class_names.at(element.type_key),
                               m_tokens.element(element.name), is_head_element});
    }

    void finish_classes() {
        for (class_plan& made : m_plan.classes) {
            if (made.kind == class_kind::choice) made.none_state = static_cast<int>(made.children().size());
            if (made.kind == class_kind::element) {
                made.polymorphic = find(made.base)->polymorphic;
                made.text_only = find(made.base)->text_only;
                made.accepts_empty = find(made.base)->accepts_empty;
            }
            plan_positions(made);
        }
        // A family's factory makes every class that derives from the one that is asked.
        for (class_plan& head : m_plan.classes) {
            if (head.kind != class_kind::type || !head.polymorphic) continue;
            for (const class_plan& made : m_plan.classes) {
                if (made.kind == class_kind::type && derives(made, head.name)) {
                    head.factory.push_back(made.name);
                }
            }
        }
    }

    bool derives(const class_plan& made, const std::string& from) {
        if (made.base.empty()) return false;
        return made.base == from || derives(*find(made.base), from);
    }

    void order_classes() {
        std::map<std::string, int> depth;
        const std::function<int(const class_plan&)> depth_of = [&](const class_plan& made) {
            return made.base.empty() ? 0 : 1 + depth_of(*find(made.base));
        };
        for (const class_plan& made : m_plan.classes) depth[made.name] = depth_of(made);
        std::stable_sort(
            m_plan.classes.begin(), m_plan.classes.end(),
            [&](const class_plan& a, const class_plan& b) { return depth.at(a.name) < depth.at(b.name); });
    }

    void plan_modules() {
        for (const std::string& name : m_source.modules) {
            module_plan module;
            module.name = name;
            std::set<std::string> known;
            for (const class_plan& made : m_plan.classes) {
                if (made.module != name) continue;
                module.classes.push_back(&made);
                for (const limits_plan& limits : m_values.limits_of(made)) {
                    if (known.insert(limits.name).second) module.limits.push_back(limits);
                }
                if (made.base.empty()) continue;
                const std::string& needed = find(made.base)->module;
                const bool listed = std::count(module.depends_on.begin(), module.depends_on.end(), needed);
                if (needed != name && !listed) module.depends_on.push_back(needed);
            }
            if (!module.classes.empty()) m_plan.modules.push_back(std::move(module));
        }
    }

    class_plan* find(const std::string& name) {
        for (class_plan& made : m_plan.classes) {
            if (made.name == name) return &made;
        }
        throw schema_error("no class " + name);
    }

    const schema& m_source;
    plan m_plan;
    value_planner m_values;
    token_table m_tokens;
    std::map<std::string, std::string> m_class_names;
    std::map<std::string, std::string> m_nillable_locals;
    std::set<std::string> m_nillable_types;
};

}  // namespace

bool member_plan::has_presence_accessors() const {
    const bool single = kind == member_kind::attribute || kind == member_kind::text ||
                        kind == member_kind::value || kind == member_kind::object ||
                        kind == member_kind::group;
    return single && !required && has_presence;
}

std::vector<const member_plan*> class_plan::attributes() const {
    std::vector<const member_plan*> found;
    for (const member_plan& member : members) {
        if (member.kind == member_kind::attribute) found.push_back(&member);
    }
    return found;
}

std::vector<const member_plan*> class_plan::children() const {
    std::vector<const member_plan*> found;
    for (const member_plan& member : members) {
        if (member.kind != member_kind::attribute && member.kind != member_kind::text) {
            found.push_back(&member);
        }
    }
    return found;
}

const member_plan* class_plan::text() const {
    for (const member_plan& member : members) {
        if (member.kind == member_kind::text) return &member;
    }
    return nullptr;
}

const class_plan* plan::find(const std::string& name) const {
    for (const class_plan& made : classes) {
        if (made.name == name) return &made;
    }
    return nullptr;
}

plan make_plan(const schema& source) { return planner(source).make(); }

}  // namespace vrl_codegen
