#include "codegen/reference_plan.h"

#include <algorithm>
#include <cctype>
#include <map>

#include "codegen/plan_names.h"
#include "codegen/reference_words.h"

namespace vrl_codegen {
namespace {

using form = element_declaration::form;

/// "OwnerType/Person"; of the type of a global element, the element's name.
std::string title_of(const complex_type& type) {
    return type.key.front() == '/' ? type.key.substr(1) : type.key;
}

std::string group_title(const std::string& head) { return "Group " + head; }

class planner {
public:
    planner(const schema& source, const plan& model) : m_source(source), m_model(model), m_names(source) {
        for (const complex_type& type : source.types) note_uses(type);
    }

    reference_plan make() {
        reference_plan made;
        made.document_namespace = m_source.target_namespace;
        for (const schema_module& module : m_source.modules) {
            reference_module pages = plan_module(module);
            if (!pages.types.empty() || !pages.elements.empty()) made.modules.push_back(std::move(pages));
        }
        return made;
    }

private:
    void note_uses(const complex_type& type) {
        if (!type.base.empty()) m_extended_by[type.base].push_back(link_to(title_of(type), title_of(type)));
        for (const element_declaration& element : type.elements) {
            const std::string use = link_to(title_of(type), title_of(type));
            if (element.kind == form::reference) {
                m_element_uses[element.name].push_back(use);
            } else if (element.kind == form::named_type) {
                m_type_uses[element.type_key].push_back(
                    std::string(use).append(" as ").append(code(element.name)));
            }
        }
    }

    reference_module plan_module(const schema_module& module) {
        reference_module pages;
        pages.name = module.name;
        pages.title = "Module " + module.name;
        pages.meaning = plain(module.documentation);
        for (const global_element& element : m_source.elements) {
            if (element.module != module.name) continue;
            pages.elements.push_back(plan_element(element));
            if (m_source.is_head(element.name)) pages.groups.push_back(plan_group(element));
        }
        for (const complex_type& type : m_source.types) {
            const bool outermost = type.key.find('/', 1) == std::string::npos;
            if (outermost && type.module == module.name) add_type(pages, type);
        }
        for (const simple_type& type : m_source.simple_types) {
            if (type.module == module.name) pages.simple_types.push_back(plan_simple_type(type));
        }
        return pages;
    }

    /// A type, and behind it those that are declared inside it.
    void add_type(reference_module& pages, const complex_type& type) {
        pages.types.push_back(plan_type(type));
        for (const element_declaration& element : type.elements) {
            if (element.kind == form::anonymous_type) add_type(pages, *m_source.find_type(element.type_key));
        }
    }

    reference_element plan_element(const global_element& element) {
        const complex_type& type = *m_source.find_type(element.type_key);
        reference_element row;
        row.name = element.name;
        row.type = link_to(title_of(type), title_of(type));
        row.meaning = plain(element.documentation.empty() ? type.documentation : element.documentation);
        if (has_note(element.notes, "document")) row.remarks.push_back("outermost in every document");
        if (element.is_abstract) row.remarks.push_back("never occurs itself");
        if (has_note(element.notes, "no-standalone"))
            row.remarks.push_back("not written as a file of its own");
        if (element.nillable) row.remarks.push_back("may be nil");
        if (m_source.is_head(element.name)) {
            row.remarks.push_back(link_to("head of a group", group_title(element.name)));
        }
        const std::string& head = element.substitution_group;
        if (!head.empty()) {
            row.remarks.push_back(link_to("in group " + head, group_title(head)));
        }
        row.used_in = m_element_uses[element.name];
        return row;
    }

    reference_group plan_group(const global_element& head) {
        reference_group group;
        group.title = group_title(head.name);
        group.head = head.name;
        group.used_in = m_element_uses[head.name];
        for (const group_member_plan& member : m_model.find(group_class_name(head.name))->group) {
            const global_element& element = *m_source.find_element(member.element);
            const complex_type& type = *m_source.find_type(element.type_key);
            reference_row row;
            row.number = std::to_string(group.members.size());
            row.name = code(element.name);
            row.type = member.is_head ? "named by `xsi:type`" : link_to(title_of(type), title_of(type));
            group.members.push_back(std::move(row));
        }
        return group;
    }

    reference_type plan_type(const complex_type& type) {
        reference_type made;
        made.title = title_of(type);
        made.class_name = m_names.of_type(type.key);
        made.meaning = plain(type.documentation);
        if (!type.base.empty()) made.extends = link_to(type.base, type.base);
        if (type.is_abstract) made.remarks.push_back("Abstract: a derived type takes its place.");
        if (has_note(type.notes, "empty-ok")) {
            made.remarks.push_back("Reading accepts an element without content, whatever is required of it.");
        }
        made.has_text = type.kind == complex_type::content::simple;
        if (made.has_text) made.text = plan_text(type);
        for (const attribute_declaration& declared : type.attributes) {
            made.attributes.push_back(plan_attribute(declared));
        }
        made.is_choice = type.kind == complex_type::content::choice;
        for (const element_declaration& element : type.elements)
            made.children.push_back(plan_child(element, made.is_choice));
        made.extended_by = m_extended_by[type.key];
        made.used_in = m_type_uses[type.key];
        for (const global_element& element : m_source.elements) {
            if (element.type_key != type.key) continue;
            if (element.anonymous) made.used_in = m_element_uses[element.name];
            if (!element.anonymous) made.used_in.push_back("element " + code(element.name));
        }
        return made;
    }

    reference_row plan_text(const complex_type& type) {
        reference_row row = simple_row(type.text);
        if (has_note(type.notes, "optional-text")) row.occurs = "may be absent in memory";
        row.meaning = plain(type.text.documentation);
        return row;
    }

    reference_row plan_attribute(const attribute_declaration& declared) {
        reference_row row = simple_row(declared.type);
        row.name = code(declared.name);
        row.occurs = declared.required ? "required" : "optional";
        if (declared.default_value)
            row.occurs.append("; ").append(code(*declared.default_value)).append(" if absent");
        if (has_note(declared.notes, "always-written")) row.occurs.append("; always written");
        row.meaning =
            plain(declared.documentation.empty() ? declared.type.documentation : declared.documentation);
        return row;
    }

    reference_row plan_child(const element_declaration& element, bool is_option) {
        reference_row row;
        if (element.kind == form::simple) row = simple_row(element.simple);
        row.name = element.kind == form::any ? "any element" : code(element.name);
        row.occurs = is_option ? std::string() : words_of_occurrence(element);
        if (has_note(element.notes, "read-optional")) row.occurs.append("; reading accepts its absence");
        if (has_note(element.notes, "no-presence")) row.occurs.append("; always written");
        if (element.nillable) row.occurs.append("; may be nil");
        row.meaning = plain(meaning_of(element));
        if (element.kind == form::any) {
            row.type = "any, kept as text";
        } else if (element.kind == form::reference && m_source.is_head(element.name)) {
            row.type = link_to("group " + element.name, group_title(element.name));
        } else if (element.kind != form::simple) {
            const complex_type& type = *m_source.find_type(element.type_key);
            row.type = link_to(title_of(type), title_of(type));
        }
        const auto initial = element.notes.find("initial");
        if (initial != element.notes.end())
            row.values.append(row.values.empty() ? "" : "; ")
                .append("a new object holds ")
                .append(code(initial->second));
        return row;
    }

    std::string meaning_of(const element_declaration& element) const {
        if (!element.documentation.empty()) return element.documentation;
        if (element.kind == form::simple) return element.simple.documentation;
        if (element.kind == form::reference) return m_source.find_element(element.name)->documentation;
        return {};
    }

    static reference_row simple_row(const simple_type& type) {
        reference_row row;
        row.type = words_of_type(type.built_in);
        row.values = type.name.empty() ? words_of_values(type.limits) : link_to(type.name, type.name);
        return row;
    }

    static reference_simple_type plan_simple_type(const simple_type& type) {
        reference_simple_type made;
        made.title = type.name;
        made.type = words_of_type(type.built_in);
        made.meaning = plain(type.documentation);
        made.literals = type.limits.enumeration;
        if (made.literals.empty()) made.values = words_of_values(type.limits);
        return made;
    }

    const schema& m_source;
    const plan& m_model;
    class_names m_names;
    std::map<std::string, std::vector<std::string>> m_type_uses;
    std::map<std::string, std::vector<std::string>> m_element_uses;
    std::map<std::string, std::vector<std::string>> m_extended_by;
};

}  // namespace

reference_plan plan_reference(const schema& source, const plan& model) {
    return planner(source, model).make();
}

std::string anchor_of(const std::string& title) {
    std::string anchor;
    for (const char c : title) {
        const auto byte = static_cast<unsigned char>(c);
        if (std::isalnum(byte) != 0 || c == '_' || c == '-') {
            anchor.push_back(static_cast<char>(std::tolower(byte)));
        } else if (c == ' ') {
            anchor.push_back('-');
        }
    }
    return anchor;
}

}  // namespace vrl_codegen
