#include "tests/schema/fragments.h"

namespace schema_tests {

std::string element(const std::string& name, const std::string& content, const std::string& attributes) {
    const std::string tag = "Vrl:" + name;
    return "<" + tag + (attributes.empty() ? "" : " " + attributes) + ">" + content + "</" + tag + ">";
}

std::string outermost(const std::string& name, const std::string& content, const std::string& attributes) {
    const std::string namespaces =
        "xmlns:Vrl=\"urn:vrl:document/v2\" xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\"";
    return element(name, content, namespaces + (attributes.empty() ? "" : " " + attributes));
}

std::string nil(const std::string& name) { return element(name, {}, "xsi:nil=\"true\""); }

std::string document(const std::string& content) {
    const std::string header = element("Creator", "me") + element("CreatorVersion", "1") + change_history() +
                               element("Purpose", "trial");
    return outermost("Vrl", element("Preamble", element("Header", header)) + content);
}

std::string change_history() { return element("ChangeHistory", "2024-01-02T03:04:05Z"); }

std::string color(const std::string& values) {
    return element("Color", change_history() + values, "ColorName=\"c\"");
}

std::string lab(double l) {
    return element("ColorSpaceCIELab", change_history() + nil("ColorSpaceSpecificationSpectrumTristimulus") +
                                           element("L", std::to_string(l)) + element("A", "0") +
                                           element("B", "0"));
}

std::string device() {
    return element("Device",
                   element("Manufacturer", "m") + element("Model", "n") + element("SerialNumber", "1"));
}

std::string custom_attribute(const std::string& value) {
    return element("CustomAttribute", element("Name", "n") + element("ValueChoice", value));
}

std::string color_space(const std::string& space, const std::string& specification,
                        const std::string& content, const std::string& attributes) {
    return outermost("ColorSpace" + space,
                     change_history() + nil("ColorSpaceSpecification" + specification) + content, attributes);
}

std::string tristimulus_specification(const std::string& content) {
    return outermost("ColorSpaceSpecificationSpectrumTristimulus",
                     nil("DeviceFilter") + nil("DevicePolarization") + change_history() +
                         element("Spectrum", "Spectrum_Reflectance") + content);
}

}  // namespace schema_tests
