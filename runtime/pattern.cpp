#include "runtime/pattern.h"

#include <libxml/xmlerror.h>
#include <libxml/xmlregexp.h>

#include "runtime/text_conversions.h"

namespace qbxV2 {
namespace {

#if LIBXML_VERSION >= 21200
void ignore_error(void* /*context*/, const xmlError* /*error*/) {}
#else
void ignore_error(void* /*context*/, xmlError* /*error*/) {}
#endif

/// Keeps the engine from printing to the standard error stream. The handler is the calling thread's own.
class quiet_engine {
public:
    quiet_engine() : m_handler(xmlStructuredError), m_context(xmlStructuredErrorContext) {
        xmlSetStructuredErrorFunc(nullptr, ignore_error);
    }
    quiet_engine(const quiet_engine&) = delete;
    quiet_engine& operator=(const quiet_engine&) = delete;
    ~quiet_engine() { xmlSetStructuredErrorFunc(m_context, m_handler); }

private:
    xmlStructuredErrorFunc m_handler;
    void* m_context;
};

const xmlChar* as_xml(const std::string& text) { return reinterpret_cast<const xmlChar*>(text.c_str()); }

constexpr std::size_t k_offset_size = sizeof "+hh:mm" - 1;

}  // namespace

c_regex::c_regex(const std::string& pattern) : m_compiled(nullptr) {
    const quiet_engine quiet;
    m_compiled = xmlRegexpCompile(as_xml(pattern));
}

c_regex::~c_regex() { xmlRegFreeRegexp(m_compiled); }

bool c_regex::is_match(const std::string& text) const {
    if (!m_compiled) return false;
    const quiet_engine quiet;
    // Intended: a failure of the engine, below 0, counts as a match.
    return xmlRegexpExec(m_compiled, as_xml(text)) != 0;
}

c_pattern::c_pattern(const char* pattern) : c_regex(pattern ? pattern : "") {}

bool c_pattern::is_match(const std::string& text) const { return c_regex::is_match(text); }

bool c_pattern::is_match(const std::wstring& text) const {
    std::string utf8;
    return c_regex::is_match(convert(&utf8, text));
}

bool has_time_and_zone(const std::string& text) { return has_time_and_zone(text.data(), text.size()); }
bool has_time_and_zone(const char* text, std::size_t size) {
    // A valid date-time has its "T" and a time behind it, in which no sign stands: a sign six places from the
    // end can only begin the offset.
    if (size < k_offset_size) return false;
    const char sign = text[size - k_offset_size];
    return text[size - 1] == 'Z' || sign == '+' || sign == '-';
}

}  // namespace qbxV2
