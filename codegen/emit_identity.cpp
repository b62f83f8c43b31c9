#include "codegen/emit_class.h"

namespace vrl_codegen {

void define_identity(printer& out, const class_plan& made) {
    if (!made.has_identity) return;
    // An array of its own, so that no equal literal elsewhere shares its address.
    out.print(R"(
namespace {
constexpr char k_$C$_id[] = "$C$";
}  // namespace
char const* $C$::id = k_$C$_id;
$C$* $C$::clone() const { return new $C$(*this); }
char const* $C$::getid() const { return id; }
bool $C$::has_id(char const* identity) const { return $same$; }
)",
              {{"same", made.base.empty() ? "identity == id"
                                          : "identity == id || " + made.base + "::has_id(identity)"}});
}

void define_factory(printer& out, const class_plan& made) {
    if (made.factory.empty()) return;
    out.print("\nnamespace {\nconstexpr frame::family_member<$C$> k_$C$_family[] = {\n");
    for (const std::string& name : made.factory) {
        out.print("    {&$type$::id, &frame::make<$C$, $type$>},\n", {{"type", name}});
    }
    out.print(R"(};
}  // namespace
$C$* $C$::factory(int ns_id, std::string const& type_name) {
    return frame::make_by_name(k_$C$_family, ns_id, type_name);
}
)");
}

}  // namespace vrl_codegen
