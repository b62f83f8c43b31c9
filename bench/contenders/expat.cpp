#include <expat.h>

#include <limits>
#include <memory>
#include <stdexcept>

#include "bench/contender.h"

namespace bench {
namespace {

struct counts {
    std::size_t elements = 0;
    std::size_t attributes = 0;
    std::size_t ends = 0;
    std::size_t text = 0;
};

void XMLCALL on_start(void* seen, const XML_Char*, const XML_Char** attributes) {
    ++static_cast<counts*>(seen)->elements;
    for (; *attributes != nullptr; attributes += 2) ++static_cast<counts*>(seen)->attributes;
}

void XMLCALL on_end(void* seen, const XML_Char*) { ++static_cast<counts*>(seen)->ends; }

void XMLCALL on_text(void* seen, const XML_Char*, int size) {
    static_cast<counts*>(seen)->text += static_cast<std::size_t>(size);
}

/// Events counted and nothing kept: what reading XML costs before anything is done with it.
class parse final : public contender {
public:
    void run(const document& input) override {
        if (input.bytes.size() > std::numeric_limits<int>::max()) throw std::length_error(input.name);
        m_seen = {};
        const std::unique_ptr<XML_ParserStruct, decltype(&XML_ParserFree)> parser(XML_ParserCreate(nullptr),
                                                                                  XML_ParserFree);
        XML_SetUserData(parser.get(), &m_seen);
        XML_SetElementHandler(parser.get(), on_start, on_end);
        XML_SetCharacterDataHandler(parser.get(), on_text);
        if (XML_Parse(parser.get(), input.bytes.data(), static_cast<int>(input.bytes.size()), 1) !=
            XML_STATUS_OK) {
            throw std::runtime_error(XML_ErrorString(XML_GetErrorCode(parser.get())));
        }
    }

    std::size_t finish(const document& input) override {
        need_elements(m_seen.elements, input);
        need_elements(m_seen.ends, input);
        return input.bytes.size();
    }

private:
    counts m_seen;
};

}  // namespace

std::unique_ptr<contender> expat_parse() { return std::make_unique<parse>(); }

}  // namespace bench
