#include "codegen/emit_members.h"

namespace vrl_codegen {

void declare_object(printer& out, const member_plan& member) {
    out.print(R"(    $class$ const& get_$X$() const;
    $class$& get_$X$();
    $class$& assign_$X$($class$ const& value);
)");
    declare_presence(out, member);
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

}  // namespace vrl_codegen
