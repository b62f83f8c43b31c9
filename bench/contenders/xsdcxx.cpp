// The bindings that CodeSynthesis XSD generates from the project's schema, over Xerces-C++.

// First: it configures the headers of xsd.
#include "peer_vrl.h"

#include <memory>
#include <sstream>
#include <stdexcept>

#include <xercesc/dom/DOM.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/framework/Wrapper4InputSource.hpp>
#include <xercesc/framework/XMLGrammarPoolImpl.hpp>
#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/XMLUni.hpp>
#include <xercesc/validators/common/Grammar.hpp>
#include <xsd/cxx/tree/error-handler.hxx>
#include <xsd/cxx/xml/dom/bits/error-handler-proxy.hxx>

#include "bench/contender.h"

namespace bench {
namespace {

namespace xerces = xercesc;

/// Xerces-C++ is switched on before its first object and stays on for the life of the program.
void switch_xerces_on() {
    static const bool once = [] {
        xerces::XMLPlatformUtils::Initialize();
        return true;
    }();
    static_cast<void>(once);
}

template <class T>
struct releaser {
    void operator()(T* object) const { object->release(); }
};

/// A parser that has read the schema once and validates every document against it.
class schema_parser {
public:
    schema_parser() : m_errors_seen(m_errors) {
        static const XMLCh load_save[] = {xerces::chLatin_L, xerces::chLatin_S, xerces::chNull};
        auto* factory = xerces::DOMImplementationRegistry::getDOMImplementation(load_save);
        m_parser.reset(factory->createLSParser(xerces::DOMImplementationLS::MODE_SYNCHRONOUS, nullptr,
                                               xerces::XMLPlatformUtils::fgMemoryManager, &m_pool));
        xerces::DOMConfiguration* options = m_parser->getDomConfig();
        options->setParameter(xerces::XMLUni::fgDOMComments, false);
        options->setParameter(xerces::XMLUni::fgDOMDatatypeNormalization, true);
        options->setParameter(xerces::XMLUni::fgDOMEntities, false);
        options->setParameter(xerces::XMLUni::fgDOMNamespaces, true);
        options->setParameter(xerces::XMLUni::fgDOMElementContentWhitespace, false);
        options->setParameter(xerces::XMLUni::fgDOMValidate, true);
        options->setParameter(xerces::XMLUni::fgXercesSchema, true);
        options->setParameter(xerces::XMLUni::fgXercesSchemaFullChecking, false);
        options->setParameter(xerces::XMLUni::fgXercesHandleMultipleImports, true);
        options->setParameter(xerces::XMLUni::fgXercesUserAdoptsDOMDocument, true);
        options->setParameter(xerces::XMLUni::fgDOMErrorHandler, &m_errors_seen);
        const bool read = m_parser->loadGrammar(VRL_BENCH_SCHEMA, xerces::Grammar::SchemaGrammarType, true);
        if (read) m_errors.throw_if_failed<xml_schema::parsing>();
        if (!read) throw std::runtime_error("xsdcxx: no schema");
        options->setParameter(xerces::XMLUni::fgXercesUseCachedGrammarInParse, true);
        options->setParameter(xerces::XMLUni::fgXercesLoadSchema, false);
        m_pool.lockPool();
    }

    std::unique_ptr<peer::Vrl> parse(const document& input) {
        xerces::MemBufInputSource bytes(reinterpret_cast<const XMLByte*>(input.bytes.data()),
                                        input.bytes.size(), "document");
        bytes.setCopyBufToStream(false);
        xerces::Wrapper4InputSource source(&bytes, false);
        xml_schema::dom::unique_ptr<xerces::DOMDocument> tree(m_parser->parse(&source));
        m_errors.throw_if_failed<xml_schema::parsing>();
        return peer::Vrl_(std::move(tree), xml_schema::flags::dont_initialize);
    }

private:
    xerces::XMLGrammarPoolImpl m_pool;
    xsd::cxx::tree::error_handler<char> m_errors;
    xsd::cxx::xml::dom::bits::error_handler_proxy<char> m_errors_seen;
    std::unique_ptr<xerces::DOMLSParser, releaser<xerces::DOMLSParser>> m_parser;
};

std::string to_string(const peer::Vrl& whole) {
    xml_schema::namespace_infomap prefixes;
    prefixes["Vrl"].name = "urn:vrl:document/v2";
    std::ostringstream os;
    peer::Vrl_(os, whole, prefixes, "UTF-8", xml_schema::flags::dont_initialize);
    return std::move(os).str();
}

class parse final : public contender {
public:
    void prepare(const document&) override {
        switch_xerces_on();
        m_parser = std::make_unique<schema_parser>();
    }

    void run(const document& input) override { m_whole = m_parser->parse(input); }

    std::size_t finish(const document& input) override {
        if (!m_checked) need_elements(count_elements(to_string(*m_whole)), input);
        m_checked = true;
        m_whole.reset();
        return input.bytes.size();
    }

private:
    std::unique_ptr<schema_parser> m_parser;
    std::unique_ptr<peer::Vrl> m_whole;
    bool m_checked = false;
};

class serialise final : public contender {
public:
    void prepare(const document& input) override {
        switch_xerces_on();
        m_whole = schema_parser().parse(input);
    }

    void run(const document&) override { m_text = to_string(*m_whole); }

    std::size_t finish(const document& input) override {
        need_elements(count_elements(m_text), input);
        const std::size_t size = m_text.size();
        m_text = std::string();
        return size;
    }

private:
    std::unique_ptr<peer::Vrl> m_whole;
    std::string m_text;
};

}  // namespace

std::unique_ptr<contender> xsdcxx_parse() { return std::make_unique<parse>(); }
std::unique_ptr<contender> xsdcxx_serialise() { return std::make_unique<serialise>(); }

}  // namespace bench
