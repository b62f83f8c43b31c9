#include "V2/frame/marshal.h"

#include "V2/format.h"

namespace vrl_v2::frame {

using qbxV2::c_xml_writer;

void open_start_tag(c_xml_writer& out, const char* name, const written_kind& kind) {
    out.put_indent();
    out.put("<", 1);
    out.put(name);
    if (kind.declares_namespaces) {
        out.conditionally_select_ns_map(document_namespaces());
        out.conditionally_write_ns_attrs(true);
    }
    if (kind.id == nullptr) return;
    // Intended: only writing the attribute disarms the expectation; an object of the expected class
    // leaves it armed for the first different one further inside.
    const char* const expected = out.get_expected_class_identity();
    if (expected == nullptr || expected == kind.id) return;
    out.put(" xsi:type=\"");
    out.put(kind.xsi_type);
    out.put("\"", 1);
    out.clear_expected_class_identity();
}

void close_as_nil(c_xml_writer& out) {
    out.put(" xsi:nil=\"true\"/>");
    out.put_line_end();
}

void end_start_tag_of_children(c_xml_writer& out) {
    out.put(">", 1);
    out.put_line_end();
    out.indent();
}

void end_start_tag_of_text(c_xml_writer& out) { out.put(">", 1); }

void write_end_tag_of_children(c_xml_writer& out, const char* name) {
    out.undent();
    out.put_indent();
    write_end_tag_of_text(out, name);
}

void write_end_tag_of_text(c_xml_writer& out, const char* name) {
    out.put("</", 2);
    out.put(name);
    out.put(">", 1);
    out.put_line_end();
}

}  // namespace vrl_v2::frame
