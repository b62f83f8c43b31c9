#include "V2/document_writer.h"

#include <ostream>

#include "V2/file_outcome.h"
#include "V2/frame/marshal.h"
#include "V2/frame/writing.h"
#include "V2/library_stamp.h"
#include "V2/written_place.h"
#include "runtime/xml_writer.h"

namespace vrl_v2 {
namespace {

using qbxV2::eqbx_error;

constexpr char k_root[] = "Vrl:Vrl";

/// Takes everything and keeps nothing.
class nowhere : public std::streambuf {
protected:
    int_type overflow(int_type c) override { return traits_type::not_eof(c); }
    std::streamsize xsputn(const char* /*text*/, std::streamsize length) override { return length; }
};

/// The root element with another preamble than its own, child by child as the root writes them itself.
eqbx_error marshal_document(const Vrl& document, const Preamble& preamble, std::ostream& os) {
    qbxV2::c_xml_writer out(os, qbxV2::c_xml_writer::include_xml_decl, "\t", "\n");
    frame::open_element gathering(out);
    frame::open_start_tag(out, k_root, {.declares_namespaces = true});
    frame::end_start_tag_of_children(out);
    frame::children_writer children(out);
    children.object(preamble, "Vrl:Preamble");
    for (unsigned i = 0; i < document.size_Color() && os; ++i)
        children.object(document.get_Color(i), "Vrl:Color");
    for (unsigned i = 0; i < document.size_Palette() && os; ++i)
        children.object(document.get_Palette(i), "Vrl:Palette");
    for (unsigned i = 0; i < document.size_ColorQualityControl() && os; ++i)
        children.object(document.get_ColorQualityControl(i), "Vrl:ColorQualityControl");
    if (children.result() == qbxV2::EQBX_NO_ERROR) frame::write_end_tag_of_children(out, k_root);
    gathering.close();
    return children.result();
}

/// Copies go the way of the setters, which would make required values present that are not: so the original
/// must be complete before a copy may stand for it.
eqbx_error check_complete(const Preamble& preamble) {
    nowhere buffer;
    std::ostream os(&buffer);
    qbxV2::c_xml_writer out(os, "", "");
    return preamble.marshal(out, "Vrl:Preamble");
}

Preamble stamped(const Preamble& original) {
    Preamble preamble(original);
    preamble.get_Header().assign_WriteSDKInformation(this_library());
    return preamble;
}

/// Writes once more, to see where it ends.
file_outcome incomplete(const Vrl& document, const Preamble& preamble, eqbx_error code) {
    written_place place;
    std::ostream os(&place);
    marshal_document(document, preamble, os);
    file_outcome outcome = failed(file_failure::bad_document, {});
    outcome.code = code;
    outcome.item = place.path();
    outcome.message = "the document is not complete: " + place.description() + " (" +
                      qbxV2::get_error_description(code) + ")";
    return outcome;
}

}  // namespace

file_outcome write_document(const Vrl& document, document_output& out) {
    const Preamble& original = document.get_Preamble();
    if (!document.is_occurs_ok()) return incomplete(document, original, qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
    const eqbx_error unfit = check_complete(original);
    if (unfit != qbxV2::EQBX_NO_ERROR) return incomplete(document, original, unfit);
    const Preamble preamble = stamped(original);
    std::ostream os(&out);
    const eqbx_error code = marshal_document(document, preamble, os);
    if (code != qbxV2::EQBX_NO_ERROR && out.problem()) return incomplete(document, preamble, code);
    out.finish();
    return out.problem();
}

}  // namespace vrl_v2
