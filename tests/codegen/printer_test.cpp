#include "codegen/printer.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

namespace {

using vrl_codegen::printer;
using vrl_codegen::printer_scope;

struct template_text {
    const char* why;
    const char* text;
    const char* printed;
};

void PrintTo(const template_text& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class PrinterTemplate : public testing::TestWithParam<template_text> {};

TEST_P(PrinterTemplate, FillsItsHoles) {
    printer out;
    out.print(GetParam().text, {{"X", "Cyan"}, {"type", "double"}, {"empty", ""}, {"odd", "$X$"}});
    EXPECT_EQ(out.text(), GetParam().printed);
}

INSTANTIATE_TEST_SUITE_P(
    Holes, PrinterTemplate,
    testing::Values(template_text{"no hole", "int a;\n", "int a;\n"},
                    template_text{"a hole in the middle", "int $X$;\n", "int Cyan;\n"},
                    template_text{"holes at both ends", "$type$ m_$X$\n", "double m_Cyan\n"},
                    template_text{"holes without a gap", "$type$$X$\n", "doubleCyan\n"},
                    template_text{"a hole twice", "$X$ = $X$;\n", "Cyan = Cyan;\n"},
                    template_text{"an empty value", "a$empty$b\n", "ab\n"},
                    template_text{"a dollar sign", "a$$b\n", "a$b\n"},
                    template_text{"a dollar sign beside a hole", "$$$X$$$\n", "$Cyan$\n"},
                    template_text{"a value isn't a template", "$odd$\n", "$X$\n"},
                    template_text{"nothing at all", "", ""}));

class PrinterMistake : public testing::TestWithParam<template_text> {};

TEST_P(PrinterMistake, StopsTheCompiler) {
    printer out;
    try {
        out.print(GetParam().text, {{"X", "Cyan"}});
        FAIL() << "printed: " << out.text();
    } catch (const std::logic_error& mistake) {
        EXPECT_NE(std::string(mistake.what()).find(GetParam().printed), std::string::npos) << mistake.what();
    }
}

INSTANTIATE_TEST_SUITE_P(Holes, PrinterMistake,
                         testing::Values(template_text{"a misspelt hole is named", "$X$ $x$", "the hole 'x'"},
                                         template_text{"an open hole is shown", "int $X", "not closed: $X"},
                                         template_text{"a lone dollar sign is an open hole", "$X$ costs 1$",
                                                       "not closed: $"}));

TEST(PrinterScope, FillsHolesAsLongAsItLives) {
    printer out;
    {
        const printer_scope scope(out, {{"C", "Color"}});
        out.print("$C$\n");
    }
    EXPECT_THROW(out.print("$C$\n"), std::logic_error);
    EXPECT_EQ(out.text(), "Color\n");
}

TEST(PrinterScope, InnerHidesOuterUntilItEnds) {
    printer out;
    const printer_scope outer(out, {{"C", "Color"}, {"X", "Name"}});
    {
        const printer_scope inner(out, {{"X", "Cyan"}});
        out.print("$C$.$X$\n");
    }
    out.print("$C$.$X$\n");
    EXPECT_EQ(out.text(), "Color.Cyan\nColor.Name\n");
}

TEST(PrinterScope, TheCallsOwnHolesHideAllScopes) {
    printer out;
    const printer_scope scope(out, {{"X", "Name"}});
    out.print("$X$\n", {{"X", "Cyan"}});
    EXPECT_EQ(out.text(), "Cyan\n");
}

TEST(Printer, LaysOutWhatItPrinted) {
    printer out;
    out.print("class A {\n");
    out.print("\n");
    out.print("\n");
    out.print("};\n");
    EXPECT_EQ(out.text(), "class A {\n\n};\n");
}

}  // namespace
