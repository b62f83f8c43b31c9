#include "codegen/flat_collector.h"

/// The runtime's side of the flat layer: a table a class, since no schema tells them.
namespace vrl_codegen {
namespace {

constexpr const char k_family[] = "values, free functions and constants";

class value_collector {
public:
    explicit value_collector(const std::string& name, const std::string& scope = "qbxV2::")
        : m_name(name), m_out({{"C", scope + name}, {"N", name}}) {}

    /// `number` is the overload's place among the native constructors; -1 for the only one that is wrapped.
    void constructor(int number, const std::string& parameters, const std::string& body) {
        const std::string suffix = number < 0 ? std::string() : "__SWIG_" + std::to_string(number);
        m_out.add(k_family, "new_$N$" + suffix, "void*", parameters, body);
    }
    void default_and_copy() {
        constructor(0, "void", "make<$C$>()");
        constructor(1, "void* other", "copy<$C$>(other)");
    }
    void destructor() { m_out.add("delete", "delete_$N$", "void", "void* self", "destroy<$C$>(self)"); }
    void call(const std::string& name, const std::string& result, const std::string& more_parameters,
              const std::string& expression) {
        m_out.call(k_family, "$N$_" + name, result, more_parameters, expression);
    }
    /// A byte text that goes in must not be null.
    void call_with_text(const std::string& name, const std::string& result, const std::string& expression) {
        m_out.add(
            k_family, "$N$_" + name, result, "void* self, const char* text",
            "call_with_text<$C$>(self, text, [&]($C$& o) -> decltype(auto) { return " + expression + "; })");
    }
    void swap() {
        m_out.add("swap", "$N$_swap", "void", "void* self, void* other", "swap_values<$C$>(self, other)");
    }
    void check(const std::string& name, const std::string& suffix = std::string()) {
        m_out.add(k_family, "$N$_" + name + suffix, "int32_t", "const char* text",
                  "with_text(text, [&] { return $C$::" + name + "(text); })");
    }
    void from_text(int number) { constructor(number, "const char* text", "make_from_text<$C$>(text)"); }
    void field(const std::string& name, const std::string& type, const std::string& value = "value") {
        call("get_" + name, type, "", "o.get_" + name + "()");
        call("set_" + name, "void", ", " + type + " value", "o.set_" + name + "(" + value + ")");
    }

    flat_group take() { return {m_name, m_out.take()}; }

private:
    std::string m_name;
    flat_collector m_out;
};

flat_group any_info() {
    value_collector c("c_any_info");
    c.constructor(0, "void", "make<$C$>()");
    c.constructor(1, "const char* ns, const char* name, const char* value", "new_any_info(ns, name, value)");
    c.constructor(2, "const char* ns, const char* name", "new_any_info(ns, name, \"\")");
    c.constructor(3, "const char* ns", "new_any_info(ns, \"\", \"\")");
    c.destructor();
    for (const char* field : {"name", "namespace", "value"}) {
        c.call(std::string("get_") + field, "char*", "", std::string("o.get_") + field + "()");
        c.call_with_text(std::string("set_") + field, "void", std::string("o.set_") + field + "(text)");
    }
    return c.take();
}

flat_group big_int() {
    value_collector c("c_big_int");
    c.default_and_copy();
    c.from_text(2);
    c.constructor(4, "int32_t value", "make<$C$>(value)");
    c.destructor();
    c.call("get", "int32_t", ", uint8_t* overflow", "o.get(as_flag(overflow))");
    c.call("get_as_float", "double", "", "o.get_as_float()");
    c.call("get_as_string", "char*", "", "o.get_as_string()");
    c.swap();
    return c.take();
}

flat_group binary() {
    value_collector c("c_binary");
    c.default_and_copy();
    c.constructor(2, "const uint8_t* bytes, uint32_t size", "make<$C$>(bytes, size)");
    c.destructor();
    c.call("append", "void", ", uint8_t value", "o += value");
    c.call("equal", "int32_t", ", const uint8_t* bytes, uint32_t size", "o.equal(bytes, size)");
    c.call("set", "void", ", const uint8_t* bytes, uint32_t size", "o.set(bytes, size)");
    c.call("size", "uint32_t", "", "o.size()");
    c.swap();
    c.check("is_valid_base64");
    c.check("is_valid_hex");
    return c.take();
}

flat_group decimal() {
    value_collector c("c_decimal");
    c.default_and_copy();
    c.from_text(2);
    c.constructor(4, "int32_t value, int32_t scale", "make<$C$>(value, scale)");
    c.constructor(5, "int32_t value", "make<$C$>(value, 0)");
    c.constructor(6, "double value, uint32_t precision", "make<$C$>(value, precision)");
    c.constructor(7, "double value", "make<$C$>(value, 15U)");
    c.destructor();
    c.call("get_as_float", "double", "", "o.get_as_float()");
    c.call("get_as_string", "char*", "", "o.get_as_string()");
    c.call("get_fractional", "uint32_t", ", int32_t digits, uint8_t* overflow",
           "o.get_fractional(digits, as_flag(overflow))");
    c.call("get_integral", "int32_t", ", uint8_t* overflow", "o.get_integral(as_flag(overflow))");
    c.call("get_scaled", "int32_t", ", int32_t scale, uint8_t* overflow",
           "o.get_scaled(scale, as_flag(overflow))");
    c.check("is_valid");
    c.call("set__SWIG_0", "void", ", double value, uint32_t precision", "o.set(value, precision)");
    c.call("set__SWIG_1", "void", ", double value", "o.set(value, 15)");
    c.call("set_fractional", "void", ", uint32_t value, uint32_t digits", "o.set_fractional(value, digits)");
    c.call("set_integral", "void", ", int32_t value", "o.set_integral(value)");
    c.call("set_scaled__SWIG_0", "void", ", int32_t value, int32_t scale", "o.set_scaled(value, scale)");
    c.call("set_scaled__SWIG_1", "void", ", int32_t value", "o.set_scaled(value, 0)");
    c.swap();
    return c.take();
}

flat_group date(const std::string& name, const std::vector<std::string>& fields) {
    value_collector c(name);
    c.constructor(0, "void", "make<$C$>()");
    c.from_text(1);
    c.destructor();
    c.call("get_as_string", "char*", "", "o.get_as_string()");
    c.check("is_valid");
    c.field("is_utc", "int32_t", "value != 0");
    c.field("total_offset_mins", "int32_t");
    // Two names of one call.
    for (const char* call : {"set_offset", "set_offset_mins"}) {
        c.call(call, "void", ", int32_t hours, uint32_t mins", "o.set_offset(hours, mins)");
    }
    for (const std::string& field : fields) {
        c.field(field, field == "year" ? "int32_t" : field == "secs" ? "float" : "uint32_t");
    }
    return c.take();
}

flat_group duration() {
    value_collector c("c_duration");
    c.constructor(0, "void", "make<$C$>()");
    c.from_text(1);
    c.destructor();
    c.call("get_as_string", "char*", "", "o.get_as_string()");
    c.check("is_valid", "__SWIG_0");
    c.call("normalize", "void", "", "o.normalize()");
    c.field("is_neg", "int32_t", "value != 0");
    for (const char* field : {"years", "months", "days", "hours", "mins"}) c.field(field, "uint32_t");
    c.field("secs", "float");
    return c.take();
}

flat_group datetime_base() {
    value_collector c("c_datetime_base");
    c.constructor(-1, "void", "make<$C$>()");
    return c.take();
}

flat_group pattern(const std::string& name, const std::string& parameters, const std::string& constructed) {
    value_collector c(name);
    c.constructor(-1, parameters, constructed);
    c.destructor();
    c.call_with_text("is_match__SWIG_0", "int32_t", "o.is_match(std::string(text))");
    return c.take();
}

flat_group empty() {
    value_collector c("c_empty");
    c.constructor(-1, "void", "make<$C$>()");
    c.destructor();
    return c.take();
}

flat_group document_result() {
    value_collector c("XMLDocumentResult", "vrl_v2::");
    c.constructor(-1, "const char16_t* document, int32_t error", "new_document_result(document, error)");
    c.destructor();
    c.call("getXmlDocument", "char16_t*", "", "o.getXmlDocument()");
    c.call("getEqbxError", "int32_t", "", "o.getEqbxError()");
    return c.take();
}

flat_group free_functions() {
    flat_collector out({});
    for (const char* name : {"fraction_digits", "total_digits", "length", "is_valid_bool", "is_valid_float",
                             "is_valid_integer"}) {
        const std::string result = std::string(name) == "length" ? "uint32_t" : "int32_t";
        out.add(k_family, name, result, "const char* text",
                "with_text(text, [&] { return qbxV2::$name$(text); })", {{"name", name}});
    }
    for (const char* name : {"is_min_length_ok", "is_max_length_ok"}) {
        out.add(k_family, name, "int32_t", "const char* text, uint32_t length",
                "with_text(text, [&] { return qbxV2::$name$(text, length); })", {{"name", name}});
    }
    out.add(k_family, "get_error_description", "const char*", "int32_t code",
            "qbxV2::get_error_description(static_cast<qbxV2::eqbx_error>(code))");
    out.add(k_family, "stringncompare", "int32_t",
            "const char* text, const char* other, uint32_t pos, uint32_t count",
            "with_text(text, [&] { return compare_part(text, other, pos, count); })");
    for (const char* name : {"isalnum", "isalpha", "isdigit", "isprint", "isspace", "isxdigit"}) {
        out.add(k_family, std::string("x") + name, "int32_t", "int32_t c", "classify(c, std::$name$)",
                {{"name", name}});
    }
    return {"free functions", out.take()};
}

flat_group constants() {
    // The build settings of the runtime, as callers can ask for them.
    static const std::pair<const char*, const char*> settings[] = {
        {"QBXNULL", "0"},
        {"QBX_ATOFLOAT_MODE_DEFAULT", "0"},
        {"QBX_ATOFLOAT_MODE_USE_FACET", "1"},
        {"QBX_ATOFLOAT_MODE_IOSTREAM", "2"},
        {"QBX_ATOFLOAT_MODE_SIMPLE", "3"},
        {"QBX_ATOFLOAT_MODE", "0"},
        {"QBX_NARROW_UNICODE_STRINGS", "0"},
        {"QBX_USE_EXCEPTIONS", "0"},
        {"QBX_VALIDATE_PATTERNS", "1"},
        {"QBX_WANT_DECIMAL_FLOAT_SET", "1"},
        {"QBX_WANT_DLL", "0"},
        {"QBX_WANT_GEN_IMPORT_DLL", "0"},
        {"QBX_XML_STRICT", "1"},
    };
    flat_collector out({});
    for (const auto& [name, value] : settings) {
        out.add(k_family, std::string(name) + "_get", "int32_t", "void", value);
    }
    return {"constants", out.take()};
}

}  // namespace

std::vector<flat_group> flat_functions_of_values() {
    const std::vector<std::string> day = {"year", "month", "day"};
    const std::vector<std::string> clock = {"hours", "mins", "secs"};
    return {any_info(),
            big_int(),
            binary(),
            decimal(),
            date("c_date", day),
            date("c_datetime", {"year", "month", "day", "hours", "mins", "secs"}),
            date("c_time", clock),
            date("c_gday", {"day"}),
            date("c_gmonth", {"month"}),
            date("c_gmonthday", {"month", "day"}),
            date("c_gyear", {"year"}),
            date("c_gyearmonth", {"year", "month"}),
            duration(),
            datetime_base(),
            pattern("c_pattern", "const char* pattern", "make_from_text<$C$>(pattern)"),
            pattern("c_pattern_null", "const char* pattern", "make_ignoring<$C$>(pattern)"),
            empty(),
            document_result(),
            free_functions(),
            constants()};
}

}  // namespace vrl_codegen
