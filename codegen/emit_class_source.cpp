#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

/// The fields of the frame's two descriptions of an element, those that differ from the usual.
void define_element(printer& out, const class_plan& made) {
    std::vector<std::string> read{".source = k_source"};
    if (made.text_only) read.push_back(".has_text_only = true");
    if (made.accepts_empty) read.push_back(".accepts_empty = true");
    if (made.nillable) read.push_back(".is_nillable = true");
    std::vector<std::string> written;
    if (made.declares_namespaces) written.push_back(".declares_namespaces = true");
    if (made.text_only) written.push_back(".has_text_only = true");
    if (made.polymorphic) {
        written.push_back(std::string(".id = ").append(made.identity).append("::id"));
        written.push_back(".xsi_type = " + quoted("Vrl:" + made.identity));
    }
    out.print(R"(
qbxV2::eqbx_error $C$::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {$written$});
}
qbxV2::eqbx_error $C$::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{$read$};
    return frame::unmarshal(*this, kind, reader, name);
}
)",
              {{"written", join(written, ", ")}, {"read", join(read, ", ")}});
}

void define_thin_element(printer& out) {
    out.print(R"(
$C$::$C$() = default;
$C$::$C$($C$ const& other) = default;
$C$& $C$::operator=($C$ const& other) = default;
$C$::~$C$() = default;
qbxV2::eqbx_error $C$::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return $base$::marshal(out, name);
}
qbxV2::eqbx_error $C$::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return $base$::unmarshal(reader, name);
}
)");
}

void define_nil(printer& out, const class_plan& made) {
    if (!made.nillable) return;
    out.print(R"(
bool $C$::isnil_$C$() const { return m_nil; }
void $C$::setnil_$C$() { m_nil = true; }
)");
    if (made.renamed_text.empty()) return;
    out.print(R"($in$ $C$::get_$C$() const { return get_$base$(); }
qbxV2::eqbx_error $C$::set_$C$($in$ value) {
    const qbxV2::eqbx_error result = set_$base$(value);
    if (result == qbxV2::EQBX_NO_ERROR) m_nil = false;
    return result;
}
)",
              {{"in", made.renamed_text}});
}

void define_class(printer& out, const class_plan& made) {
    out.print("\n// $C$\n");
    if (made.kind == class_kind::group) {
        define_group(out, made);
        return;
    }
    if (!made.declares_members) {
        define_thin_element(out);
        define_standalone(out, made);
        return;
    }
    define_copying(out, made);
    if (made.kind == class_kind::choice) define_choice(out, made);
    define_identity(out, made);
    define_factory(out, made);
    define_element(out, made);
    define_standalone(out, made);
    for (const member_plan& member : made.members) define_accessors(out, member);
    define_nil(out, made);
    define_reading(out, made);
    define_writing(out, made);
}

}  // namespace

std::string emit_module_source(const module_plan& module) {
    printer out;
    out.print(R"(// Generated from schema/$module$.xsd. To change it, change the schema or V2/frame.
#include <string_view>
#include <utility>

#include "V2/Vrl.h"
#include "V2/format.h"
#include "V2/frame/group.h"
#include "V2/frame/marshal.h"
#include "V2/frame/members.h"
#include "V2/frame/reading.h"
#include "V2/frame/standalone.h"
#include "V2/frame/unmarshal.h"
#include "V2/frame/writing.h"
#include "V2/tokens.h"

namespace vrl_v2 {
namespace {

// Where reports say they were raised.
constexpr char k_source[] = "V2/$module$.cpp";

)",
              {{"module", module.name}});
    for (const limits_plan& limits : module.limits) define_limits(out, limits);
    out.print("\n// Names, a row each, and which of them may follow at each position.\n");
    for (const class_plan* made : module.classes) {
        if (!made->declares_members) continue;
        const printer_scope scope(out, {{"C", made->name}});
        define_tables(out, *made);
    }
    out.print("\n}  // namespace\n");
    for (const class_plan* made : module.classes) {
        const printer_scope scope(out, {{"C", made->name}, {"base", made->base}});
        define_class(out, *made);
    }
    out.print("\n}  // namespace vrl_v2\n");
    return out.text();
}

}  // namespace vrl_codegen
