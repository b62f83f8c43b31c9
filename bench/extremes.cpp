#include <fstream>

#include "bench/document.h"

namespace bench {
namespace {

constexpr char k_before_attributes[] = R"(<?xml version="1.0" encoding="UTF-8"?>
<Vrl:Vrl xmlns:Vrl="urn:vrl:document/v2" xmlns:xsi="http://www.w3.org/2001/XMLSchema-instance">
<Vrl:Preamble><Vrl:Header>
<Vrl:Creator>vrl_bench</Vrl:Creator><Vrl:CreatorVersion>1</Vrl:CreatorVersion>
<Vrl:ChangeHistory>2024-03-01T08:00:00Z</Vrl:ChangeHistory><Vrl:Purpose>Growth</Vrl:Purpose>
<Vrl:ReadSDKInformation><Vrl:SDKName>vrl_bench</Vrl:SDKName><Vrl:SDKVersion>1</Vrl:SDKVersion></Vrl:ReadSDKInformation>
</Vrl:Header></Vrl:Preamble>
<Vrl:Color ColorName="Extreme")";
constexpr char k_before_children[] = R"(>
<Vrl:ChangeHistory>2024-03-01T08:00:00Z</Vrl:ChangeHistory>
)";
constexpr char k_behind_children[] = R"(
<Vrl:ColorSpaceCIELab><Vrl:ChangeHistory>2024-03-01T08:00:00Z</Vrl:ChangeHistory>
<Vrl:ColorSpaceSpecificationSpectrumTristimulus xsi:nil="true"/>
<Vrl:L>50</Vrl:L><Vrl:A>0</Vrl:A><Vrl:B>0</Vrl:B></Vrl:ColorSpaceCIELab>
</Vrl:Color>
</Vrl:Vrl>
)";

/// A document with one color that has these attributes and children besides what it must have.
document make_one_color(const std::string& folder, const std::string& name, const std::string& attributes,
                        const std::string& children) {
    std::string path = folder;
    path.append("/").append(name).append(".vrl");
    std::ofstream(path, std::ios::binary)
        << k_before_attributes << attributes << k_before_children << children << k_behind_children;
    return read_document(name, path);
}

}  // namespace

document make_attributes(const std::string& folder, const std::string& name, std::size_t count) {
    // Of the instance namespace: the attributes that reading passes over on any element.
    std::string attributes;
    for (std::size_t i = 0; i < count; ++i) {
        attributes.append(" xsi:a").append(std::to_string(1000000 + i)).append("=\"0.5\"");
    }
    return make_one_color(folder, name, attributes, "");
}

document make_siblings(const std::string& folder, const std::string& name, std::size_t count) {
    std::string children;
    for (std::size_t i = 0; i < count; ++i) {
        children += "<Vrl:SemanticAssociation>calm</Vrl:SemanticAssociation>\n";
    }
    return make_one_color(folder, name, "", children);
}

document make_text(const std::string& folder, const std::string& name, std::size_t size) {
    constexpr char line[] = "A remark that goes on &amp; on, as remarks do, over line and line and line.\n";
    std::string text;
    while (text.size() < size) text += line;
    return make_one_color(folder, name, "",
                          "<Vrl:SemanticAssociation>" + text + "</Vrl:SemanticAssociation>");
}

}  // namespace bench
