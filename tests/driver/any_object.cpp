#include "tests/driver/any_object.h"

#include <algorithm>
#include <cstdio>
#include <sstream>

#include "V2/format.h"

namespace vrl_driver {
namespace {

std::string number_between(const facets& limits, unsigned variant) {
    const char* low = limits.min_inclusive != nullptr ? limits.min_inclusive : limits.min_exclusive;
    const char* high = limits.max_inclusive != nullptr ? limits.max_inclusive : limits.max_exclusive;
    const double share = 0.21 + 0.125 * (variant % 5);
    double value = 12.5 + variant;
    if (low != nullptr && high != nullptr) {
        value = std::stod(low) + (std::stod(high) - std::stod(low)) * share;
    } else if (low != nullptr) {
        value = std::stod(low) + 1.0 + share;
    } else if (high != nullptr) {
        value = std::stod(high) - 1.0 - share;
    }
    char text[40];
    std::snprintf(text, sizeof text, "%.6g", value);
    return text;
}

std::string legal_characters(const member& m, unsigned variant) {
    if (!m.limits.literals.empty()) return m.limits.literals[variant % m.limits.literals.size()];
    if (m.limits.max_length == 1) return variant % 2 == 0 ? "x" : "ß";
    // Escapes, two and three bytes, a character outside the first plane.
    static const char* const texts[] = {"plain", "a<b>&\"c\"'", "Grün €", "𝄞 x", "two words"};
    return texts[variant % 5];
}

bool is_list(const member& m) { return m.size != nullptr; }

bool holds_object(const member& m) { return m.make != nullptr; }

void fill_member(const placed_member& at, const filling& how);

void fill_group(const class_description& c, void* self, const filling& how) {
    std::vector<const group_member*> choices;
    for (const group_member& option : c.group) {
        if (!option.is_head) choices.push_back(&option);
    }
    const group_member& chosen = *choices[how.variant % choices.size()];
    fill(find_class(chosen.class_name), chosen.make(self), how);
}

void fill_choice(const class_description& c, void* self, const filling& how) {
    std::vector<const member*> options;
    for (const member& m : c.members) {
        if (m.kind == form::value_option || m.kind == form::object_option) {
            options.push_back(&m);
        } else if (how.full_levels > 0) {
            fill_member({&m, self, &c}, how);
        }
    }
    fill_member({options[how.variant % options.size()], self, &c}, how);
}

void fill_member(const placed_member& at, const filling& how) {
    filling inner = how;
    if (inner.full_levels > 0) --inner.full_levels;
    const unsigned entries = is_list(*at.m) ? (how.full_levels > 0 ? how.entries : 1) : 1;
    for (unsigned i = 0; i < entries; ++i) {
        inner.variant = how.variant + i;
        if (holds_object(*at.m)) {
            fill(find_class(at.m->class_name), at.m->make(at.self), inner);
        } else if (at.m->kind == form::any_list) {
            at.m->set(at.self, "<note xmlns=\"urn:note\">any &amp; all</note>");
        } else {
            at.m->set(at.self, legal_text(*at.m, inner.variant));
        }
    }
}

std::string contents_of_member(const placed_member& at) {
    const member& m = *at.m;
    std::string out;
    if (m.isset != nullptr) out += m.isset(at.self) ? "+" : "-";
    const unsigned count = is_list(m) ? m.size(at.self) : 1;
    for (unsigned i = 0; i < count; ++i) {
        if (holds_object(m)) {
            out += "{" + contents(find_class(m.class_name), m.look(at.self, i)) + "}";
        } else {
            out += "[" + m.get(at.self, i) + "]";
        }
    }
    return out;
}

}  // namespace

std::vector<placed_member> members_of(const class_description& c, void* self) {
    std::vector<placed_member> all;
    if (c.base != nullptr) all = members_of(find_class(c.base), c.to_base(self));
    for (const member& m : c.members) all.push_back({&m, self, &c});
    return all;
}

std::string legal_text(const member& m, unsigned variant) {
    switch (m.value) {
        case value_type::number:
            return number_between(m.limits, variant);
        case value_type::text:
            return legal_characters(m, variant);
        case value_type::boolean:
            return variant % 2 == 0 ? "true" : "false";
        case value_type::integer:
            return variant % 2 == 0 ? "-5" : "2147483647";
        case value_type::unsigned_integer:
            return variant % 2 == 0 ? "0" : "5003";
        case value_type::byte:
            return variant % 2 == 0 ? "2" : "99";
        case value_type::date_time:
            return variant % 2 == 0 ? "2024-01-15T10:20:30Z" : "2023-12-31T23:59:59.5-05:30";
        case value_type::binary:
            return variant % 2 == 0 ? "TWFu" : "AAECAwQ=";
    }
    return {};
}

void fill(const class_description& c, void* self, const filling& how) {
    if (c.kind == class_form::group) {
        fill_group(c, self, how);
        return;
    }
    if (c.kind == class_form::choice) {
        fill_choice(c, self, how);
        return;
    }
    for (const placed_member& at : members_of(c, self)) {
        // What always is written has to be there, whether reading demands it or not.
        const bool needed =
            at.m->required || !at.m->has_presence || at.m->always_written || at.m->kind == form::text;
        if (needed || how.full_levels > 0) fill_member(at, how);
    }
}

any_object filled(const class_description& c, const filling& how) {
    any_object object(c);
    fill(c, object.get(), how);
    return object;
}

std::string contents(const class_description& c, const void* self) {
    std::string out;
    if (c.is_nil != nullptr && c.is_nil(self)) out += "(nil)";
    if (c.chosen != nullptr) out += "#" + std::to_string(c.chosen(self));
    if (c.kind == class_form::group) {
        if (c.chosen(self) == c.none_state) return out;
        const group_member& held = c.group[static_cast<std::size_t>(c.chosen(self))];
        return out + "{" + contents(find_class(held.class_name), held.look(self)) + "}";
    }
    for (const placed_member& at : members_of(c, const_cast<void*>(self))) {
        const bool option = at.m->kind == form::value_option || at.m->kind == form::object_option;
        if (option && c.members[0].kind == form::attribute) {
            // The options stand behind the attributes.
            const auto first = std::find_if(c.members.begin(), c.members.end(), [](const member& m) {
                return m.kind == form::value_option || m.kind == form::object_option;
            });
            if (&*first + c.chosen(self) != at.m) continue;
        } else if (option && &c.members[0] + c.chosen(self) != at.m) {
            continue;
        }
        out += std::string(at.m->name) + "=" + contents_of_member(at) + ";";
    }
    return out;
}

std::string contents(const any_object& object) { return contents(object.kind(), object.get()); }

written write(const any_object& object) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "\t", "\n");
    const std::string name = std::string("Vrl:") + object.kind().xml_name;
    const eqbx_error code = object.kind().marshal(object.get(), out, name.c_str());
    return {code, os.str()};
}

eqbx_error read(const any_object& object, const std::string& xml) {
    qbxV2::c_xml_reader_memory reader(xml.data(), xml.size());
    reader.add_namespace_mapping("Vrl", vrl_v2::k_document_namespace_uri);
    reader.add_namespace_mapping("xsi", "http://www.w3.org/2001/XMLSchema-instance");
    reader.set_ns_map(vrl_v2::document_namespaces());
    qbxV2::c_xml_reader_local scope(reader);
    eqbx_error error = qbxV2::EQBX_NO_ERROR;
    reader.get_element_event(nullptr, &error, &reader.element_name_buffer());
    if (error != qbxV2::EQBX_NO_ERROR) return error;
    return object.kind().unmarshal(object.get(), reader, reader.element_name_buffer());
}

}  // namespace vrl_driver
