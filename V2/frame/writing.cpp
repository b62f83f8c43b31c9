#include "V2/frame/writing.h"

#include <ostream>

namespace vrl_v2::frame {
namespace {

template <class T>
void put_streamed(c_xml_writer& out, const T& value) {
    out(false) << value;
}

}  // namespace

void put_value(c_xml_writer& out, double value) {
    if (!out.is_gathering()) {
        put_streamed(out, qbxV2::c_as_xml<double>(value));
        return;
    }
    char text[qbxV2::k_number_text_size];
    out.put(text, qbxV2::format_double(text, value));
}

void put_value(c_xml_writer& out, bool value) { out.put(value ? "true" : "false"); }

void put_value(c_xml_writer& out, int value) {
    if (out.is_gathering()) {
        qbxV2::append_int(out.gathered(), value);
    } else {
        put_streamed(out, value);
    }
}

void put_value(c_xml_writer& out, unsigned value) {
    if (out.is_gathering()) {
        qbxV2::append_unsigned(out.gathered(), value);
    } else {
        put_streamed(out, value);
    }
}

void put_value(c_xml_writer& out, unsigned char value) { put_value(out, static_cast<unsigned>(value)); }

void put_value(c_xml_writer& out, const std::wstring& value) {
    if (out.is_gathering()) {
        qbxV2::append_escaped(out.gathered(), value);
    } else {
        put_streamed(out, qbxV2::c_as_xml<std::wstring>(value));
    }
}

void put_value(c_xml_writer& out, const qbxV2::c_datetime& value) {
    if (out.is_gathering()) {
        value.append_text(out.gathered());
        out.note_zero_fill();
    } else {
        put_streamed(out, value);
    }
}

void put_value(c_xml_writer& out, const qbxV2::c_binary& value) {
    put_streamed(out, qbxV2::c_as_base64<qbxV2::c_binary>(value));
}

void children_writer::raw(const std::string& text) {
    if (m_result != qbxV2::EQBX_NO_ERROR) return;
    m_out.put_indent();
    m_out.put(text.data(), text.size());
    m_out.put_line_end();
}

}  // namespace vrl_v2::frame
