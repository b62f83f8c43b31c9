#include "reading_paths.h"

#include <gtest/gtest.h>

#include "runtime/xml_reader.h"

// Every input must give the same events, values, reports and line numbers, whether it is read byte by byte or
// in runs.

namespace {

using namespace qbxV2;
using reading_paths::join;
using reading_paths::on_all_paths;
using reading_paths::printable;
using reading_paths::Random;
using reading_paths::RecordingErrors;
using namespace std::string_literals;

const std::vector<std::string>& documents() {
    static const std::vector<std::string> k_documents = {
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n<V:a xmlns:V=\"u\" b='1'>\r\n  <V:c "
        "d=\"x&amp;y\">1.5</V:c>\r\n</V:a>\r\n",
        "<?xml version='1.1' standalone='yes' ?><!-- c --><a>\n\t<b/>\n text <![CDATA[<]]]]> more\n</a>",
        "<!DOCTYPE a [<!ENTITY e 'v\nw'><!ENTITY % p '<!ENTITY f \"&#65;&e;\">'> %p; <!ELEMENT a ANY>]>\n"
        "<a x='&f;'>&e;&#10;&lt;<b>&f;</b></a>",
        "<a\nb\n=\n'1'\r\nc=\"2\"\r>\r\r\n x \n\ty <?pi ?>z<!-- -- --></a\n>",
        "<a t='\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80'>\xC3\xA9 \xE2\x80\xA8 \xC2\x85 \xE2\x82\xAC</a>",
        "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?><a b='\xE9\x85'>\xE9\n\x85</a>",
        "\xEF\xBB\xBF<r xmlns='d' xmlns:xsi='http://www.w3.org/2001/XMLSchema-instance' xsi:nil='1'><x "
        "xmlns=''/></r>",
        "<\0a\0>\0\n\0</\0a\0>\0"s,
        "\xFE\xFF\0<\0a\0>\x20\xAC\xD8\x3D\xDE\0\0<\0/\0a\0>"s,
        "<!DOCTYPE a [<!ENTITY a '&b;'><!ENTITY b '&a;'>]><a c='&a;'>&a;</a>",
        "<a><b><c>1</c><c>2</c><d e='1' f=\"'\"/></b>tail</a>",
    };
    return k_documents;
}

const std::vector<std::string>& fragments() {
    static const std::vector<std::string> k_fragments = {"<",
                                                         ">",
                                                         "/>",
                                                         "</",
                                                         "&",
                                                         "&#",
                                                         ";",
                                                         "'",
                                                         "\"",
                                                         "=",
                                                         "\r",
                                                         "\n",
                                                         "\r\n",
                                                         " ",
                                                         "\t",
                                                         "]]>",
                                                         "<!--",
                                                         "-->",
                                                         "<![CDATA[",
                                                         "<?",
                                                         "?>",
                                                         "&lt;",
                                                         "\xC3\xA9",
                                                         "\xC2\x85",
                                                         "\xE2\x80\xA8",
                                                         "\xE2",
                                                         "\x80",
                                                         "\xED\xA0\x80",
                                                         std::string(1, '\0'),
                                                         "\x0B",
                                                         "\x7F",
                                                         "xmlns:p='u'",
                                                         " xmlns='&#117;'",
                                                         "<!DOCTYPE a [",
                                                         "<!ENTITY e 'x'>",
                                                         "%p;",
                                                         "&e;",
                                                         "]>",
                                                         "<a>",
                                                         "</a>",
                                                         "<b c='d'>",
                                                         "a",
                                                         "-",
                                                         "]"};
    return k_fragments;
}

std::string mutated(Random& random) {
    std::string text = documents()[random.below(documents().size())];
    for (std::size_t n = random.below(4); n > 0; --n) {
        const std::size_t at = random.below(text.size() + 1);
        switch (random.below(4)) {
            case 0:
                text.insert(at, fragments()[random.below(fragments().size())]);
                break;
            case 1:
                text.erase(at, random.below(6));
                break;
            case 2:
                if (at < text.size()) text[at] = static_cast<char>(random.below(256));
                break;
            default: {
                const std::string piece = text.substr(at, random.below(30));
                text.insert(random.below(text.size() + 1), piece);
                break;
            }
        }
    }
    return text;
}

/// Drives a scanner through all of its calls in an order that a seed decides, and writes down what each one
/// gave.
class ScannerWalk {
public:
    ScannerWalk(c_read& source, bool use_runs, unsigned long long seed)
        : m_random(seed), m_errors(&m_log), m_xml(source, m_errors, true) {
        m_xml.use_runs(use_runs);
        m_xml.set_max_entity_expansion(2000);
    }

    std::string run() {
        for (int steps = 0; steps < 40; ++steps) {
            const eqxp_xml_event event = m_xml.get_element_name(&m_scope, &m_name);
            note(join({"event ", std::to_string(event)}), m_name);
            if (event == EQXP_NAME) start_tag();
            if (event == EQXP_END_OF_MESSAGE && m_random.below(3) != 0) break;
            if (m_random.below(40) == 0) m_xml.rewind();
        }
        return m_log;
    }

private:
    void note(const std::string& what, const std::string& text) {
        m_log += join({"\n", what, " '", printable(text), "' line ", std::to_string(m_xml.get_line_num())});
    }
    void note(const char* what, bool result, const std::string& text) {
        note(join({what, result ? " true" : " false"}), text);
    }
    eqbx_whitespace mode() { return static_cast<eqbx_whitespace>(m_random.below(3)); }

    void start_tag() {
        const std::string element = m_name;
        if (m_random.below(8) == 0) {
            const bool found = m_xml.get_named_attribute(&m_scope, k_ns_not_found, "b", &m_value);
            note("named", found, m_value);
        }
        switch (m_random.below(7)) {
            case 0:
                note("skip", m_xml.skip_rest_of_element(element), "");
                return;
            case 1:
                note("any", m_xml.get_any_element(element, &m_value, mode(), false), m_value);
                return;
            case 2:
                note("empty", m_xml.skip_rest_of_empty_element(element), "");
                return;
            default:
                break;
        }
        bool is_empty = false;
        if (m_random.below(3) == 0) {
            note("tag end", m_xml.skip_start_tag(&is_empty), is_empty ? "/" : "");
        } else {
            is_empty = !attributes();
        }
        if (!is_empty) body(element);
    }

    bool attributes() {
        for (int n = 0; n < 10; ++n) {
            const eqxp_xml_event event = m_xml.get_attribute_name(&m_name, m_random.below(20) == 0);
            note(join({"attribute ", std::to_string(event)}), m_name);
            if (event != EQXP_NAME) return event == EQXP_START_TAG_END;
            if (m_random.below(4) == 0) {
                m_xml.skip_attribute_value();
            } else {
                note("value", m_xml.get_attribute_value(&m_value, mode()), m_value);
            }
        }
        return false;
    }

    void body(const std::string& element) {
        switch (m_random.below(5)) {
            case 0:
                note("text", m_xml.get_element_value(&m_value, mode(), m_random.below(5) != 0), m_value);
                note("end", m_xml.is_element_end_tag(element), "");
                break;
            case 1:
                note("nested", m_xml.get_nested_element_value(&m_value, &m_name, mode(), false),
                     join({m_value, "|", m_name}));
                break;
            case 2:
                note("body", m_xml.skip_element_body(element), "");
                break;
            default:
                break;
        }
    }

    Random m_random;
    std::string m_log;
    RecordingErrors m_errors;
    c_xml m_xml;
    c_xml_local m_scope;
    std::string m_name;
    std::string m_value;
};

class MutatedDocuments : public testing::TestWithParam<unsigned> {};

TEST_P(MutatedDocuments, ReadTheSameOnEveryPath) {
    for (unsigned i = 0; i < 250; ++i) {
        const unsigned long long seed = GetParam() * 1000ULL + i;
        Random random(seed);
        on_all_paths(mutated(random), [seed](c_read& source, bool use_runs) {
            return ScannerWalk(source, use_runs, seed).run();
        });
        ASSERT_FALSE(HasFailure()) << "seed " << seed;
    }
}

TEST_P(MutatedDocuments, GiveTheSameValuesOnEveryPathWithAnyPushBack) {
    for (unsigned i = 0; i < 250; ++i) {
        const unsigned long long seed = GetParam() * 1000ULL + i;
        Random random(seed);
        on_all_paths(mutated(random), [seed](c_read& source, bool use_runs) {
            std::string log;
            RecordingErrors errors(&log);
            c_get_with_entities getter(source, errors);
            getter.use_runs(use_runs);
            Random steps(seed);
            int last = 0;
            int pushed_back = 0;
            const auto push_back = [&](int value) {
                if (pushed_back == 3) return;
                getter.unget(value);
                ++pushed_back;
            };
            for (int n = 0; n < 300; ++n) {
                const int before_last = last;
                last = getter.get();
                pushed_back -= pushed_back > 0;
                log += join({std::to_string(last), "@", std::to_string(getter.get_line_num()), " "});
                switch (steps.below(60)) {
                    case 0:
                        push_back(last);
                        break;
                    case 1:
                        push_back(last);
                        push_back(before_last);
                        break;
                    case 2:
                        push_back('x');
                        break;
                    case 3:
                        push_back('\n');
                        break;
                    case 4:
                        if (steps.below(4) == 0) getter.set_encoding("ISO-8859-1");
                        break;
                    case 5:
                        if (steps.below(4) == 0) getter.rewind();
                        break;
                    default:
                        break;
                }
            }
            return log;
        });
        ASSERT_FALSE(HasFailure()) << "seed " << seed;
    }
}

INSTANTIATE_TEST_SUITE_P(Seeds, MutatedDocuments, testing::Range(0U, 16U));

TEST(ReadingPaths, AgreeOnLongTextsThatGrowAndShrinkOnTheWay) {
    const std::string line = "A text that is long and has\tmarks in it\r\n";
    std::string plain;
    while (plain.size() < 70000) plain += line;
    const std::string grown = "&long;";
    const std::string document =
        join({"<!DOCTYPE a [<!ENTITY long '", std::string(5000, 'l'), "'>]><a>", plain, grown, grown,
              "<!-- between -->", plain, "<![CDATA[ <&> ]]>", grown, plain, "&lt;&amp;", plain, "</a>"});
    for (const eqbx_whitespace mode : {EQBX_WS_PRESERVE, EQBX_WS_REPLACE, EQBX_WS_COLLAPSE}) {
        const std::string value = on_all_paths(document, [mode](c_read& source, bool use_runs) {
            std::string log;
            RecordingErrors errors(&log);
            c_xml xml(source, errors, false);
            xml.use_runs(use_runs);
            c_xml_local scope;
            std::string text;
            bool is_empty = false;
            xml.get_element_name(&scope, &text);
            xml.skip_start_tag(&is_empty);
            xml.get_element_value(&text, mode, true);
            return log + text;
        });
        EXPECT_GT(value.size(), 4 * 60000U + 3 * 5000U);
        EXPECT_NE(value.find(" <&> "), std::string::npos);
    }
}

TEST(ReadingPaths, AgreeOnEveryDocumentCutAtEveryByte) {
    for (const std::string& document : documents()) {
        for (std::size_t size = 0; size <= document.size(); ++size) {
            on_all_paths(document.substr(0, size), [size](c_read& source, bool use_runs) {
                return ScannerWalk(source, use_runs, size).run();
            });
        }
    }
}

}  // namespace
