#pragma once

#include <string>

#include "V2/Vrl.h"
#include "V2/format.h"

/// Small valid pieces of documents, as text and as objects, for tests to put together and to damage.
namespace vrl_test {

// As text. -------------------------------------------------------------------------------------------------

inline const std::string k_declaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
inline const std::string k_namespaces =
    " xmlns:Vrl=\"urn:vrl:document/v2\" xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\"";
inline const std::string k_time = "2024-01-02T03:04:05Z";

/// <Vrl:name attributes>content</Vrl:name>; `attributes` begins with a blank where there are any.
inline std::string element(const std::string& name, const std::string& content,
                           const std::string& attributes = "") {
    return "<Vrl:" + name + attributes + ">" + content + "</Vrl:" + name + ">";
}
inline std::string empty_element(const std::string& name, const std::string& attributes = "") {
    return "<Vrl:" + name + attributes + "/>";
}
/// The element as a document of its own: with the declarations of the two prefixes.
inline std::string outermost(const std::string& name, const std::string& content,
                             const std::string& attributes = "") {
    return element(name, content, k_namespaces + attributes);
}

inline std::string history() { return element("ChangeHistory", k_time); }

/// A header up to its last required element; `tail` follows.
inline std::string header(const std::string& tail = "") {
    return element("Header", element("Creator", "maker") + element("CreatorVersion", "1") + history() +
                                 element("Purpose", "test") + tail);
}
inline std::string preamble(const std::string& tail = "") { return element("Preamble", header() + tail); }
inline std::string document(const std::string& content = "") {
    return outermost("Vrl", preamble() + content);
}

inline std::string filter() { return element("DeviceFilter", "Filter_None"); }
inline std::string polarization() { return element("DevicePolarization", "false"); }
/// The content of a specification of class ...SpectrumGeneric.
inline std::string spectrum_generic_content() {
    return filter() + polarization() + history() + element("Spectrum", "Spectrum_Reflectance");
}
inline std::string spectrum_generic() {
    return element("ColorSpaceSpecificationSpectrumGeneric", spectrum_generic_content());
}
inline std::string spectrum_tristimulus() {
    return element("ColorSpaceSpecificationSpectrumTristimulus",
                   spectrum_generic_content() +
                       element("IlluminationOptions", element("Illuminant", "Illuminant_D50")) +
                       element("FieldOfView", "FieldOfView_2_Degree"));
}
inline std::string inks(const std::string& black = "40") {
    return element("Cyan", "10") + element("Magenta", "20") + element("Yellow", "30") +
           element("Black", black);
}
inline std::string cmyk_content(const std::string& black = "40") {
    return history() + spectrum_generic() + inks(black);
}
inline std::string cmyk(const std::string& black = "40") {
    return element("ColorSpaceCMYK", cmyk_content(black));
}
/// `tail` follows the color space.
inline std::string color(const std::string& name = "c", const std::string& tail = "") {
    return element("Color", history() + cmyk() + tail, " ColorName=\"" + name + "\"");
}
inline std::string device() {
    return element("Device",
                   element("Manufacturer", "m") + element("Model", "n") + element("SerialNumber", "s"));
}
inline std::string standard() { return element("Standard", device() + color()); }
inline std::string tolerance(const std::string& function) { return element("Tolerance", function); }
inline std::string sample_spot() {
    return element("SampleSpot",
                   empty_element("SubstratePaper") +
                       element("Specification", element("SampleWidth", "1") + element("SampleHeight", "2")));
}
inline std::string quality_control(const std::string& tail = "") {
    return element("ColorQualityControl", history() + element("StandardAndMeasurement", standard()) +
                                              element("PhysicalSample", sample_spot()) + tail);
}

/// A document with something of everything that nests.
inline std::string rich_document() {
    return k_declaration +
           document(
               color("first", element("SubstratePaper", element("PaperType", "coated"))) +
               element("Palette",
                       history() + element("ColorSet", history() + color("second"), " ColorSetName=\"s\""),
                       " PaletteName=\"p\"") +
               quality_control(tolerance(empty_element("Function", " xsi:type=\"Vrl:FunctionDEType\""))));
}

// As objects. ----------------------------------------------------------------------------------------------

inline qbxV2::c_datetime time() { return qbxV2::c_datetime(k_time); }

inline void complete(vrl_v2::Header& header) {
    header.set_Creator(L"maker");
    header.set_CreatorVersion(L"1");
    header.append_ChangeHistory(time());
    header.set_Purpose(L"test");
}
inline void complete(vrl_v2::Vrl& document) { complete(document.get_Preamble().get_Header()); }

inline void complete_base(vrl_v2::ColorSpaceSpecificationType& specification) {
    specification.get_DeviceFilter().set_DeviceFilter(L"Filter_None");
    specification.get_DevicePolarization().set_DevicePolarization(false);
    specification.append_ChangeHistory(time());
}
inline void complete(vrl_v2::ColorSpaceSpecificationSpectrumGenericType& specification) {
    complete_base(specification);
    specification.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance");
}
inline void complete(vrl_v2::ColorSpaceCMYKType& space) {
    space.append_ChangeHistory(time());
    complete(space.get_ColorSpaceSpecificationSpectrumGeneric());
    space.set_Cyan(10);
    space.set_Magenta(20);
    space.set_Yellow(30);
    space.set_Black(40);
}
inline void complete(vrl_v2::ColorType& color, const std::wstring& name = L"c") {
    color.set_ColorName(name);
    color.append_ChangeHistory(time());
    complete(color.get_ColorSpace(0).get_ColorSpaceCMYK());
}
inline void complete(vrl_v2::DeviceType& device) {
    device.set_Manufacturer(L"m");
    device.set_Model(L"n");
    device.set_SerialNumber(L"s");
}
inline void complete(vrl_v2::Standard& standard) {
    complete(standard.get_Device());
    complete(standard.get_Color());
}
inline void complete(vrl_v2::CustomAttributeType& attribute, const std::wstring& name = L"key") {
    attribute.set_Name(name);
    attribute.get_ValueChoice().set_StringValue(L"value");
}

}  // namespace vrl_test
