#include <V2/Vrl.h>
#include <gtest/gtest.h>
#include <runtime/values.h>

#include <map>
#include <ostream>
#include <string>

#include "examples/colorimetry.h"
#include "examples/make_documents/spectra.h"
#include "tests/examples/rendering_index.h"

/// What was put into the example documents gives figures that were published elsewhere.
namespace vrl_test {
namespace {

using examples::spectrum;
using group = vrl_v2::sg_ColorSpace;

vrl_v2::Vrl load(const char* name) {
    std::wstring path;
    qbxV2::convert(&path, std::string(VRL_DOCUMENTS "/") + name);
    vrl_v2::Vrl document;
    EXPECT_EQ(document.loadFile(path), qbxV2::EQBX_NO_ERROR);
    return document;
}

/// The colors of a document's only palette, in order.
std::vector<vrl_v2::ColorType> colors_of(const char* name) {
    const vrl_v2::Vrl document = load(name);
    const vrl_v2::PaletteType& palette = document.get_Palette(0);
    std::vector<vrl_v2::ColorType> colors;
    for (unsigned i = 0; i < palette.size_ColorSet(); ++i) {
        const vrl_v2::ColorSetType& set = palette.get_ColorSet(i);
        for (unsigned k = 0; k < set.size_Color(); ++k) colors.push_back(set.get_Color(k));
    }
    return colors;
}

std::map<std::wstring, vrl_v2::ColorType> colors_by_name(const char* name) {
    std::map<std::wstring, vrl_v2::ColorType> colors;
    for (const vrl_v2::ColorType& color : colors_of(name)) colors[color.get_ColorName()] = color;
    return colors;
}

const group& value_in(const vrl_v2::ColorType& color, group::eqbx_chosen space) {
    for (unsigned i = 0; i < color.size_ColorSpace(); ++i) {
        if (color.get_ColorSpace(i).getchosen() == space) return color.get_ColorSpace(i);
    }
    static const group none;
    ADD_FAILURE() << "no value in space " << space;
    return none;
}

struct chromaticity {
    const wchar_t* source;
    double x, y;
};

// CIE 15:2004, appendix; the blackbodies as in any table of the Planckian locus.
TEST(LightSources, HaveThePublishedChromaticities) {
    const auto sources = colors_by_name("light_sources.vrl");
    for (const chromaticity& published :
         {chromaticity{L"Illuminant A", 0.4476, 0.4074}, chromaticity{L"Illuminant C", 0.3101, 0.3162},
          chromaticity{L"Illuminant D50", 0.3457, 0.3585}, chromaticity{L"D55", 0.3324, 0.3474},
          chromaticity{L"Illuminant D65", 0.3127, 0.3290}, chromaticity{L"D75", 0.2990, 0.3149},
          chromaticity{L"Illuminant E", 0.3333, 0.3333}, chromaticity{L"Illuminant F2", 0.3721, 0.3751},
          chromaticity{L"Illuminant F7", 0.3129, 0.3292}, chromaticity{L"Illuminant F11", 0.3805, 0.3769},
          chromaticity{L"2000 K", 0.5267, 0.4133}, chromaticity{L"4000 K", 0.3805, 0.3767},
          chromaticity{L"10000 K", 0.2806, 0.2883}}) {
        std::string name;
        SCOPED_TRACE(qbxV2::convert(&name, published.source));
        const auto& xyy = value_in(sources.at(published.source), group::chosen_ColorSpaceEmissiveCIExyY)
                              .get_ColorSpaceEmissiveCIExyY();
        EXPECT_NEAR(xyy.get_X(), published.x, 0.00011);
        EXPECT_NEAR(xyy.get_Y(), published.y, 0.00011);
    }
}

// CIE 15:2004, appendix.
TEST(LightSources, HaveTheSpectrumOfD65ThatIsPublished) {
    const auto sources = colors_by_name("light_sources.vrl");
    const auto& d65 = value_in(sources.at(L"Illuminant D65"), group::chosen_ColorSpaceEmissiveSpectral)
                          .get_ColorSpaceEmissiveSpectral();
    ASSERT_EQ(d65.size_EmissiveSpectralPoint(), 81U);
    const std::map<double, double> published = {{380, 49.98},  {400, 82.75}, {450, 117.01}, {500, 109.35},
                                                {560, 100.00}, {600, 90.01}, {700, 71.61},  {780, 63.38}};
    for (const auto& [wavelength, power] : published) {
        const auto& point = d65.get_EmissiveSpectralPoint(static_cast<unsigned>((wavelength - 380) / 5));
        EXPECT_EQ(point.get_Wavelength(), wavelength);
        EXPECT_NEAR(point.get_EmissiveSpectralPointType(), power, 0.0051);
    }
}

spectrum lamp(const vrl_v2::ColorType& source) {
    const auto& points =
        value_in(source, group::chosen_ColorSpaceEmissiveSpectral).get_ColorSpaceEmissiveSpectral();
    spectrum light{examples::k_first, examples::k_step, {}};
    for (unsigned i = 0; i < points.size_EmissiveSpectralPoint(); ++i) {
        light.values.push_back(points.get_EmissiveSpectralPoint(i).get_EmissiveSpectralPointType());
    }
    return light;
}

/// A reflectance at the steps of a lamp's table, between which lines of mercury would else be missed.
spectrum fine_reflectance(const vrl_v2::ColorType& color) {
    const auto& points = value_in(color, group::chosen_ColorSpaceSpectral).get_ColorSpaceSpectral();
    spectrum fine{points.get_ReflectancePoint(0).get_Wavelength(), examples::k_step, {}};
    for (unsigned i = 0; i < points.size_ReflectancePoint(); ++i) {
        const double value = points.get_ReflectancePoint(i).get_ReflectancePointType();
        if (i > 0) fine.values.push_back((fine.values.back() + value) / 2);
        fine.values.push_back(value);
    }
    return fine;
}

// CIE 15:2004, appendix. It takes every figure of the lamps and of the first eight reflectances together
// to come to these.
TEST(ReflectancePalette, GivesTheLampsTheirPublishedRenderingIndex) {
    std::vector<spectrum> test_colors;
    for (const vrl_v2::ColorType& color : colors_of("reflectance_palette.vrl")) {
        test_colors.push_back(fine_reflectance(color));
    }
    ASSERT_EQ(test_colors.size(), 14U);
    const auto sources = colors_by_name("light_sources.vrl");
    EXPECT_NEAR(general_rendering_index(lamp(sources.at(L"Illuminant F2")), test_colors), 64, 0.6);
    EXPECT_NEAR(general_rendering_index(lamp(sources.at(L"Illuminant F7")), test_colors), 90, 0.6);
    EXPECT_NEAR(general_rendering_index(lamp(sources.at(L"Illuminant F11")), test_colors), 83, 0.6);
}

TEST(ReflectancePalette, ReachesFrom400To700NanometersInStepsOf10) {
    for (const vrl_v2::ColorType& color : colors_of("reflectance_palette.vrl")) {
        const auto& points = value_in(color, group::chosen_ColorSpaceSpectral).get_ColorSpaceSpectral();
        ASSERT_EQ(points.size_ReflectancePoint(), 31U);
        for (unsigned i = 0; i < 31; ++i)
            EXPECT_EQ(points.get_ReflectancePoint(i).get_Wavelength(), 400 + 10 * i);
    }
}

// The samples' Munsell value is, by the renotation of 1943, the tenfold of L* within a few units.
TEST(ReflectancePalette, IsAsLightAsItsMunsellNotationsSay) {
    for (const vrl_v2::ColorType& color : colors_of("reflectance_palette.vrl")) {
        const std::wstring& notation =
            value_in(color, group::chosen_ColorSpaceMunsell).get_ColorSpaceMunsell().get_ColorName();
        const double value = notation.at(notation.find(L'/') - 1) - L'0';
        const double l = value_in(color, group::chosen_ColorSpaceCIELab).get_ColorSpaceCIELab().get_L();
        EXPECT_NEAR(l, 10 * value, 3);
    }
}

TEST(CssNamedColors, Are148WithDifferentNames) {
    EXPECT_EQ(colors_of("css_named_colors.vrl").size(), 148U);
    EXPECT_EQ(colors_by_name("css_named_colors.vrl").size(), 148U);
}

struct named_lab {
    const wchar_t* name;
    examples::lab value;
};

// As widely published for the primaries of sRGB under D65.
TEST(CssNamedColors, HaveThePublishedLabOfThePrimaries) {
    const auto colors = colors_by_name("css_named_colors.vrl");
    for (const named_lab& published :
         {named_lab{L"red", {53.24, 80.09, 67.20}}, named_lab{L"lime", {87.73, -86.18, 83.18}},
          named_lab{L"blue", {32.30, 79.19, -107.86}}, named_lab{L"white", {100, 0, 0}},
          named_lab{L"black", {0, 0, 0}}, named_lab{L"gray", {53.59, 0, 0}}}) {
        const auto& lab =
            value_in(colors.at(published.name), group::chosen_ColorSpaceCIELab).get_ColorSpaceCIELab();
        EXPECT_NEAR(lab.get_L(), published.value.l, 0.02);
        EXPECT_NEAR(lab.get_A(), published.value.a, 0.02);
        EXPECT_NEAR(lab.get_B(), published.value.b, 0.03);
    }
}

// All four values of a color are one color: the way back from each of them ends at the sRGB value.
TEST(CssNamedColors, AreTheSameColorInEachOfTheirSpaces) {
    for (const vrl_v2::ColorType& color : colors_of("css_named_colors.vrl")) {
        const auto& srgb = value_in(color, group::chosen_ColorSpaceSRGB).get_ColorSpaceSRGB();
        const auto& xyz =
            value_in(color, group::chosen_ColorSpaceEmissiveCIEXYZ).get_ColorSpaceEmissiveCIEXYZ();
        const auto& lab = value_in(color, group::chosen_ColorSpaceCIELab).get_ColorSpaceCIELab();
        const auto& lch = value_in(color, group::chosen_ColorSpaceCIELCh).get_ColorSpaceCIELCh();
        const examples::rgb ways_back[] = {
            examples::to_srgb(examples::xyz{xyz.get_X(), xyz.get_Y(), xyz.get_Z()}),
            examples::to_srgb(
                to_xyz(examples::lab{lab.get_L(), lab.get_A(), lab.get_B()}, examples::k_white_d65)),
            examples::to_srgb(
                to_xyz(to_lab(examples::lch{lch.get_L(), lch.get_C(), lch.get_H()}), examples::k_white_d65))};
        for (const examples::rgb& back : ways_back) {
            EXPECT_NEAR(back.r, srgb.get_Red(), 0.0005);
            EXPECT_NEAR(back.g, srgb.get_Green(), 0.0005);
            EXPECT_NEAR(back.b, srgb.get_Blue(), 0.0005);
        }
    }
}

TEST(QualityControl, HoldsAFunctionOfADerivedClassUnderTheHeadElement) {
    const vrl_v2::Vrl document = load("quality_control.vrl");
    const vrl_v2::StandardAndMeasurementType& pair =
        document.get_ColorQualityControl(0).get_StandardAndMeasurement(0);
    const vrl_v2::Measurement& last = pair.get_Measurement(pair.size_Measurement() - 1);
    const vrl_v2::sg_Function& function = last.get_Function(last.size_Function() - 1);
    ASSERT_EQ(function.getchosen(), vrl_v2::sg_Function::chosen_Function);
    EXPECT_TRUE(function.get_Function().has_id(vrl_v2::FunctionMeanDEType::id));
}

}  // namespace
}  // namespace vrl_test
