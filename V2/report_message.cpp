#include "V2/report_message.h"

#include <cstring>

#include "V2/format.h"

namespace vrl_v2 {
namespace {

struct row {
    qbxV2::eqbx_error code;
    /// {item}, {value}, {found} and {name} (of the current event) are filled in.
    const char* text;
};

constexpr row k_rows[] = {
    {qbxV2::EQBX_ATTRIBUTE_ALREADY_READ, "the attribute {item} is there twice"},
    {qbxV2::EQBX_ATTRIBUTE_VALUE_UNREADABLE, "the attribute {item} holds a reference to nothing"},
    {qbxV2::EQBX_BAD_END_OF_ELEMENT, "{item} was expected to end, but found {found}"},
    {qbxV2::EQBX_BAD_CHOICE, "nothing was chosen for {item}"},
    {qbxV2::EQBX_ELEMENT_NOT_FOUND, "the document does not begin with Vrl:Vrl, but with {item}"},
    {qbxV2::EQBX_LENGTH_TOO_LONG, "the text of {item} is too long: \"{value}\""},
    {qbxV2::EQBX_LENGTH_TOO_SHORT, "the text of {item} is too short: \"{value}\""},
    {qbxV2::EQBX_MANDATORY_ELEMENT_MISSING, "expected {item}, but found {found}"},
    {qbxV2::EQBX_NO_PATTERN_MATCHED, "\"{value}\" does not have the form of {item}"},
    {qbxV2::EQBX_REQUIRED_ATTRIBUTE_MISSING, "the attribute {item} is missing"},
    {qbxV2::EQBX_UNKNOWN_ELEMENT, "{item} is not known here"},
    {qbxV2::EQBX_UNEXPECTED_EMPTY_ELEMENT, "{item} must not be empty"},
    {qbxV2::EQBX_UNEXPECTED_END, "the document ends within {item}"},
    {qbxV2::EQBX_VALUE_BAD_FORMAT, "\"{value}\" is no value of {item}"},
    {qbxV2::EQBX_VALUE_TOO_LARGE, "\"{value}\" is above the largest value of {item}"},
    {qbxV2::EQBX_VALUE_TOO_SMALL, "\"{value}\" is below the smallest value of {item}"},
    {qbxV2::EQBX_VALUE_NOT_ENUMERATED, "\"{value}\" is none of the values that {item} can have"},
    {qbxV2::EQBX_UNEXPECTED_ATTRIBUTE, "{item} must not have the attribute {name}"},
    {qbxV2::EQBX_UNKNOWN_XSI_TYPE, "{item} does not tell a type that is known here"},
};

constexpr std::size_t k_shown_of_a_value = 60;

/// Not in the middle of a character.
std::string shortened(const std::string& text) {
    if (text.size() <= k_shown_of_a_value) return text;
    std::size_t end = k_shown_of_a_value;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80) --end;
    return text.substr(0, end) + "...";
}

std::string found(const qbxV2::c_xml_reader& reader) {
    const int event = reader.get_current_event();
    if (event == qbxV2::EQXP_END_TAG) return "the end of the element around it";
    if (event == qbxV2::EQXP_END_OF_MESSAGE) return "the end of the document";
    if (event == qbxV2::EQXP_TEXT) return "text";
    if (reader.is_current_event_tokenisable()) return reader.get_full_name();
    return "something else";
}

void fill(std::string& text, const char* hole, const std::string& with) {
    const std::size_t at = text.find(hole);
    if (at != std::string::npos) text.replace(at, std::strlen(hole), with);
}

/// The first ones alone when there are very many.
std::string path_of(const qbxV2::c_string_stack& open_elements) {
    constexpr std::size_t k_longest = 300;
    std::string path;
    for (std::size_t at = 0; at < open_elements.get_stack_size();) {
        const char* const name = open_elements.at(at);
        const std::size_t length = std::strlen(name);
        if (path.size() + length > k_longest) return path + "/...";
        if (!path.empty()) path += '/';
        path += name;
        at += length + 1;
    }
    return path;
}

/// What the scanner had met when a value could not be read, or a tag.
std::string cause(const qbxV2::c_xml_reader& reader, qbxV2::eqbx_error code) {
    qbxV2::eqbx_error_type type = qbxV2::EQBX_ET_NONE;
    qbxV2::eqbx_error noted = qbxV2::EQBX_NO_ERROR;
    int line = 0;
    if (!reader.get_error_info(&type, &noted, &line) || noted == code) return {};
    return std::string(" (") + qbxV2::get_error_description(noted) + ")";
}

}  // namespace

std::string report_message(const qbxV2::c_xml_reader& reader, qbxV2::c_string_stack& open_elements,
                           const std::string& value, qbxV2::eqbx_error code, const std::string& item) {
    std::string text;
    for (const row& entry : k_rows) {
        if (entry.code == code) text = entry.text;
    }
    if (code == qbxV2::EQBX_MANDATORY_ELEMENT_MISSING && item == found(reader)) {
        text = "{item} does not stand where it should";
    } else if (code == qbxV2::EQBX_ELEMENT_VALUE_UNREADABLE && cause(reader, code).empty()) {
        text = "the value of {item} holds a reference to nothing";
    } else if (code == qbxV2::EQBX_UNEXPECTED_END && item.empty()) {
        text = "there is no element in the document";
    } else if (text.empty()) {
        text = qbxV2::get_error_description(code) + cause(reader, code);
        if (!item.empty()) text += ": {item}";
    }
    fill(text, "{value}", shortened(value));
    fill(text, "{found}", found(reader));
    fill(text, "{name}", reader.get_full_name());
    fill(text, "{item}", item.empty() ? "an element" : shortened(item));
    const std::string path = path_of(open_elements);
    return path.empty() ? text : text + ", in " + path;
}

}  // namespace vrl_v2
