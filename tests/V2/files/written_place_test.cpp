#include "V2/written_place.h"

#include <gtest/gtest.h>

#include <ostream>

namespace {

TEST(WrittenPlace, KeepsWhichElementsAreOpenAndWhereAmongTheirKind) {
    const struct {
        const char* text;
        const char* path;
        const char* words;
    } rows[] = {
        {"", "/", "the outermost element lacks something"},
        {"<?xml version=\"1.0\"?>\n", "/", "the outermost element"},
        {"<a>", "/a", "child number 1 of /a"},
        {"<a x='>' y=\"</a>\">", "/a", "child number 1 of /a"},
        {"<a><b/>", "/a", "child number 2 of /a"},
        {"<a><b></b><c/>", "/a", "child number 3 of /a"},
        {"<a><b></b><c/><b>", "/a/b[2]", "child number 1 of /a/b[2]"},
        {"<a>\n\t<b>text</b>\n\t<b\n x='1'>", "/a/b[2]", "child number 1"},
        {"<a><!-- <b> --><c>", "/a/c[1]", "child number 1"},
        {"<a></a>", "/", "the outermost element"},
        {"</a></b>", "/", "the outermost element"},
        {"<><a>", "/a", "child number 1"},
    };
    for (const auto& row : rows) {
        vrl_v2::written_place place;
        std::ostream os(&place);
        os << row.text;
        EXPECT_EQ(place.path(), row.path) << row.text;
        EXPECT_EQ(place.description().rfind(row.words, 0), 0u) << place.description();
        vrl_v2::written_place by_bytes;
        for (const char* c = row.text; *c != '\0'; ++c) by_bytes.sputc(*c);
        EXPECT_EQ(by_bytes.path(), row.path) << row.text;
    }
}

}  // namespace
