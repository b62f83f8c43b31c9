#include "runtime/must_understand.h"

#include <memory>
#include <vector>

#include "runtime/open_elements.h"
#include "runtime/reader.h"

namespace qbxV2 {
namespace {

using decider = eqbx_must_understand (*)(const std::string&);

/// The walk over one document. Open elements are kept on a list instead of the call stack.
class c_scan {
public:
    c_scan(c_xml_reader& reader, const std::string& ns, const std::string& local_name, decider judge)
        : m_reader(reader), m_ns(ns), m_local_name(local_name), m_judge(judge) {}
    c_scan(const c_scan&) = delete;
    c_scan& operator=(const c_scan&) = delete;
    ~c_scan() {
        while (!m_scopes.empty()) m_scopes.pop_back();
    }

    /// Scans the element whose name was just read.
    eqbx_must_understand run(const std::string& root);

private:
    enum class tag { has_body, is_empty, decided };
    using scope = std::unique_ptr<c_xml_reader_local>;

    tag scan_attributes();
    bool is_wanted(const std::string& qname);
    bool enter(const std::string& name, scope child_scope);
    bool read_child();
    bool leave(const std::string& name);
    bool decide(eqbx_must_understand answer) {
        m_answer = answer;
        return answer == EQBX_MUST_UNDERSTAND_NO;
    }

    c_xml_reader& m_reader;
    const std::string& m_ns;
    const std::string& m_local_name;
    decider m_judge;
    eqbx_must_understand m_answer = EQBX_MUST_UNDERSTAND_NO;
    detail::c_open_elements m_open;
    std::vector<scope> m_scopes;
    std::string m_name;
    std::string m_attribute;
    std::string m_scratch;
};

eqbx_must_understand c_scan::run(const std::string& root) {
    bool goes_on = enter(root, nullptr);
    while (goes_on && !m_open.empty()) goes_on = read_child();
    return m_answer;
}

bool c_scan::read_child() {
    auto child_scope = std::make_unique<c_xml_reader_local>(m_reader);
    const eqxp_xml_event event = m_reader.get_element_name(child_scope.get(), &m_name);
    if (event == EQXP_NAME) {
        m_reader.crack_name(m_name);
        return enter(m_name, std::move(child_scope));
    }
    child_scope.reset();
    if (event == EQXP_TEXT) return true;
    return event == EQXP_END_TAG ? leave(m_name) : decide(EQBX_MUST_UNDERSTAND_INVALID);
}

bool c_scan::enter(const std::string& name, scope child_scope) {
    const tag found = scan_attributes();
    if (found == tag::decided) return false;
    if (found == tag::is_empty) return true;
    if (m_open.size() >= m_reader.get_max_depth()) return decide(EQBX_MUST_UNDERSTAND_INVALID);
    m_open.push(name);
    m_scopes.push_back(std::move(child_scope));
    return true;
}

bool c_scan::leave(const std::string& name) {
    if (!m_open.top_is(name)) return decide(EQBX_MUST_UNDERSTAND_INVALID);
    m_open.pop();
    m_scopes.pop_back();
    return true;
}

c_scan::tag c_scan::scan_attributes() {
    for (;;) {
        const eqxp_xml_event event = m_reader.get_attribute_name(&m_attribute, false);
        if (event == EQXP_START_TAG_END) return tag::has_body;
        if (event == EQXP_END_TAG) return tag::is_empty;
        if (event != EQXP_NAME) {
            decide(EQBX_MUST_UNDERSTAND_INVALID);
            return tag::decided;
        }
        if (!is_wanted(m_attribute)) {
            m_reader.skip_attribute_value();
            continue;
        }
        const bool read = m_reader.get_attribute_value(&m_scratch, EQBX_WS_PRESERVE);
        if (!decide(read ? m_judge(m_scratch) : EQBX_MUST_UNDERSTAND_INVALID)) return tag::decided;
    }
}

bool c_scan::is_wanted(const std::string& qname) {
    return c_xml::get_local_name(qname, &m_scratch) == m_local_name &&
           m_reader.get_namespace(qname, &m_scratch) == m_ns;
}

}  // namespace

eqbx_must_understand bool_must_understand(const std::string& value) {
    if (value == "1" || value == "true") return EQBX_MUST_UNDERSTAND_YES;
    if (value == "0" || value == "false") return EQBX_MUST_UNDERSTAND_NO;
    return EQBX_MUST_UNDERSTAND_INVALID;
}

eqbx_must_understand has_must_understand(c_xml_reader& reader, const std::string& ns,
                                         const std::string& local_name, decider decide) {
    c_xml_reader_local root_scope(reader);
    std::string name;
    reader.restore_event(reader.get_element_name(&root_scope, &name));
    if (reader.get_current_event() != EQXP_NAME) return EQBX_MUST_UNDERSTAND_INVALID;
    reader.crack_name(name);
    const eqbx_must_understand answer = c_scan(reader, ns, local_name, decide).run(name);
    reader.rewind();
    return answer;
}

bool get_instance_namespace(c_xml_reader& reader, std::string* ns) {
    c_xml_reader_local root_scope(reader);
    std::string name;
    reader.restore_event(reader.get_element_name(&root_scope, &name));
    bool found = false;
    if (reader.get_current_event() == EQXP_NAME) {
        reader.crack_name(name);
        found = reader.get_namespace(name, ns) != c_xml_reader::k_namespace_not_found;
    }
    reader.rewind();
    return found;
}

}  // namespace qbxV2
