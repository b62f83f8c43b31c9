#include "codegen/emit.h"

namespace vrl_codegen {
namespace {

/// What a setter refuses, in the words of the result codes.
std::string refusals(const value_plan& value) {
    const facets& limits = value.facet;
    std::vector<std::string> parts;
    if (limits.min_inclusive) parts.push_back("EQBX_VALUE_TOO_SMALL below " + *limits.min_inclusive);
    if (limits.min_exclusive) parts.push_back("EQBX_VALUE_TOO_SMALL from " + *limits.min_exclusive + " down");
    if (limits.max_inclusive) parts.push_back("EQBX_VALUE_TOO_LARGE above " + *limits.max_inclusive);
    if (limits.max_exclusive) parts.push_back("EQBX_VALUE_TOO_LARGE from " + *limits.max_exclusive + " up");
    if (limits.min_length) {
        parts.push_back("EQBX_LENGTH_TOO_SHORT below " + std::to_string(*limits.min_length) + " unit(s)");
    }
    if (limits.max_length) {
        parts.push_back("EQBX_LENGTH_TOO_LONG above " + std::to_string(*limits.max_length) + " unit(s)");
    }
    if (!limits.enumeration.empty()) parts.push_back("EQBX_VALUE_NOT_ENUMERATED for any other text");
    return parts.empty() ? std::string() : "Refuses: " + join(parts, ", ") + ".";
}

printer::values holes_of(const member_plan& member) {
    return {{"X", member.name},
            {"type", member.value.type},
            {"in", member.value.parameter},
            {"out", result_type(member.value)},
            {"limits", member.value.limits},
            {"class", member.class_name}};
}

void declare_enumeration(printer& out, const member_plan& member) {
    if (member.value.facet.enumeration.empty()) return;
    out.print("    enum Eenum_$X$ : int {\n        $X$_no_match = 0,\n");
    int number = 1;
    for (const std::string& literal : member.value.facet.enumeration) {
        out.print("        $enumerator$ = $number$,  ///< \"$literal$\"\n",
                  {{"enumerator", enumerator(member.name, literal)},
                   {"number", std::to_string(number++)},
                   {"literal", literal}});
    }
    out.print("    };\n");
}

void declare_enumeration_accessors(printer& out, const member_plan& member) {
    if (member.value.facet.enumeration.empty()) return;
    out.print(R"(    Eenum_$X$ getenum_$X$() const;
    bool setenum_$X$(Eenum_$X$ value);
)");
}

void define_enumeration_accessors(printer& out, const member_plan& member) {
    if (member.value.facet.enumeration.empty()) return;
    out.print(R"($C$::Eenum_$X$ $C$::getenum_$X$() const {
    return static_cast<Eenum_$X$>($limits$.number_of(get_$X$()));
}
bool $C$::setenum_$X$(Eenum_$X$ value) {
    const std::wstring_view* text = $limits$.text_of(value);
    return text != nullptr && set_$X$(std::wstring(*text)) == qbxV2::EQBX_NO_ERROR;
}
)");
}

}  // namespace

void declare_accessors(printer& out, const member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    out.print("\n");
    out.print(comment(member.documentation, "    "));
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
        case member_kind::value_option:
            declare_enumeration(out, member);
            out.print(comment(refusals(member.value), "    "));
            out.print("    $out$ get_$X$() const;\n    qbxV2::eqbx_error set_$X$($in$ value);\n");
            if (member.has_presence_accessors())
                out.print("    bool isset_$X$() const;\n    void unset_$X$();\n");
            declare_enumeration_accessors(out, member);
            break;
        case member_kind::object:
        case member_kind::group:
        case member_kind::object_option:
            out.print(R"(    $class$ const& get_$X$() const;
    $class$& get_$X$();
    $class$& assign_$X$($class$ const& value);
)");
            if (member.has_presence_accessors()) {
                out.print("    bool isset_$X$() const;\n    void unset_$X$();\n");
            }
            break;
        case member_kind::value_list:
            out.print(R"(    unsigned size_$X$() const;
    $in$ get_$X$(unsigned i) const;
    qbxV2::eqbx_error set_$X$(unsigned i, $in$ value);
    qbxV2::eqbx_error append_$X$($in$ value);
    qbxV2::eqbx_error insert_$X$(unsigned i, $in$ value);
    void delete_$X$(unsigned i);
    void clear_$X$();
)");
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            out.print(R"(    unsigned size_$X$() const;
    $class$ const& get_$X$(unsigned i) const;
    $class$& get_$X$(unsigned i);
    $class$& back_$X$();
    $class$& assign_$X$(unsigned i, $class$ const& value);
    qbxV2::eqbx_error append_$X$();
    qbxV2::eqbx_error insert_$X$(unsigned i);
    void delete_$X$(unsigned i);
    void clear_$X$();
)");
            break;
        case member_kind::any_list:
            out.print(
                R"(    /// Elements of any name, as text. Written as they stand: an entry has to be well-formed XML.
    unsigned size_any() const;
    /// `ns` and `name` may be null.
    void get_any(unsigned i, std::string* ns, std::string* name, std::string* value) const;
    qbxV2::eqbx_error append_any(std::string const& value);
    qbxV2::eqbx_error insert_any(unsigned i, std::string const& value);
    void delete_any(unsigned i);
    void clear_any();
)");
            break;
    }
}

void declare_storage(printer& out, const member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            out.print("    frame::single<$type$> m_$X$;\n");
            break;
        case member_kind::object:
        case member_kind::group:
            out.print("    frame::child<$class$> m_$X$;\n");
            break;
        case member_kind::value_list:
            out.print("    frame::list<$type$> m_$X$;\n");
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            out.print("    frame::list<$class$> m_$X$;\n");
            break;
        case member_kind::any_list:
            out.print("    frame::list<qbxV2::c_any_info> m_any;\n");
            break;
        case member_kind::value_option:
            out.print("    frame::option<$type$> m_$X$;\n");
            break;
        case member_kind::object_option:
            out.print("    frame::option<$class$> m_$X$;\n");
            break;
    }
}

namespace {

void define_single(printer& out, const class_plan& owner, const member_plan& member) {
    out.print("$out$ $C$::get_$X$() const { return m_$X$.value; }\n");
    if (owner.nillable && member.kind == member_kind::text) {
        out.print(R"(qbxV2::eqbx_error $C$::set_$X$($in$ value) {
    const qbxV2::eqbx_error result = frame::set(m_$X$, value, $limits$);
    if (result == qbxV2::EQBX_NO_ERROR) m_nil = false;
    return result;
}
)");
    } else {
        out.print(R"(qbxV2::eqbx_error $C$::set_$X$($in$ value) { return frame::set(m_$X$, value, $limits$); }
)");
    }
    if (member.has_presence_accessors()) {
        out.print(R"(bool $C$::isset_$X$() const { return m_$X$.set; }
void $C$::unset_$X$() { m_$X$.set = false; }
)");
    }
    define_enumeration_accessors(out, member);
}

void define_object(printer& out, const member_plan& member) {
    out.print(R"($class$ const& $C$::get_$X$() const { return m_$X$.get(); }
$class$& $C$::get_$X$() { return m_$X$.get(); }
$class$& $C$::assign_$X$($class$ const& value) { return m_$X$.assign(value); }
)");
    if (member.has_presence_accessors()) {
        out.print(R"(bool $C$::isset_$X$() const { return m_$X$.is_set(); }
void $C$::unset_$X$() { m_$X$.unset(); }
)");
    }
}

void define_value_list(printer& out) {
    out.print(R"(unsigned $C$::size_$X$() const { return m_$X$.size(); }
$in$ $C$::get_$X$(unsigned i) const { return m_$X$.get(i); }
qbxV2::eqbx_error $C$::set_$X$(unsigned i, $in$ value) { return frame::set(m_$X$, i, value); }
qbxV2::eqbx_error $C$::append_$X$($in$ value) {
    m_$X$.append(value);
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error $C$::insert_$X$(unsigned i, $in$ value) {
    m_$X$.insert(i, value);
    return qbxV2::EQBX_NO_ERROR;
}
void $C$::delete_$X$(unsigned i) { m_$X$.erase(i); }
void $C$::clear_$X$() { m_$X$.clear(); }
)");
}

void define_object_list(printer& out) {
    out.print(R"(unsigned $C$::size_$X$() const { return m_$X$.size(); }
$class$ const& $C$::get_$X$(unsigned i) const { return m_$X$.get(i); }
$class$& $C$::get_$X$(unsigned i) { return m_$X$.reach(i); }
$class$& $C$::back_$X$() { return m_$X$.back(); }
$class$& $C$::assign_$X$(unsigned i, $class$ const& value) {
    frame::assign_by_swap(m_$X$.reach(i), value);
    return m_$X$.reach(i);
}
qbxV2::eqbx_error $C$::append_$X$() {
    m_$X$.append();
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error $C$::insert_$X$(unsigned i) {
    m_$X$.insert(i);
    return qbxV2::EQBX_NO_ERROR;
}
void $C$::delete_$X$(unsigned i) { m_$X$.erase(i); }
void $C$::clear_$X$() { m_$X$.clear(); }
)");
}

void define_any_list(printer& out) {
    out.print(R"(unsigned $C$::size_any() const { return m_any.size(); }
void $C$::get_any(unsigned i, std::string* ns, std::string* name, std::string* value) const {
    const qbxV2::c_any_info& entry = m_any.get(i);
    if (ns != nullptr) *ns = entry.get_namespace();
    if (name != nullptr) *name = entry.get_name();
    *value = entry.get_value();
}
qbxV2::eqbx_error $C$::append_any(std::string const& value) { return insert_any(m_any.size(), value); }
qbxV2::eqbx_error $C$::insert_any(unsigned i, std::string const& value) {
    m_any.insert(i).set_value(value);
    return qbxV2::EQBX_NO_ERROR;
}
void $C$::delete_any(unsigned i) { m_any.erase(i); }
void $C$::clear_any() { m_any.clear(); }
)");
}

void define_value_option(printer& out, const member_plan& member) {
    out.print(R"($out$ $C$::get_$X$() const { return m_$X$.get(); }
// Intended: the choice moves before the value is checked.
qbxV2::eqbx_error $C$::set_$X$($in$ value) {
    choose(chosen_$X$);
    $type$& stored = m_$X$.get();
    const qbxV2::eqbx_error refused = $limits$.check(value);
    if (refused == qbxV2::EQBX_NO_ERROR) stored = value;
    return refused;
}
)");
    define_enumeration_accessors(out, member);
}

void define_object_option(printer& out) {
    out.print(R"($class$ const& $C$::get_$X$() const { return m_$X$.get(); }
$class$& $C$::get_$X$() {
    choose(chosen_$X$);
    return m_$X$.get();
}
$class$& $C$::assign_$X$($class$ const& value) {
    frame::assign_by_swap(get_$X$(), value);
    return get_$X$();
}
)");
}

}  // namespace

void define_accessors(printer& out, const class_plan& owner, const member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    out.print("\n");
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            define_single(out, owner, member);
            break;
        case member_kind::object:
        case member_kind::group:
            define_object(out, member);
            break;
        case member_kind::value_list:
            define_value_list(out);
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            define_object_list(out);
            break;
        case member_kind::any_list:
            define_any_list(out);
            break;
        case member_kind::value_option:
            define_value_option(out, member);
            break;
        case member_kind::object_option:
            define_object_option(out);
            break;
    }
}

}  // namespace vrl_codegen
