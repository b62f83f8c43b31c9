#include "scan_trace.h"

#include "reading_paths.h"
#include "runtime/scanner.h"

namespace scan_trace {
namespace {

using namespace qbxV2;
using reading_paths::join;
using reading_paths::printable;

/// A scanner with a record of its reports.
struct Scanner {
    Scanner(c_read& source, bool use_runs) : errors(&log), xml(source, errors, true) {
        xml.use_runs(use_runs);
    }

    /// Appends what was found, behind the reports that came while it was read.
    void note(const std::string& text) { log += join({log.empty() ? "" : " ", text}); }

    bool attributes() {
        std::string name;
        std::string text;
        std::string all;
        for (;;) {
            const eqxp_xml_event event = xml.get_attribute_name(&name, false);
            if (event == EQXP_START_TAG_END || event == EQXP_END_TAG) {
                log += join({all, event == EQXP_END_TAG ? "/>" : ">"});
                return true;
            }
            const bool read = event == EQXP_NAME && xml.get_attribute_value(&text, EQBX_WS_PRESERVE);
            if (event == EQXP_NAME) all += join({" ", printable(name), "=[", printable(text), "]"});
            if (!read) {
                log += join({all, event == EQXP_NAME ? " FAIL" : " ERROR"});
                return false;
            }
        }
    }

    std::string log;
    reading_paths::RecordingErrors errors;
    c_xml xml;
    c_xml_local scope;
};

std::string all_events(c_read& source, bool use_runs) {
    Scanner s(source, use_runs);
    std::string name;
    for (;;) {
        switch (s.xml.get_element_name(&s.scope, &name)) {
            case EQXP_NAME:
                s.note(join({"<", printable(name)}));
                if (!s.attributes()) return s.log;
                break;
            case EQXP_END_TAG:
                s.note(join({"</", printable(name), ">"}));
                break;
            case EQXP_TEXT:
                s.note(join({"'", printable(name), "'"}));
                break;
            case EQXP_END_OF_MESSAGE:
                s.note("EOF");
                return s.log;
            default:
                s.note("ERROR");
                return s.log;
        }
    }
}

}  // namespace

std::string events(const std::string& document) { return reading_paths::on_all_paths(document, all_events); }

std::string value(const std::string& document, eqbx_whitespace mode, bool expand_entities) {
    return reading_paths::on_all_paths(document, [=](c_read& source, bool use_runs) {
        Scanner s(source, use_runs);
        std::string name;
        std::string text;
        bool is_empty = false;
        if (s.xml.get_element_name(&s.scope, &name) != EQXP_NAME) return s.log + "NO ELEMENT";
        if (!s.xml.skip_start_tag(&is_empty) || is_empty) return s.log + "NO BODY";
        if (!s.xml.get_element_value(&text, mode, expand_entities)) {
            s.note("FAIL");
            return s.log;
        }
        s.note(join({"'", printable(text), "'"}));
        s.note(s.xml.is_element_end_tag(name) ? "end" : "NO END");
        return s.log;
    });
}

std::string attribute(const std::string& document, eqbx_whitespace mode) {
    return reading_paths::on_all_paths(document, [=](c_read& source, bool use_runs) {
        Scanner s(source, use_runs);
        std::string name;
        std::string text;
        if (s.xml.get_element_name(&s.scope, &name) != EQXP_NAME) return s.log + "NO ELEMENT";
        if (s.xml.get_attribute_name(&name, false) != EQXP_NAME) return s.log + "NO ATTRIBUTE";
        const bool read = s.xml.get_attribute_value(&text, mode);
        s.note(join({"[", printable(text), "]", read ? "" : " FAIL"}));
        return s.log;
    });
}

}  // namespace scan_trace
