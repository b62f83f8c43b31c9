#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

void define_parsing_constructor(printer& out, const char* arguments, const char* passed) {
    out.print(R"($C$::$C$($arguments$, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
$init$    *error = unmarshal($passed$);
}
)",
              {{"arguments", arguments}, {"passed", passed}});
}

}  // namespace

void declare_standalone(printer& out, const class_plan& made) {
    if (!made.standalone) return;
    out.print(R"(
    /// A document that holds this element alone. The path forms give EQBX_FILE_NOT_OPENED for a file that
    /// cannot be opened; a failed write to a path deletes the file, one to a text leaves it alone.
    qbxV2::eqbx_error marshal(std::ostream& os) const;
    qbxV2::eqbx_error marshal(std::string* text) const;
    qbxV2::eqbx_error marshal(char const* path) const;
    /// Reading does not reset the object first.
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader);
    qbxV2::eqbx_error unmarshal(std::string const& text);
    qbxV2::eqbx_error unmarshal(char const* bytes, unsigned length);
    qbxV2::eqbx_error unmarshal(char const* path);
    $C$(std::string const& text, qbxV2::eqbx_error* error);
    $C$(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    $C$(char const* path, qbxV2::eqbx_error* error);
)");
}

void define_standalone(printer& out, const class_plan& made) {
    if (!made.standalone) return;
    const printer_scope scope(out,
                              {{"element", made.xml_name}, {"init", made.has_init() ? "    init();\n" : ""}});
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
    define_parsing_constructor(out, "std::string const& text", "text");
    define_parsing_constructor(out, "char const* bytes, unsigned length", "bytes, length");
    define_parsing_constructor(out, "char const* path", "path");
}

}  // namespace vrl_codegen
