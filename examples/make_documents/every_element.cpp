#include <string>

#include "examples/make_documents/documents.h"
#include "examples/make_documents/every_part.h"

namespace examples {
namespace {

/// An attribute of the caller's own in each of its three kinds.
void add_three_custom_attributes(vrl_v2::Header& header) {
    add_custom_attribute(header);
    must(header.append_CustomAttribute());
    must(header.back_CustomAttribute().set_Name(L"Pages"));
    must(header.back_CustomAttribute().get_ValueChoice().set_IntegerValue(12));
    must(header.append_CustomAttribute());
    must(header.back_CustomAttribute().set_Name(L"Weight"));
    must(header.back_CustomAttribute().get_ValueChoice().set_DoubleValue(0.25));
}

/// What the revision replaced: specifications that can be the outermost element of a file, but have no place
/// in a document except as a revision's own text.
void add_revision(vrl_v2::Header& header) {
    const std::string conditions =
        "<Vrl:DeviceFilter xsi:nil=\"true\"/><Vrl:DevicePolarization xsi:nil=\"true\"/>"
        "<Vrl:ChangeHistory>2023-01-15T12:00:00Z</Vrl:ChangeHistory>";
    must(header.append_Revision());
    vrl_v2::Revision& revision = header.back_Revision();
    must(
        revision.append_any("<Vrl:ColorSpaceSpecification>" + conditions + "</Vrl:ColorSpaceSpecification>"));
    must(revision.append_any("<Vrl:CollectionColorSpaceSpecification/>"));
    must(revision.append_any("<Vrl:ColorSpaceSpecificationSpectrum>" + conditions +
                             "<Vrl:Spectrum>Spectrum_Reflectance</Vrl:Spectrum>"
                             "</Vrl:ColorSpaceSpecificationSpectrum>"));
    must(revision.append_any("<Vrl:ColorSpaceSpecificationEmissive>" + conditions +
                             "<Vrl:EmissiveType>Emissive_Spot</Vrl:EmissiveType>"
                             "<Vrl:EmissiveMode>EmissiveMode_NA</Vrl:EmissiveMode>"
                             "</Vrl:ColorSpaceSpecificationEmissive>"));
}

void fill(vrl_v2::PlatformType& platform) {
    must(platform.set_OperatingSystem(L"Debian GNU/Linux"));
    must(platform.set_OperatingSystemVersion(L"12"));
}

void fill(vrl_v2::Preamble& preamble) {
    vrl_v2::Header& header = preamble.get_Header();
    add_three_custom_attributes(header);
    fill(header.get_ReadPlatformInformation());
    fill(header.get_WritePlatformInformation());
    add_revision(header);
    fill_owner(preamble.get_Owner());
    vrl_v2::Version& version = preamble.get_Version();
    add_custom_attribute(version);
    must(version.set_Version(L"2"));
    must(version.append_Predecessor(L"1"));
}

void fill(vrl_v2::ColorType& color) {
    must(color.set_ColorName(L"Every value"));
    must(color.set_UniqueID(L"color-1"));
    must(color.set_ColorNumber(L"1"));
    must(color.set_Comments(L"One value in each color space"));
    add_custom_attribute(color);
    date(color);
    fill_owner(color.get_Owner());
    must(color.append_SemanticAssociation(L"fresh"));
    add_every_color_space(color);
    must(color.get_Substrate().get_SubstrateGeneric().set_Type(L"glass"));
}

void fill(vrl_v2::ColorSetType& set) {
    must(set.set_UniqueID(L"set-1"));
    must(set.set_PartNumber(L"S 1"));
    must(set.set_Comments(L"One color on each substrate"));
    add_custom_attribute(set);
    fill_owner(set.get_Owner());
    must(set.append_SemanticAssociation(L"materials"));
    fill_collection(set.get_CollectionColorSpaceSpecification());
    add_every_substrate(set);
    must(set.get_Substrate().get_SubstrateGeneric().set_Type(L"various"));
}

void fill(vrl_v2::PaletteType& palette) {
    must(palette.set_PalettePartNumber(L"P 1"));
    must(palette.set_PaletteVersion(L"2"));
    must(palette.set_UniqueID(L"palette-1"));
    must(palette.set_Comments(L"Every element of a palette"));
    add_custom_attribute(palette);
    fill_owner(palette.get_Owner());
    must(palette.append_SemanticAssociation(L"complete"));
    fill_collection(palette.get_CollectionColorSpaceSpecification());
    fill(add_color_set(palette, L"Substrates"));
}

}  // namespace

void fill_owner(vrl_v2::OwnerType& owner) {
    add_custom_attribute(owner);
    must(owner.append_Person());
    must(owner.back_Person().set_Name(L"A. Painter"));
    must(owner.back_Person().set_ContactInfo(L"painter@example.org"));
    must(owner.append_Copyright(L"\u00A9 2024 A. Painter"));
    must(owner.append_Company(L"Painter & Daughters"));
}

vrl_v2::Vrl every_element() {
    vrl_v2::Vrl document;
    describe(document, L"Every element", L"For tests: every element and attribute of the format")
        .set_Comments(L"The values are free examples.");
    fill(document.get_Preamble());
    must(document.append_Color());
    fill(document.back_Color());
    fill(add_palette(document, L"Every element"));
    add_quality_control(document);
    return document;
}

}  // namespace examples
