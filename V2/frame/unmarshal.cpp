#include "V2/frame/unmarshal.h"

#include "V2/format.h"
#include "V2/frame/reading.h"

namespace vrl_v2::frame {
namespace {

using qbxV2::c_xml_reader;
using qbxV2::c_xml_reader_local;
using qbxV2::eqbx_error;
using qbxV2::EQBX_NO_ERROR;

/// One element being read. Every step answers whether reading goes on.
class element : public reporting {
public:
    element(void* self, const element_steps& steps, const element_kind& kind, c_xml_reader& reader,
            const std::string& name, int line)
        : reporting(reader, &m_result, kind.source),
          m_self(self),
          m_steps(steps),
          m_kind(kind),
          m_line(line),
          m_name(reader.get_element_name_stack(), name) {}

    eqbx_error read() {
        if (!is_within_depth() || !read_attributes()) return m_result;
        c_xml_reader_local scope(m_reader);
        if (m_kind.has_text_only) {
            read_text();
        } else {
            read_children();
        }
        return m_result;
    }

private:
    /// A limit that a handler could lift would be none: the document is refused whatever it answers.
    bool is_within_depth() {
        if (m_reader.depth() <= m_reader.get_max_depth()) return true;
        if (report(qbxV2::EQBX_BADLY_FORMED, m_name.get_str(), m_line)) stop(qbxV2::EQBX_BADLY_FORMED);
        return false;
    }

    bool read_attributes() {
        std::string& name = m_reader.attribute_name_buffer();
        eqbx_error error = EQBX_NO_ERROR;
        while (m_reader.get_attribute_event(nullptr, &error, &name)) {
            if (error != EQBX_NO_ERROR && !report(error, name, m_line)) return false;
            eqbx_error failed = EQBX_NO_ERROR;
            const bool taken = m_steps.attribute(m_self, m_reader, name, &failed);
            if (failed != EQBX_NO_ERROR) {
                stop(failed);
                return false;
            }
            if (!taken && !pass_over(name)) return false;
            if (is_at_end_of_input()) return false;
        }
        const eqbx_error missing = m_steps.required_attributes(m_self, m_reader);
        if (missing != EQBX_NO_ERROR) stop(missing);
        return !stopped();
    }

    bool pass_over(const std::string& name) {
        if (!m_reader.is_xsi_attribute(name) &&
            !report(qbxV2::EQBX_UNEXPECTED_ATTRIBUTE, m_name.get_str(), m_line)) {
            return false;
        }
        m_reader.skip_attribute_value();
        return true;
    }

    /// A handler that forgives every error of a tag that has no end must not keep reading it for ever.
    bool is_at_end_of_input() {
        if (m_reader.get_current_event() != qbxV2::EQXP_END_OF_MESSAGE && !m_reader.is_tag_cut())
            return false;
        stop(qbxV2::EQBX_UNEXPECTED_END);
        return true;
    }

    bool is_at_end() const { return m_reader.get_current_event() == qbxV2::EQXP_END_TAG; }
    bool is_nil() const { return m_kind.is_nillable && m_steps.is_nil(m_self); }

    void read_children() {
        if (is_at_end()) {
            finish_empty();
            return;
        }
        std::string& name = m_reader.element_name_buffer();
        if (!advance(name)) return;
        if (!is_nil()) {
            if (is_at_end()) {
                finish_empty();
                if (stopped() || !m_kind.accepts_empty) return;
            } else if (!read_body(name, true)) {
                return;
            }
        }
        expect_end(name);
    }

    void read_text() {
        std::string& name = m_reader.element_name_buffer();
        name = m_name.get_str();
        const bool has_content = !is_at_end();
        if (!is_nil() && !read_body(name, has_content)) return;
        if (is_at_end()) return;  // an empty-element tag has no end tag to check
        // Nearly always the end tag stands right here, and telling so takes no more than a comparison.
        if (m_reader.take_end_event(name)) return;
        if (advance(name)) expect_end(name);
    }

    void finish_empty() {
        if (!m_kind.accepts_empty && !is_nil()) {
            report(qbxV2::EQBX_UNEXPECTED_EMPTY_ELEMENT, m_name.get_str(), m_line);
        }
    }

    bool read_body(std::string& name, bool has_content) {
        eqbx_error failed = EQBX_NO_ERROR;
        m_steps.body(m_self, m_reader, &name, &failed, has_content);
        if (failed != EQBX_NO_ERROR) stop(failed);
        return !stopped();
    }

    bool advance(std::string& name) {
        eqbx_error error = EQBX_NO_ERROR;
        m_reader.get_element_event(nullptr, &error, &name);
        return error == EQBX_NO_ERROR || report(error, m_name.get_str(), m_line);
    }

    void expect_end(const std::string& name) {
        if (!is_at_end() || m_name != name) report(qbxV2::EQBX_BAD_END_OF_ELEMENT, m_name.get_str(), m_line);
    }

    eqbx_error m_result = EQBX_NO_ERROR;
    void* m_self;
    const element_steps& m_steps;
    const element_kind& m_kind;
    int m_line;
    qbxV2::c_string_stack_node m_name;
};

}  // namespace

eqbx_error unmarshal_element(void* self, const element_steps& steps, const element_kind& kind,
                             c_xml_reader& reader, const std::string& name, int line) {
    return element(self, steps, kind, reader, name, line).read();
}

eqbx_error find_document_element(c_xml_reader& reader, const char* local_name, const char* source, int line) {
    eqbx_error result = EQBX_NO_ERROR;
    reporting checks(reader, &result, source);
    std::string& name = reader.element_name_buffer();
    eqbx_error error = EQBX_NO_ERROR;
    reader.get_element_event(nullptr, &error, &name);
    if (error != EQBX_NO_ERROR && !checks.report(error, name, line)) return result;
    if (reader.get_element_ns_id() != k_document_namespace_id || reader.get_local_name() != local_name) {
        checks.report(qbxV2::EQBX_ELEMENT_NOT_FOUND, name, line);
    }
    return result;
}

}  // namespace vrl_v2::frame
