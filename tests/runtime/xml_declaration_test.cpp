#include <gtest/gtest.h>

#include "scan_trace.h"

namespace {

using scan_trace::events;
using namespace std::string_literals;

struct Declaration {
    const char* why;
    std::string text;
    std::string outcome;
};
void PrintTo(const Declaration& d, std::ostream* os) { *os << d.why << ": " << d.text; }

class XmlDeclaration : public testing::TestWithParam<Declaration> {};

TEST_P(XmlDeclaration, IsReadLikeThis) {
    EXPECT_EQ(events(std::string("<?xml").append(GetParam().text).append("<a/>")), GetParam().outcome);
}

constexpr char k_good[] = "<a/> EOF";
constexpr char k_no_version[] = " !1/13@1: Version not present in XML Decl ERROR";
constexpr char k_mismatch[] = " !0/15@1: Mis-match between specfied encoding and byte format ERROR";

INSTANTIATE_TEST_SUITE_P(
    Good, XmlDeclaration,
    testing::Values(Declaration{"version 1.0", " version=\"1.0\"?>", k_good},
                    Declaration{"version 1.1", " version='1.1'?>", k_good},
                    Declaration{"white space", "\r\nversion = '1.0' \n?>", k_good},
                    Declaration{"no white space", "version='1.0'encoding='UTF-8'standalone='yes'?>", k_good},
                    Declaration{"an encoding in small letters", " version='1.0' encoding='utf-8'?>", k_good},
                    Declaration{"ISO-8859-1", " version='1.0' encoding='ISO-8859-1'?>", k_good},
                    Declaration{"US-ASCII", " version='1.0' encoding='us-ascii' ?>", k_good},
                    Declaration{"standalone", " version='1.0' standalone='yes'?>", k_good},
                    Declaration{"any other standalone passes", " version='1.0' standalone='maybe'?>", k_good},
                    Declaration{"both", " version='1.0' encoding='UTF-8' standalone='yes' ?>", k_good}));

INSTANTIATE_TEST_SUITE_P(
    Bad, XmlDeclaration,
    testing::Values(
        Declaration{"another version", " version=\"1.2\"?>",
                    " !1/14@1: XML version 1.2 not understood ERROR"},
        Declaration{"an empty version", " version=''?>", " !1/14@1: XML version  not understood ERROR"},
        Declaration{"no version", " encoding='UTF-8'?>", k_no_version},
        Declaration{"nothing", "?>", k_no_version},
        Declaration{"a misspelled version", " vers='1.0'?>", k_no_version},
        Declaration{"no =", " version '1.0'?>", k_no_version},
        Declaration{"no quote", " version=1.0?>", k_no_version},
        Declaration{"a value without an end", " version='1.0?>", k_no_version},
        Declaration{"not standalone", " version='1.0' standalone='no'?>",
                    " !1/13@1: XML Document is not standalone ERROR"},
        Declaration{"a misspelled encoding", " version='1.0' encodin='UTF-8'?>", "ERROR"},
        Declaration{"no = behind encoding", " version='1.0' encoding 'UTF-8'?>", "ERROR"},
        Declaration{"no quote behind encoding=", " version='1.0' encoding=UTF-8?>", "ERROR"},
        Declaration{"a misspelled standalone", " version='1.0' standalon='yes'?>", "ERROR"},
        Declaration{"no quote behind standalone=", " version='1.0' standalone=yes?>", "ERROR"},
        Declaration{"the wrong order", " version='1.0' standalone='yes' encoding='UTF-8'?>", "ERROR"},
        Declaration{"no ?", " version='1.0'>", "ERROR"}, Declaration{"no >", " version='1.0'? ", "ERROR"},
        Declaration{"an unknown encoding", " version='1.0' encoding='EBCDIC'?>",
                    " !0/6@1: Unknown character encoding specified ERROR"},
        Declaration{"UTF-16 in UTF-8", " version='1.0' encoding='UTF-16'?>", k_mismatch},
        Declaration{"UCS-2 in UTF-8", " version='1.0' encoding='ISO-10646-UCS-2'?>", k_mismatch}));

// Intended: a name without "=" counts as absent.
INSTANTIATE_TEST_SUITE_P(
    Loose, XmlDeclaration,
    testing::Values(Declaration{"encoding without a value", " version='1.0' encoding?>", k_good},
                    Declaration{"encoding without a value before standalone",
                                " version='1.0' encoding standalone='yes'?>", k_good},
                    Declaration{"standalone without a value", " version='1.0' standalone?>", k_good}));

std::string wide(const std::string& ascii) {
    std::string bytes;
    for (const char c : ascii) bytes += {c, '\0'};
    return bytes;
}

TEST(XmlDeclarationEncoding, IsCheckedInUtf16Too) {
    EXPECT_EQ(events(wide("<?xml version='1.0' encoding='utf-16'?><a/>")), k_good);
    EXPECT_EQ(events(wide("<?xml version='1.0' encoding='iso-10646-ucs-2'?><a/>")), k_good);
    EXPECT_EQ(events(wide("<?xml version='1.0' encoding='ISO-8859-1'?><a/>")), k_mismatch);
    EXPECT_EQ(events(wide("<?xml version='1.0' encoding='UTF-8'?><a/>")), k_mismatch);
}

TEST(XmlDeclarationEncoding, HoldsFromTheDeclarationOn) {
    EXPECT_EQ(events("<?xml version='1.0' encoding='ISO-8859-1'?><a b='\xE9'>\xE9\x85</a>"),
              "<a b=[\\xC3\\xA9]> '\\xC3\\xA9\\x0A' </a> EOF");
    EXPECT_EQ(events("<?xml version='1.0' encoding='UTF-8'?><a b='\xC3\xA9'/>"), "<a b=[\\xC3\\xA9]/> EOF");
}

}  // namespace
