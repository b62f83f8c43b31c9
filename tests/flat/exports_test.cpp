#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <regex>
#include <set>
#include <string>
#include <vector>

#include "tests/driver/model_driver.h"

/// Which functions there are, by the list that is held against the library's symbols.
namespace {

using names = std::set<std::string>;

const names& all_exports() {
    static const names all = [] {
        names found;
        std::ifstream file(VRL_FLAT_GENERATED "/exports.txt");
        for (std::string line; std::getline(file, line);) {
            if (!line.empty() && line[0] != '#') found.insert(line.substr(std::string("CSharp_").size()));
        }
        return found;
    }();
    return all;
}

/// What the first group of `pattern` catches in the names that it matches.
names caught(const std::string& pattern) {
    names found;
    const std::regex form(pattern);
    std::smatch match;
    for (const std::string& name : all_exports()) {
        if (std::regex_match(name, match, form)) found.insert(match[1]);
    }
    return found;
}

TEST(FlatExports, OfAThinElementClassAreItsLifeAndItsDocuments) {
    const names swapped = caught("(.*)_swap");
    const names documented = caught("(.*)_marshal__SWIG_0");
    names without_documents;
    int thin = 0;
    for (const vrl_driver::class_description& c : vrl_driver::classes()) {
        const std::string name = c.name;
        if (swapped.count(name) != 0) continue;
        ++thin;
        names expected = {"new_" + name + "__SWIG_0", "new_" + name + "__SWIG_1", "delete_" + name,
                          name + "Upcast"};
        if (documented.count(name) != 0) {
            expected.insert(
                {name + "_marshal__SWIG_0", name + "_unmarshal__SWIG_0", name + "_unmarshal__SWIG_1"});
        } else {
            without_documents.insert(name);
        }
        EXPECT_EQ(caught("((new_|delete_)?" + name + "(_.*|Upcast)?)"), expected) << name;
    }
    EXPECT_EQ(thin, 63);
    EXPECT_EQ(without_documents, (names{"ColorSpace", "ColorSpaceSpecification", "Sample", "Substrate"}));
}

TEST(FlatExports, TellTheStateOfChoicesAndGroups) {
    EXPECT_EQ(caught("(.*)_getchosen"),
              (names{"AxisValueChoice", "CustomAttributeType_ValueChoice", "GeometryChoiceType",
                     "IlluminationOptionsType", "ProfileChoice", "ProfileType_Parameters_ValueChoice",
                     "ValueChoice", "sg_ColorSpace", "sg_Function", "sg_Sample", "sg_Substrate"}));
}

TEST(FlatExports, TellTheNilFlagUnderTheNameOfTheElement) {
    const names nillable = {"ColorSpaceSpecificationEmissiveGeneric",
                            "ColorSpaceSpecificationEmissiveSpectral",
                            "ColorSpaceSpecificationEmissiveTristimulus",
                            "ColorSpaceSpecificationSpectrumGeneric",
                            "ColorSpaceSpecificationSpectrumSpectral",
                            "ColorSpaceSpecificationSpectrumTristimulus",
                            "Density",
                            "DeviceFilter",
                            "DevicePolarization",
                            "ParentColorSpace",
                            "SDKVersion",
                            "Standard"};
    EXPECT_EQ(caught("(.*)_isnil_\\1"), nillable);
    EXPECT_EQ(caught("(.*)_setnil_\\1"), nillable);
}

TEST(FlatExports, MakeTheMembersOfSevenFamilies) {
    EXPECT_EQ(caught("(.*)_factory"),
              (names{"ColorSpaceSpecificationEmissiveType", "ColorSpaceSpecificationSpectrumType",
                     "ColorSpaceSpecificationType", "ColorSpaceType", "FunctionType", "SampleType",
                     "SubstrateType"}));
}

TEST(FlatExports, ReachTheMembersOfAGroupAndNothingElseOfIt) {
    for (const char* const group : {"sg_ColorSpace", "sg_Function", "sg_Sample", "sg_Substrate"}) {
        const vrl_driver::class_description& c = vrl_driver::find_class(group);
        names expected = {"getchosen", "swap", "reset", "is_occurs_ok"};
        for (const vrl_driver::group_member& member : c.group) {
            expected.insert(std::string("get_") + member.element + "__SWIG_0");
            expected.insert(std::string("assign_") + member.element);
        }
        EXPECT_EQ(caught(std::string(group) + "_(.*)"), expected);
    }
    EXPECT_EQ(all_exports().count("sg_Function_get_Function__SWIG_0"), 1U) << "the head, too";
}

TEST(FlatExports, OfTheWildcardAreThoseOfAListOfTexts) {
    EXPECT_EQ(caught("Revision_(.*_any)"),
              (names{"append_any", "clear_any", "delete_any", "get_any", "insert_any", "size_any"}));
}

TEST(FlatExports, LeaveOutWhatManagedCallersDoNotNeed) {
    const std::vector<std::string> left_out = {
        "(.*_marshal__SWIG_[1-9].*)",             // to writers, streams and strings
        "(.*_unmarshal__SWIG_([2-9]|1[0-9]).*)",  // from readers
        "(.*_get_.*__SWIG_[1-9].*)",              // const overloads
        "(.*_(marshal|unmarshal)_(attributes|body|child_elements).*)",
        "(.*_(init|release|release_choice|is_member|operator.*))",
        "((new_|delete_)?(c_regex|c_read|c_xml_reader|c_xml_writer|c_xml|c_as_).*)",
        "((convert|vtostring|make_qname|float_zero).*)",
        "(.*CZip.*)",
    };
    for (const std::string& pattern : left_out) EXPECT_EQ(caught(pattern), names()) << pattern;
}

TEST(FlatExports, OfTheValueClassesAreTheTabledOnes) {
    const std::map<std::string, names> tabled = {
        {"new_c_any_info", {"__SWIG_0", "__SWIG_1", "__SWIG_2", "__SWIG_3"}},
        {"new_c_big_int", {"__SWIG_0", "__SWIG_1", "__SWIG_2", "__SWIG_4"}},
        {"new_c_binary", {"__SWIG_0", "__SWIG_1", "__SWIG_2"}},
        {"new_c_decimal",
         {"__SWIG_0", "__SWIG_1", "__SWIG_2", "__SWIG_4", "__SWIG_5", "__SWIG_6", "__SWIG_7"}},
        {"new_c_datetime", {"__SWIG_0", "__SWIG_1"}},
        {"new_c_duration", {"__SWIG_0", "__SWIG_1"}},
        {"new_c_datetime_base", {""}},
        {"delete_c_datetime_base", {}},
        {"new_c_pattern", {""}},
        {"new_c_pattern_null", {""}},
        {"new_c_empty", {""}},
        {"c_empty_", {}},
        {"new_XMLDocumentResult", {""}},
        {"XMLDocumentResult_", {"getEqbxError", "getXmlDocument"}},
        {"c_big_int_", {"get", "get_as_float", "get_as_string", "swap"}},
        {"c_binary_", {"append", "equal", "is_valid_base64", "is_valid_hex", "set", "size", "swap"}},
        {"c_decimal_",
         {"get_as_float", "get_as_string", "get_fractional", "get_integral", "get_scaled", "is_valid",
          "set__SWIG_0", "set__SWIG_1", "set_fractional", "set_integral", "set_scaled__SWIG_0",
          "set_scaled__SWIG_1", "swap"}},
        {"c_pattern_", {"is_match__SWIG_0", "null_is_match__SWIG_0"}},
    };
    for (const auto& [start, ends] : tabled) {
        const bool constructor = start.compare(0, 4, "new_") == 0;
        EXPECT_EQ(caught(start + (constructor ? "(|__SWIG_.*)" : "(.*)")), ends) << start;
    }
}

}  // namespace
