#include <algorithm>
#include <map>
#include <set>
#include <utility>

#include "codegen/class_plan.h"
#include "codegen/plan_checks.h"
#include "codegen/plan_names.h"
#include "codegen/plan_positions.h"
#include "codegen/plan_tokens.h"
#include "codegen/plan_values.h"

namespace vrl_codegen {
namespace {

const std::string& first_given(const std::string& own, const std::string& other) {
    return own.empty() ? other : own;
}

content_kind content_of(const complex_type& type) {
    using content = complex_type::content;
    if (type.kind == content::simple) return content_kind::text;
    if (type.elements.empty()) return content_kind::none;
    if (type.kind == content::choice) return content_kind::choice;
    const bool any = type.elements.front().kind == element_declaration::form::any;
    return any ? content_kind::any : content_kind::children;
}

class planner {
public:
    explicit planner(const schema& source) : m_source(source), m_names(source) {}

    plan make() {
        check_declarations(m_source);
        m_plan.document_namespace = m_source.target_namespace;
        for (const complex_type& type : m_source.types) plan_type(type);
        for (const global_element& element : m_source.elements) plan_global(element);
        for (const global_element& element : m_source.elements) {
            if (m_source.is_head(element.name)) plan_group(element);
        }
        for (const auto& [name, element] : nillable_locals()) plan_nillable(*element);
        for (class_plan& made : m_plan.classes) finish(made);
        for (class_plan& made : m_plan.classes) plan_factory(made);
        order_classes();
        check_classes(m_plan);
        for (const schema_module& module : m_source.modules) plan_module(module.name);
        m_plan.tokens = m_tokens.tokens();
        return std::move(m_plan);
    }

private:
    // A class for each complex type.
    void plan_type(const complex_type& type) {
        class_plan made;
        made.name = m_names.of_type(type.key);
        made.module = type.module;
        made.place = type.place;
        made.base = type.base.empty() ? std::string() : m_names.of_type(type.base);
        made.xml_name = first_given(type.name, type.element_name);
        made.content = content_of(type);
        made.kind = made.content == content_kind::choice ? class_kind::choice : class_kind::type;
        made.polymorphic = is_polymorphic(type);
        made.has_identity = made.polymorphic;
        made.declares_namespaces = !type.name.empty() || is_global(type);
        made.nillable = is_nillable(type);
        made.accepts_empty = has_note(type.notes, "empty-ok");
        made.text_only = made.content == content_kind::text;
        made.text_required = !has_note(type.notes, "optional-text");
        made.documentation = type.documentation;
        for (const attribute_declaration& declared : type.attributes) {
            made.members.push_back(plan_attribute(declared, made));
        }
        if (made.text_only) made.members.push_back(plan_text(type, made));
        for (const element_declaration& element : type.elements) {
            made.members.push_back(plan_element(element, made));
        }
        m_plan.classes.push_back(std::move(made));
    }

    bool is_polymorphic(const complex_type& type) const {
        if (type.base.empty()) return has_note(type.notes, "polymorphic");
        return is_polymorphic(*m_source.find_type(type.base));
    }

    bool is_global(const complex_type& type) const {
        return std::any_of(m_source.elements.begin(), m_source.elements.end(),
                           [&](const global_element& element) { return element.type_key == type.key; });
    }

    /// Whether the one local element of an anonymous type may be nil; a global element says so itself.
    bool is_nillable(const complex_type& type) const {
        for (const complex_type& owner : m_source.types) {
            for (const element_declaration& element : owner.elements) {
                if (element.kind == element_declaration::form::anonymous_type && element.nillable &&
                    element.type_key == type.key) {
                    return true;
                }
            }
        }
        return false;
    }

    member_plan plan_attribute(const attribute_declaration& declared, const class_plan& owner) {
        member_plan member;
        member.name = declared.name;
        member.kind = member_kind::attribute;
        member.required = declared.required;
        member.always_written = has_note(declared.notes, "always-written");
        member.value = m_values.plan_value(declared.type, owner.name, declared.name, declared.place);
        if (declared.default_value) {
            check_initial(member.value, *declared.default_value, declared.place);
            member.initial = *declared.default_value;
        }
        member.token = m_tokens.attribute(declared.name);
        member.documentation = first_given(declared.documentation, declared.type.documentation);
        return member;
    }

    member_plan plan_text(const complex_type& type, const class_plan& owner) {
        member_plan member;
        member.name = owner.name;
        member.kind = member_kind::text;
        member.required = owner.text_required;
        member.value = m_values.plan_value(type.text, owner.name, owner.name, type.place);
        member.documentation = type.text.documentation;
        return member;
    }

    member_plan plan_element(const element_declaration& element, const class_plan& owner) {
        member_plan member;
        member.name = element.name;
        member.kind = kind_of(element, owner);
        member.required = element.min_occurs == 1;
        member.read_optional = has_note(element.notes, "read-optional");
        member.has_presence = !has_note(element.notes, "no-presence");
        member.token = m_tokens.element(element.name);
        member.documentation = element.documentation;
        if (element.kind == element_declaration::form::reference) {
            member.documentation =
                first_given(element.documentation, m_source.find_element(element.name)->documentation);
        }
        if (element.kind == element_declaration::form::simple) {
            plan_simple(element, owner, member);
        } else if (member.is_group()) {
            member.class_name = group_class_name(element.name);
        } else if (element.kind != element_declaration::form::any) {
            member.class_name = class_of(element);
            const complex_type& type = *m_source.find_type(element.type_key);
            member.holds_choice = type.kind == complex_type::content::choice;
        }
        return member;
    }

    void plan_simple(const element_declaration& element, const class_plan& owner, member_plan& member) {
        member.value = m_values.plan_value(element.simple, owner.name, element.name, element.place);
        member.documentation = first_given(element.documentation, element.simple.documentation);
        const auto initial = element.notes.find("initial");
        if (initial == element.notes.end()) return;
        check_initial(member.value, initial->second, element.place);
        member.initial = initial->second;
    }

    member_kind kind_of(const element_declaration& element, const class_plan& owner) const {
        using form = element_declaration::form;
        const bool option = owner.kind == class_kind::choice;
        if (element.kind == form::any) return member_kind::any_list;
        if (element.kind == form::simple) {
            if (option) return member_kind::value_option;
            return element.repeated ? member_kind::value_list : member_kind::value;
        }
        if (element.kind == form::reference && m_source.is_head(element.name)) {
            return element.repeated ? member_kind::group_list : member_kind::group;
        }
        if (option) return member_kind::object_option;
        return element.repeated ? member_kind::object_list : member_kind::object;
    }

    /// An element that is a class of its own, global or nillable, or the class of its type.
    std::string class_of(const element_declaration& element) const {
        using form = element_declaration::form;
        const bool own =
            element.kind == form::reference || (element.kind == form::named_type && element.nillable);
        return own ? element.name : m_names.of_type(element.type_key);
    }

    void plan_global(const global_element& element) {
        const bool standalone = !has_note(element.notes, "no-standalone");
        if (element.anonymous) {
            class_plan& made = get(m_names.of_type(element.type_key));
            made.standalone = standalone;
            made.nillable = element.nillable;
            if (has_note(element.notes, "document")) made.kind = class_kind::root;
            made.documentation = first_given(made.documentation, element.documentation);
            return;
        }
        class_plan made = element_class(element.name, m_names.of_type(element.type_key), element.place);
        made.module = element.module;
        made.standalone = standalone;
        made.nillable = element.nillable;
        made.declares_members = element.nillable;
        made.documentation = element.documentation;
        m_plan.classes.push_back(std::move(made));
    }

    static class_plan element_class(const std::string& name, const std::string& type_class,
                                    const std::string& place) {
        class_plan made;
        made.name = name;
        made.kind = class_kind::element;
        made.place = place;
        made.base = type_class;
        made.xml_name = name;
        return made;
    }

    /// The nillable elements of named types, by name.
    std::map<std::string, const element_declaration*> nillable_locals() const {
        std::map<std::string, const element_declaration*> found;
        for (const complex_type& type : m_source.types) {
            for (const element_declaration& element : type.elements) {
                const bool named = element.kind == element_declaration::form::named_type;
                if (named && element.nillable) found.emplace(element.name, &element);
            }
        }
        return found;
    }

    void plan_nillable(const element_declaration& element) {
        const class_plan& type_class = get(m_names.of_type(element.type_key));
        class_plan made = element_class(element.name, type_class.name, element.place);
        made.module = type_class.module;
        made.nillable = true;
        made.declares_namespaces = false;
        made.documentation = type_class.documentation;
        m_plan.classes.push_back(std::move(made));
    }

    // One class for each substitution group, with the members in order of declaration.
    void plan_group(const global_element& head) {
        class_plan made;
        made.name = group_class_name(head.name);
        made.kind = class_kind::group;
        made.module = head.module;
        made.place = head.place;
        made.xml_name = made.name;
        made.head = m_names.of_type(head.type_key);
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

    void add_group_member(class_plan& group, const global_element& element, bool is_head_element) {
        group.group.push_back({element.name, m_names.of_type(element.type_key),
                               m_tokens.element(element.name), is_head_element});
    }

    /// What follows from the bases and from the members together.
    void finish(class_plan& made) {
        if (made.kind == class_kind::choice) made.none_state = static_cast<int>(made.children().size());
        if (made.kind == class_kind::element) {
            const class_plan& base = get(made.base);
            made.polymorphic = base.polymorphic;
            made.text_only = base.text_only;
            if (made.nillable && made.text_only) made.renamed_text = base.text()->value.parameter;
            made.accepts_empty = base.accepts_empty;
        }
        if (made.polymorphic) made.identity = made.has_identity ? made.name : made.base;
        for (member_plan& member : made.members) {
            member.ends_nil = made.nillable && member.kind == member_kind::text;
        }
        made.base_requires_attributes = !made.base.empty() && requires_attributes(get(made.base));
        plan_positions(made);
    }

    bool requires_attributes(const class_plan& made) {
        if (!made.required_attributes().empty()) return true;
        return !made.base.empty() && requires_attributes(get(made.base));
    }

    // A family's factory makes every class that derives from the one that is asked.
    void plan_factory(class_plan& head) {
        if (!head.has_identity) return;
        for (const class_plan& made : m_plan.classes) {
            if (made.has_identity && derives(made, head.name)) head.factory.push_back(made.name);
        }
    }

    bool derives(const class_plan& made, const std::string& from) {
        return !made.base.empty() && (made.base == from || derives(get(made.base), from));
    }

    int depth_of(const class_plan& made) { return made.base.empty() ? 0 : 1 + depth_of(get(made.base)); }

    void order_classes() {
        std::map<std::string, int> depth;
        for (const class_plan& made : m_plan.classes) depth[made.name] = depth_of(made);
        std::stable_sort(
            m_plan.classes.begin(), m_plan.classes.end(),
            [&](const class_plan& a, const class_plan& b) { return depth.at(a.name) < depth.at(b.name); });
    }

    void plan_module(const std::string& name) {
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
            const std::string& needed = get(made.base).module;
            const bool listed = std::count(module.depends_on.begin(), module.depends_on.end(), needed) != 0;
            if (needed != name && !listed) module.depends_on.push_back(needed);
        }
        if (!module.classes.empty()) m_plan.modules.push_back(std::move(module));
    }

    /// Every class that is asked for by its name has been planned before.
    class_plan& get(const std::string& name) {
        return *std::find_if(m_plan.classes.begin(), m_plan.classes.end(),
                             [&name](const class_plan& made) { return made.name == name; });
    }

    const schema& m_source;
    class_names m_names;
    plan m_plan;
    value_planner m_values;
    token_table m_tokens;
};

}  // namespace

plan make_plan(const schema& source) { return planner(source).make(); }

}  // namespace vrl_codegen
