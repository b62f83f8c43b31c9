#pragma once

#include <string>

#include "platform/api.h"
#include "runtime/character_class.h"
#include "runtime/entities.h"
#include "runtime/white_space.h"

namespace qbxV2 {

/// A getter that knows the small constructs of XML: white space, quoted values, comments, processing
/// instructions, the XML declaration, character references, and how character data is stored.
class VRL_API c_get_for_xml : public c_get_with_entities {
public:
    /// `ws_for_char_refs` tells whether white-space handling also applies to characters written as
    /// references.
    c_get_for_xml(c_read& source, c_error& errors, bool ws_for_char_refs)
        : c_get_with_entities(source, errors), m_ws_for_char_refs(ws_for_char_refs) {}

    /// The next value that is no white space; -1 at the end.
    int get_non_ws() {
        int c;
        return get_plain(&c) && !detail::is_space(c) ? c : skip_ws_and_get();
    }
    /// Reads and compares. On a mismatch false, with the character at fault consumed.
    bool read_specified_string_from_input(const char* s);
    /// Skips white space and reads a value in single or double quotes. False without a quote, or at the end
    /// of input.
    bool get_simple_quoted_value(std::string* value);
    /// From behind "<!--" to the end of the comment. More than two "-" before its ">" are a warning,
    /// EQBX_BAD_COMMENT; a "--" inside passes. False at the end of input.
    bool skip_comment();
    /// From anywhere in a processing instruction to behind its "?>". False at the end of input.
    bool skip_PI();
    /// From within a start tag to behind its ">". `*is_empty` tells whether it ended in "/>"; it may be null.
    /// Anything but white space between "/" and ">" is a report, EQBX_BAD_END_TAG, and false. False at the
    /// end of input, but true when it comes behind the "/".
    bool move_to_start_tag_end(bool* is_empty);
    /// The body of a CDATA section from behind "<![": appends its text. False when "CDATA[" does not follow.
    /// The end of input ends the section.
    bool get_cdata(std::string* text);

    /// Appends a character by the white-space mode in force.
    void add_char_wsp(std::string* s, int c, bool from_char_ref);
    /// The same for [from, to), none of it from references.
    void add_chars_wsp(std::string* s, const char* from, const char* to);
    /// Appends what can be had at once of character data up to "<", by the mode in force. It may append
    /// nothing; the rest comes through `get`. "&" stops it too, unless it is to be plain text.
    void add_text_run(std::string* s, bool stop_at_ampersand);
    /// Reads a character reference from behind its "#". Up to U+100000. False for a bad one.
    bool insert_character_entity(c_entity_name_reader& reader, std::string* out);

    void set_ws_mode(eqbx_whitespace mode) {
        m_ws_mode = mode;
        m_pending_space = false;
    }
    void reset_ws_mode() { m_pending_space = false; }

    /// The rest of an XML declaration from behind "<?xml". False after a report of EQBX_BAD_XML_DECL,
    /// EQBX_BAD_XML_VERSION or EQBX_ENCODING_MISMATCH, EQBX_BAD_CHAR_ENCODING, and for bad syntax without
    /// one.
    bool read_xml_decl();
    /// Back to the start; white space is preserved again.
    void rewind();

    /// Reads a name that can be had at once; what stands behind it is left in the input. False, with nothing
    /// read, when it has to be read character by character, or when there is none.
    bool take_name(std::string* name);
    /// Reads an attribute that can be had at once, after optional white space, and appends its name, NUL, the
    /// opening quote, the value and NUL. False, with nothing read, when it has to be read character by
    /// character, when its name could be that of a namespace declaration, or when there is none.
    bool take_attribute(std::string* bytes);
    /// Whether a tag stands next, as far as that can be seen without reading.
    bool is_at_tag();
    /// Reads the rest of a name, and the value behind it, which is the result.
    int get_rest_of_name(std::string* name);
    /// Reads up to `quote` and consumes it. False at the end of input.
    bool get_up_to_quote(int quote, std::string* value);
    /// Reads `</name`, white space and `>`, after optional white space. False, with input consumed, for
    /// anything else.
    bool read_end_tag(const std::string& name);
    /// The same where it can be had at once and has no white space. False, with nothing read, otherwise.
    bool take_end_tag(const std::string& name);

private:
    int skip_ws_and_get();

    enum class pseudo_value { none, read, bad };

    bool read_version();
    bool refuse_version();
    bool read_encoding(int* c);
    bool read_standalone(int* c);
    pseudo_value read_pseudo_value(int* c, const char* rest_of_name, std::string* value);
    void add_run(std::string* s, unsigned char stop);
    void make_room_up_to_tag(std::string* s, const s_byte_run& run);
    void collapse(std::string* s, const char* from, const char* to);

    eqbx_whitespace m_ws_mode = EQBX_WS_PRESERVE;
    bool m_pending_space = false;
    bool m_ws_for_char_refs;
};

}  // namespace qbxV2
