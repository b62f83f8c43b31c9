#include <libxml/parser.h>
#include <libxml/xmlreader.h>
#include <libxml/xmlschemas.h>

#include <memory>
#include <stdexcept>

#include "bench/contender.h"

namespace bench {
namespace {

// Texts of any length, which the other contenders take too.
constexpr int k_options = XML_PARSE_HUGE | XML_PARSE_NONET;

template <class T, void (*release)(T*)>
struct releaser {
    void operator()(T* object) const { release(object); }
};
template <class T, void (*release)(T*)>
using owned = std::unique_ptr<T, releaser<T, release>>;

using owned_document = owned<xmlDoc, xmlFreeDoc>;
using owned_schema = owned<xmlSchema, xmlSchemaFree>;

void need(bool well, const char* what) {
    if (!well) throw std::runtime_error(std::string("libxml2: ") + what);
}

int size_of(const document& input) { return static_cast<int>(input.bytes.size()); }

/// A node at a time, nothing kept.
class pull final : public contender {
public:
    void run(const document& input) override {
        m_elements = 0;
        const owned<xmlTextReader, xmlFreeTextReader> reader(
            xmlReaderForMemory(input.bytes.data(), size_of(input), nullptr, nullptr, k_options));
        need(reader != nullptr, "no reader");
        int more = xmlTextReaderRead(reader.get());
        for (; more == 1; more = xmlTextReaderRead(reader.get())) {
            if (xmlTextReaderNodeType(reader.get()) == XML_READER_TYPE_ELEMENT) ++m_elements;
        }
        need(more == 0, "the reader stopped");
    }

    std::size_t finish(const document& input) override {
        need_elements(m_elements, input);
        return input.bytes.size();
    }

private:
    std::size_t m_elements = 0;
};

/// The whole tree, judged by the schema: untyped, but checked as the model is.
class validate final : public contender {
public:
    void prepare(const document&) override {
        const owned<xmlSchemaParserCtxt, xmlSchemaFreeParserCtxt> parser(
            xmlSchemaNewParserCtxt(VRL_BENCH_SCHEMA));
        m_schema.reset(xmlSchemaParse(parser.get()));
        need(m_schema != nullptr, "no schema");
    }

    void run(const document& input) override {
        m_tree.reset(xmlReadMemory(input.bytes.data(), size_of(input), nullptr, nullptr, k_options));
        need(m_tree != nullptr, "no tree");
        const owned<xmlSchemaValidCtxt, xmlSchemaFreeValidCtxt> judge(xmlSchemaNewValidCtxt(m_schema.get()));
        need(xmlSchemaValidateDoc(judge.get(), m_tree.get()) == 0, "the document is not valid");
    }

    std::size_t finish(const document& input) override {
        need_elements(count(xmlDocGetRootElement(m_tree.get())), input);
        m_tree.reset();
        return input.bytes.size();
    }

private:
    static std::size_t count(xmlNode* element) {
        std::size_t elements = 1;
        for (xmlNode* child = xmlFirstElementChild(element); child != nullptr;
             child = xmlNextElementSibling(child)) {
            elements += count(child);
        }
        return elements;
    }

    owned_schema m_schema;
    owned_document m_tree;
};

}  // namespace

std::unique_ptr<contender> libxml2_reader() { return std::make_unique<pull>(); }
std::unique_ptr<contender> libxml2_validated_dom() { return std::make_unique<validate>(); }

}  // namespace bench
