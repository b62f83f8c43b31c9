#include "codegen/emit.h"

namespace vrl_codegen {
namespace {

bool has_initial_values(const class_plan& made) {
    for (const member_plan& member : made.members) {
        if (!member.initial.empty()) return true;
    }
    return made.kind == class_kind::root;
}

std::string copy_call(const member_plan& member) {
    const std::string both = "m_" + member.name + ", other.m_" + member.name;
    const std::string need = member.required ? "required" : "optional";
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            return "frame::copy_" + need + "(" + both + ", " + member.value.limits + ")";
        case member_kind::object:
        case member_kind::group:
            return "frame::copy_" + need + "(" + both + ")";
        case member_kind::value_option:
            return "if (other.m_chosen == chosen_" + member.name + ") set_" + member.name + "(other.get_" +
                   member.name + "())";
        case member_kind::object_option:
            return "if (other.m_chosen == chosen_" + member.name + ") assign_" + member.name + "(other.get_" +
                   member.name + "())";
        default:
            return "m_" + member.name + ".copy_from(other.m_" + member.name + ")";
    }
}

std::string occurs_test(const member_plan& member) {
    const std::string stored = "m_" + member.name;
    if (!member.required || !member.has_presence) return {};
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            return stored + ".set";
        case member_kind::object:
            return member.holds_choice ? "frame::has_chosen(" + stored + ")" : stored + ".is_set()";
        case member_kind::group:
            return "frame::has_chosen(" + stored + ")";
        case member_kind::value_list:
        case member_kind::object_list:
        case member_kind::group_list:
        case member_kind::any_list:
            return "!" + stored + ".empty()";
        default:
            return {};
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
    const std::string all = join(tests, " && ");
    if (!made.nillable) return all;
    return tests.size() == 1 ? "m_nil || " + all : "m_nil || (" + all + ")";
}

void define_initial_values(printer& out, const class_plan& made) {
    if (made.kind == class_kind::root) return;  // hand-written, beside the entry points
    out.print("\nvoid $C$::init() {\n");
    for (const member_plan& member : made.members) {
        if (!member.initial.empty()) {
            out.print("    m_$X$.value = $initial$;\n", {{"X", member.name}, {"initial", member.initial}});
        }
    }
    out.print("}\n");
}

void define_copying(printer& out, const class_plan& made) {
    const bool init = has_initial_values(made);
    if (init) {
        out.print("\n$C$::$C$() { init(); }\n");
    } else {
        out.print("\n$C$::$C$() = default;\n");
    }
    out.print("$C$::$C$([[maybe_unused]] $C$ const& other)$base$ {\n",
              {{"base", made.base.empty() ? "" : " : " + made.base + "(other)"}});
    if (init) out.print("    init();\n");
    for (const member_plan& member : made.members) out.print("    $copy$;\n", {{"copy", copy_call(member)}});
    if (made.nillable) out.print("    m_nil = other.m_nil;\n");
    out.print(R"(}
$C$& $C$::operator=($C$ const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
$C$::~$C$() = default;

void $C$::swap([[maybe_unused]] $C$& other) {
)");
    if (!made.base.empty()) out.print("    $base$::swap(other);\n", {{"base", made.base}});
    if (made.kind == class_kind::choice) out.print("    std::swap(m_chosen, other.m_chosen);\n");
    for (const member_plan& member : made.members) {
        out.print("    m_$X$.swap(other.m_$X$);\n", {{"X", member.name}});
    }
    if (made.nillable) out.print("    std::swap(m_nil, other.m_nil);\n");
    out.print(R"(}
void $C$::reset() { frame::reset_by_swap(*this); }
bool $C$::is_occurs_ok() const { return $occurs$; }
)",
              {{"occurs", occurs_expression(made)}});
}

void define_identity(printer& out, const class_plan& made) {
    if (!made.polymorphic || made.kind != class_kind::type) return;
    // An array of its own, so that no equal literal elsewhere shares its address.
    out.print(R"(
namespace {
constexpr char k_$C$_id[] = "$C$";
}  // namespace
char const* $C$::id = k_$C$_id;
$C$* $C$::clone() const { return new $C$(*this); }
char const* $C$::getid() const { return id; }
bool $C$::has_id(char const* identity) const { return identity == id$or_base$; }
)",
              {{"or_base", made.base.empty() ? "" : " || " + made.base + "::has_id(identity)"}});
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

/// The fields of the frame's two descriptions of an element, those that differ from the usual.
void define_element(printer& out, const class_plan& made) {
    std::vector<std::string> read{".source = k_source"};
    if (made.text_only) read.push_back(".has_text_only = true");
    if (made.accepts_empty) read.push_back(".accepts_empty = true");
    if (made.nillable) read.push_back(".is_nillable = true");
    std::vector<std::string> written;
    if (made.declares_namespaces) written.push_back(".declares_namespaces = true");
    if (made.text_only) written.push_back(".has_text_only = true");
    const std::string identity = made.kind == class_kind::element ? made.base : made.name;
    if (made.polymorphic) {
        written.push_back(".id = " + identity + "::id");
        written.push_back(".xsi_type = \"Vrl:" + identity + "\"");
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

void define_thin_element(printer& out, const class_plan& made) {
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
)",
              {{"base", made.base}});
}

void define_standalone(printer& out, const class_plan& made) {
    if (!made.standalone) return;
    const bool init = made.kind == class_kind::root;
    const printer_scope scope(out, {{"element", made.xml_name}, {"init", init ? "    init();\n" : ""}});
    out.print(R"(
qbxV2::eqbx_error $C$::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:$element$"), os);
}
qbxV2::eqbx_error $C$::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:$element$"), text);
}
qbxV2::eqbx_error $C$::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:$element$"), path);
}
qbxV2::eqbx_error $C$::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "$element$", k_source);
}
qbxV2::eqbx_error $C$::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error $C$::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error $C$::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
)");
    for (const char* arguments :
         {"std::string const& text", "char const* bytes, unsigned length", "char const* path"}) {
        const std::string passed = std::string(arguments).find("text") != std::string::npos ? "text"
                                   : std::string(arguments).find("length") != std::string::npos
                                       ? "bytes, length"
                                       : "path";
        out.print(R"($C$::$C$($arguments$, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
$init$    *error = unmarshal($passed$);
}
)",
                  {{"arguments", arguments}, {"passed", passed}});
    }
}

void define_nil(printer& out, const class_plan& made) {
    if (!made.nillable) return;
    out.print(R"(
bool $C$::isnil_$C$() const { return m_nil; }
void $C$::setnil_$C$() { m_nil = true; }
)");
    if (made.kind == class_kind::element && made.text_only) {
        out.print(R"(std::wstring const& $C$::get_$C$() const { return get_$base$(); }
qbxV2::eqbx_error $C$::set_$C$(std::wstring const& value) {
    const qbxV2::eqbx_error result = set_$base$(value);
    if (result == qbxV2::EQBX_NO_ERROR) m_nil = false;
    return result;
}
)",
                  {{"base", made.base}});
    }
}

void define_class(printer& out, const class_plan& made) {
    out.print("\n// $C$\n");
    if (made.kind == class_kind::group) {
        define_group(out, made);
        return;
    }
    if (!made.declares_members) {
        define_thin_element(out, made);
        define_standalone(out, made);
        return;
    }
    define_copying(out, made);
    if (has_initial_values(made)) define_initial_values(out, made);
    if (made.kind == class_kind::choice) define_choice(out, made);
    define_identity(out, made);
    define_factory(out, made);
    define_element(out, made);
    define_standalone(out, made);
    for (const member_plan& member : made.members) define_accessors(out, made, member);
    define_nil(out, made);
    define_reading(out, made);
    define_writing(out, made);
}

}  // namespace

std::string emit_module_source(const plan&, const module_plan& module) {
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
    for (const limits_plan& limits : module.limits) out.print("$it$\n", {{"it", limits.definition}});
    out.print("\n// Names, a row each, and which of them may follow at each position.\n");
    for (const class_plan* made : module.classes) {
        const printer_scope scope(out, {{"C", made->name}});
        define_tables(out, *made);
    }
    out.print("\n}  // namespace\n");
    for (const class_plan* made : module.classes) {
        const printer_scope scope(out, {{"C", made->name}});
        define_class(out, *made);
    }
    out.print("\n}  // namespace vrl_v2\n");
    return out.text();
}

}  // namespace vrl_codegen
