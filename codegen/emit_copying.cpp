#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

std::string copy_call(const member_plan& member) {
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            return member.required ? "frame::copy_required(m_$X$, other.m_$X$, $limits$)"
                                   : "frame::copy_optional(m_$X$, other.m_$X$, $limits$)";
        case member_kind::object:
        case member_kind::group:
            return member.required ? "frame::copy_required(m_$X$, other.m_$X$)"
                                   : "frame::copy_optional(m_$X$, other.m_$X$)";
        case member_kind::value_option:
            return "if (other.m_chosen == chosen_$X$) set_$X$(other.get_$X$())";
        case member_kind::object_option:
            return "if (other.m_chosen == chosen_$X$) assign_$X$(other.get_$X$())";
        default:
            return "m_$X$.copy_from(other.m_$X$)";
    }
}

std::string has_chosen(const std::string& stored) {
    return std::string("frame::has_chosen(").append(stored).append(")");
}

/// What has to hold for the member to be written; empty where nothing has to.
std::string occurs_test(const member_plan& member) {
    const std::string stored = "m_" + member.name;
    if (!member.demanded_on_writing()) return {};
    if (member.is_list()) return std::string("!").append(stored).append(".empty()");
    switch (member.kind) {
        case member_kind::object:
            return member.holds_choice ? has_chosen(stored) : stored + ".is_set()";
        case member_kind::group:
            return has_chosen(stored);
        case member_kind::value_option:
        case member_kind::object_option:
            return {};
        default:
            return stored + ".set";
    }
}

std::string occurs_expression(const class_plan& made) {
    std::vector<std::string> tests;
    if (!made.base.empty()) tests.push_back(made.base + "::is_occurs_ok()");
    if (made.kind == class_kind::choice) tests.push_back("m_chosen != chosen_none");
    for (const member_plan& member : made.members) {
        const std::string test = occurs_test(member);
        if (!test.empty()) tests.push_back(test);
    }
    if (tests.empty()) tests.push_back("true");
    std::string all = join(tests, " && ");
    if (!made.nillable) return all;
    return tests.size() == 1 ? "m_nil || " + all : std::string("m_nil || (").append(all).append(")");
}

void define_initial_values(printer& out, const class_plan& made) {
    out.print("\nvoid $C$::init() {\n");
    for (const member_plan& member : made.members) {
        if (member.initial.empty()) continue;
        const bool text = member.value.kind == value_kind::text;
        out.print("    m_$X$.value = $initial$;\n",
                  {{"X", member.name}, {"initial", text ? wide_quoted(member.initial) : member.initial}});
    }
    out.print("}\n");
}

void define_constructors(printer& out, const class_plan& made) {
    const bool init = made.has_init();
    out.print(init ? "\n$C$::$C$() { init(); }\n" : "\n$C$::$C$() = default;\n");
    out.print(made.base.empty() ? "$C$::$C$([[maybe_unused]] $C$ const& other) {\n"
                                : "$C$::$C$([[maybe_unused]] $C$ const& other) : $base$(other) {\n");
    if (init) out.print("    init();\n");
    for (const member_plan& member : made.members) {
        out.print("    " + copy_call(member) + ";\n", {{"X", member.name}, {"limits", member.value.limits}});
    }
    if (made.nillable) out.print("    m_nil = other.m_nil;\n");
    out.print(R"(}
$C$& $C$::operator=($C$ const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
$C$::~$C$() = default;
)");
}

/// Objects are exchanged by their contents, so both sides need them; everything else moves as it stands.
bool is_exchanged_by_contents(const member_plan& member) {
    return member.kind == member_kind::object || member.kind == member_kind::group;
}

void define_making_room(printer& out, const class_plan& made) {
    std::string steps;
    const auto step = [&steps](const std::string& call, const std::string& argument) {
        steps.append("    ").append(call).append("make_room_for(").append(argument).append(");\n");
    };
    if (!made.base.empty()) step(made.base + "::", "other");
    for (const member_plan& member : made.members) {
        if (is_exchanged_by_contents(member)) step("m_" + member.name + ".", "other.m_" + member.name);
    }
    out.print(steps.empty() ? "void $C$::make_room_for($C$ const&) {}\n"
                            : "void $C$::make_room_for($C$ const& other) {\n$steps$}\n",
              {{"steps", steps}});
}

void define_swap(printer& out, const class_plan& made) {
    out.print("\nvoid $C$::swap($C$& other) { frame::swap_whole(*this, other); }\n");
    define_making_room(out, made);
    out.print("void $C$::exchange([[maybe_unused]] $C$& other) noexcept {\n");
    if (!made.base.empty()) out.print("    $base$::exchange(other);\n");
    if (made.kind == class_kind::choice) out.print("    std::swap(m_chosen, other.m_chosen);\n");
    for (const member_plan& member : made.members) {
        out.print(is_exchanged_by_contents(member) ? "    m_$X$.exchange(other.m_$X$);\n"
                                                   : "    m_$X$.swap(other.m_$X$);\n",
                  {{"X", member.name}});
    }
    if (made.nillable) out.print("    std::swap(m_nil, other.m_nil);\n");
    out.print("}\n");
}

}  // namespace

void define_copying(printer& out, const class_plan& made) {
    define_constructors(out, made);
    define_swap(out, made);
    out.print(R"(void $C$::reset() { frame::reset_by_swap(*this); }
bool $C$::is_occurs_ok() const { return $occurs$; }
)",
              {{"occurs", occurs_expression(made)}});
    if (made.has_initial_values()) define_initial_values(out, made);
}

}  // namespace vrl_codegen
