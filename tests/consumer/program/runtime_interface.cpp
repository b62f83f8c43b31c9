#include <runtime/values.h>
#include <runtime/xml_reader.h>
#include <runtime/xml_writer.h>

#include <ostream>
#include <string>
#include <type_traits>

/// Holds the runtime to its published signatures. A change that leaves calls compiling can still break a
/// caller who overrides an operation or takes its address, so each is compared with its exact type here.
namespace {

using namespace qbxV2;
using std::string;
using std::wstring;

template <class Signature>
constexpr bool is(Signature) {
    return true;
}

// What a caller may override.

class caller_errors : public c_error {
public:
    void report_error(eqbx_error_type, eqbx_error, const char*, int, const char*) override {}
};

class caller_source : public c_read {
public:
    bool is_open() const override { return true; }
    int read() override { return -1; }
    const char* get_source_id() override { return "source"; }
    void rewind() override {}
};

class caller_name_reader : public c_entity_name_reader {
public:
    caller_name_reader() : c_entity_name_reader(false) {}
    int get() override { return -1; }
    void unget(int) override {}
};

template <class Base>
class caller_handler : public Base {
public:
    using Base::Base;
    eqbx_error user_handle_error(eqbx_error, const string&, const char*, int) override {
        return EQBX_NO_ERROR;
    }
    eqbx_error user_handle_error(eqbx_error code) override { return code; }
    string& get_error_message(string* message) const override { return *message; }
};

class caller_writer : public caller_handler<c_xml_writer> {
public:
    using caller_handler::caller_handler;
    const char* endl() override { return "\r\n"; }
    void nest() override {}
};

static_assert(!std::is_abstract_v<caller_errors> && !std::is_abstract_v<caller_source> &&
              !std::is_abstract_v<caller_name_reader> && !std::is_abstract_v<caller_writer> &&
              !std::is_abstract_v<caller_handler<c_xml_reader>> &&
              !std::is_abstract_v<caller_handler<c_xml_reader_file>> &&
              !std::is_abstract_v<caller_handler<c_xml_reader_memory>>);

// Decoding.
static_assert(is<bool (*)(const char*)>(&is_valid_utf8_char_sequence));
static_assert(is<char* (*)(int, char*)>(&unicode_char_to_utf8));
static_assert(is<bool (*)(char*, int*)>(&utf8_to_unicode_char));
static_assert(is<void (*)(void*, void*, std::size_t)>(&qbxV2::bswap));
static_assert(is<bool (c_get_as_utf8::*)(const char*)>(&c_get_as_utf8::set_encoding));
static_assert(is<c_error& (c_get_as_utf8::*)() const>(&c_get_as_utf8::get_error_handler));

// Scanning.
static_assert(is<eqxp_xml_event (c_xml::*)(c_xml_local*, string*)>(&c_xml::get_element_name));
static_assert(is<eqxp_xml_event (c_xml::*)(string*, bool)>(&c_xml::get_attribute_name));
static_assert(is<bool (c_xml::*)(string*, eqbx_whitespace)>(&c_xml::get_attribute_value));
static_assert(is<bool (c_xml::*)(string*, eqbx_whitespace, bool)>(&c_xml::get_element_value));
static_assert(is<bool (c_xml::*)(const string&)>(&c_xml::skip_element_body));
static_assert(is<bool (c_xml::*)(const string&, string*, eqbx_whitespace, bool)>(&c_xml::get_any_element));
static_assert(is<bool (c_xml::*)(const c_xml_local*, int*, string*)>(&c_xml::get_xsi_type));
static_assert(is<bool (c_xml::*)(const c_xml_local*, const string&) const>(&c_xml::is_xsi_attribute));
static_assert(is<int (c_xml::*)(const char*)>(&c_xml::add_namespace));
static_assert(is<void (c_xml::*)(const char*, int)>(&c_xml::add_namespace));
static_assert(is<string& (*)(const string&, string*)>(&c_xml::get_local_name));
static_assert(is<void (c_cracked_name::*)(c_xml_local*, const string&)>(&c_cracked_name::set));

// Reading.
using reader = c_xml_reader;
static_assert(is<void (reader::*)(const s_event_map*, eqbx_error*, string*)>(&reader::get_element_event));
static_assert(is<bool (reader::*)(const s_event_map*, eqbx_error*, string*)>(&reader::get_attribute_event));
static_assert(is<void (reader::*)(const s_event_map*, eqxp_attr_elem)>(&reader::tokenise));
static_assert(is<bool (reader::*)(const string&, eqbx_whitespace, string*, eqbx_error*, bool*)>(
    &reader::get_simple_type_value));
static_assert(
    is<bool (reader::*)(const string&, string*, eqbx_error*, bool*)>(&reader::get_element_ur_value));
static_assert(is<string& (reader::*)(const string&, string*) const>(&reader::get_namespace));
static_assert(is<void (reader::*)(const s_ns_map*)>(&reader::set_ns_map));
static_assert(is<eqbx_error (reader::*)(eqbx_error, const string&, const char*, int)>(&reader::handle_error));

// Writing.
using writer = c_xml_writer;
static_assert(writer::include_xml_decl == 1 && writer::include_standalone == 2);
static_assert(is<std::ostream& (writer::*)(bool)>(&writer::operator()));
static_assert(is<void (writer::*)(bool)>(&writer::conditionally_write_ns_attrs));
static_assert(is<const char* (writer::*)(const string&) const>(&writer::get_namespace_prefix));
static_assert(is<eqbx_error (writer::*)(eqbx_error, const string&, const char*, int)>(&writer::handle_error));
static_assert(is<bool (writer::*)(eqbx_error_type*, eqbx_error*, int*)>(&writer::get_error_info));

// Texts and their checks.
static_assert(is<string& (*)(string*, const wstring&)>(&convert));
static_assert(is<wstring& (*)(wstring*, const string&)>(&convert));
static_assert(is<wstring& (*)(wstring&, const string&)>(&vtostring));
static_assert(is<unsigned int (*)(const string&)>(&qbxV2::length));
static_assert(is<bool (*)(const string&, unsigned int)>(&is_max_length_ok));

// Values.
static_assert(is<long (c_big_int::*)(bool*) const>(&c_big_int::get));
static_assert(is<unsigned long (c_decimal::*)(int, bool*) const>(&c_decimal::get_fractional));
static_assert(is<bool (*)(const string&)>(&c_datetime::is_valid));
static_assert(is<bool (*)(const char*)>(&c_duration::is_valid));
static_assert(is<unsigned char* (c_binary::*)(unsigned char*, unsigned int) const>(&c_binary::get));
static_assert(is<bool (c_pattern::*)(const wstring&) const>(&c_pattern::is_match));
// A value is made of its text wherever it is asked for.
static_assert(std::is_convertible_v<const char*, c_datetime> && std::is_convertible_v<string, c_duration> &&
              std::is_convertible_v<int, c_big_int> && std::is_convertible_v<const char*, c_decimal>);

}  // namespace
