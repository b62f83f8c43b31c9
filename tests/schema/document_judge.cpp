#include "tests/schema/document_judge.h"

#include <libxml/parser.h>
#include <libxml/xmlschemas.h>

#include <cstdarg>
#include <cstdio>
#include <memory>

namespace schema_tests {
namespace {

struct release {
    void operator()(xmlDoc* p) const { xmlFreeDoc(p); }
    void operator()(xmlSchema* p) const { xmlSchemaFree(p); }
    void operator()(xmlSchemaParserCtxt* p) const { xmlSchemaFreeParserCtxt(p); }
    void operator()(xmlSchemaValidCtxt* p) const { xmlSchemaFreeValidCtxt(p); }
};
template <class T>
using owned = std::unique_ptr<T, release>;

// libxml2 hands over a format and its arguments, in pieces.
void collect(void* context, const char* format, ...) {
    char piece[2000];
    va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(piece, sizeof piece, format, arguments);
    va_end(arguments);
    *static_cast<std::string*>(context) += piece;
}

owned<xmlSchema> compile(const std::string& name, std::string* said) {
    const owned<xmlSchemaParserCtxt> context(xmlSchemaNewParserCtxt(schema_file(name).c_str()));
    xmlSchemaSetParserErrors(context.get(), &collect, &collect, said);
    owned<xmlSchema> schema(xmlSchemaParse(context.get()));
    if (schema == nullptr && said->empty()) *said = name + " did not compile";
    return schema;
}

}  // namespace

std::string schema_file(const std::string& name) { return std::string(VRL_SCHEMA) + "/" + name; }

std::string complaints_about_schema(const std::string& name) {
    std::string said;
    compile(name, &said);
    return said;
}

std::string complaints(const std::string& document) {
    static std::string said_of_schema;
    static const owned<xmlSchema> schema = compile("vrl.xsd", &said_of_schema);
    if (schema == nullptr) return said_of_schema;

    const owned<xmlDoc> parsed(xmlReadMemory(document.data(), static_cast<int>(document.size()), "trial.vrl",
                                             nullptr, XML_PARSE_NOERROR | XML_PARSE_NOWARNING));
    if (parsed == nullptr) return "not well-formed: " + document;
    const owned<xmlSchemaValidCtxt> context(xmlSchemaNewValidCtxt(schema.get()));
    std::string said;
    xmlSchemaSetValidErrors(context.get(), &collect, &collect, &said);
    const int result = xmlSchemaValidateDoc(context.get(), parsed.get());
    if (result != 0 && said.empty()) said = "invalid, code " + std::to_string(result);
    return said;
}

}  // namespace schema_tests
