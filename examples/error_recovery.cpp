/// Reads a document with mistakes in it, notes each of them with its line and item, and goes on reading.

#include <V2/Vrl.h>
#include <runtime/values.h>
#include <runtime/xml_reader.h>

#include <iostream>
#include <string>
#include <vector>

namespace {

const std::string k_damaged =
    R"(<Vrl:Vrl xmlns:Vrl="urn:vrl:document/v2" xmlns:xsi="http://www.w3.org/2001/XMLSchema-instance">
  <Vrl:Preamble>
    <Vrl:Header>
      <Vrl:Creator>a hand</Vrl:Creator>
      <Vrl:CreatorVersion>1</Vrl:CreatorVersion>
      <Vrl:ChangeHistory>last Tuesday</Vrl:ChangeHistory>
      <Vrl:Purpose>to be mended</Vrl:Purpose>
    </Vrl:Header>
  </Vrl:Preamble>
  <Vrl:Color ColorName="Too much ink">
    <Vrl:ChangeHistory>2024-01-15T12:00:00Z</Vrl:ChangeHistory>
    <Vrl:ColorSpaceCMYK>
      <Vrl:ChangeHistory>2024-01-15T12:00:00</Vrl:ChangeHistory>
      <Vrl:ColorSpaceSpecificationSpectrumGeneric xsi:nil="true"/>
      <Vrl:Cyan>100</Vrl:Cyan>
      <Vrl:Magenta>180</Vrl:Magenta>
      <Vrl:Yellow>30</Vrl:Yellow>
      <Vrl:Black>-5</Vrl:Black>
    </Vrl:ColorSpaceCMYK>
  </Vrl:Color>
</Vrl:Vrl>
)";

/// What one check reported.
struct report {
    int line;
    std::string item;
    qbxV2::eqbx_error code;
};

/// A reader that answers each report with "carry on": the value is kept as it stands in the document.
class tolerant_reader : public qbxV2::c_xml_reader_memory {
public:
    explicit tolerant_reader(const std::string& text) : c_xml_reader_memory(text.data(), text.size()) {}

    using c_xml_reader_memory::user_handle_error;
    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error code, const std::string& item, const char* file,
                                        int line) override {
        static_cast<void>(file), static_cast<void>(line);  // the place of the check, for those who debug it
        m_reports.push_back({get_line_no(), item, code});
        return qbxV2::EQBX_NO_ERROR;
    }

    const std::vector<report>& reports() const { return m_reports; }

private:
    std::vector<report> m_reports;
};

}  // namespace

int main() {
    tolerant_reader reader(k_damaged);
    vrl_v2::Vrl document;
    const qbxV2::eqbx_error error = document.unmarshal(reader);
    for (const report& found : reader.reports()) {
        std::cout << "line " << found.line << ", " << found.item << ": "
                  << qbxV2::get_error_description(found.code) << '\n';
    }
    std::cout << "reading ended with: " << qbxV2::get_error_description(error) << '\n';
    if (error != qbxV2::EQBX_NO_ERROR || document.size_Color() == 0) return 1;
    const vrl_v2::sg_ColorSpace& space = document.get_Color(0).get_ColorSpace(0);
    std::cout << "magenta was kept as " << space.get_ColorSpaceCMYK().get_Magenta() << '\n';
    return 0;
}
