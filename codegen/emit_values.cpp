#include <algorithm>

#include "codegen/emit_members.h"
#include "codegen/plan_names.h"

namespace vrl_codegen {
namespace {

/// What a setter refuses, in the words of the result codes.
std::string refusals(const value_plan& value) {
    const facets& limits = value.facet;
    std::vector<std::string> parts;
    const auto add = [&parts](const char* before, const std::string& bound, const char* behind) {
        parts.push_back(std::string(before).append(bound).append(behind));
    };
    if (limits.min_inclusive) add("EQBX_VALUE_TOO_SMALL below ", *limits.min_inclusive, "");
    if (limits.min_exclusive) add("EQBX_VALUE_TOO_SMALL from ", *limits.min_exclusive, " down");
    if (limits.max_inclusive) add("EQBX_VALUE_TOO_LARGE above ", *limits.max_inclusive, "");
    if (limits.max_exclusive) add("EQBX_VALUE_TOO_LARGE from ", *limits.max_exclusive, " up");
    if (limits.min_length)
        add("EQBX_LENGTH_TOO_SHORT below ", std::to_string(*limits.min_length), " unit(s)");
    if (limits.max_length) add("EQBX_LENGTH_TOO_LONG above ", std::to_string(*limits.max_length), " unit(s)");
    if (value.is_enumerated()) add("EQBX_VALUE_NOT_ENUMERATED for any other text", "", "");
    return parts.empty() ? std::string() : std::string("Refuses: ").append(join(parts, ", ")).append(".");
}

void declare_enumeration(printer& out, const member_plan& member) {
    if (!member.value.is_enumerated()) return;
    out.print("    enum Eenum_$X$ : int {\n        $X$_no_match = 0,\n");
    std::vector<std::string> enumerators;
    std::size_t widest = 0;
    for (const std::string& literal : member.value.facet.enumeration) {
        enumerators.push_back(enumerator(member.name, literal)
                                  .append(" = ")
                                  .append(std::to_string(enumerators.size() + 1))
                                  .append(","));
        widest = std::max(widest, enumerators.back().size());
    }
    for (std::size_t i = 0; i < enumerators.size(); ++i) {
        out.print("        $enumerator$$pad$  ///< $literal$\n",
                  {{"enumerator", enumerators[i]},
                   {"pad", std::string(widest - enumerators[i].size(), ' ')},
                   {"literal", quoted(member.value.facet.enumeration[i])}});
    }
    out.print("    };\n");
}

void define_enumeration(printer& out, const member_plan& member) {
    if (!member.value.is_enumerated()) return;
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

void declare_value(printer& out, const member_plan& member) {
    declare_enumeration(out, member);
    out.print(comment(refusals(member.value), "    "));
    out.print("    $in$ get_$X$() const;\n    qbxV2::eqbx_error set_$X$($in$ value);\n");
    declare_presence(out, member);
    if (!member.value.is_enumerated()) return;
    out.print(R"(    Eenum_$X$ getenum_$X$() const;
    bool setenum_$X$(Eenum_$X$ value);
)");
}

void define_value(printer& out, const member_plan& member) {
    out.print("$in$ $C$::get_$X$() const { return m_$X$.value; }\n");
    if (member.ends_nil) {
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
    define_enumeration(out, member);
}

void define_value_option(printer& out, const member_plan& member) {
    out.print(R"($in$ $C$::get_$X$() const { return m_$X$.get(); }
// Intended: the choice moves before the value is checked.
qbxV2::eqbx_error $C$::set_$X$($in$ value) {
    choose(chosen_$X$);
    $type$& stored = m_$X$.get();
    const qbxV2::eqbx_error refused = $limits$.check(value);
    if (refused == qbxV2::EQBX_NO_ERROR) stored = value;
    return refused;
}
)");
    define_enumeration(out, member);
}

}  // namespace vrl_codegen
