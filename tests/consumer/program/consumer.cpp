#include <V2/Vrl.h>
#include <runtime/values.h>
#include <runtime/xml_reader.h>
#include <runtime/xml_writer.h>

#include <iostream>

/// Builds a document, writes it and reads it back: what links and runs here links and runs for everybody.
int main() {
    vrl_v2::Vrl made;
    vrl_v2::Header& header = made.get_Preamble().get_Header();
    header.set_Creator(L"consumer");
    header.set_CreatorVersion(L"1");
    header.set_Purpose(L"to be read back");
    header.append_ChangeHistory(qbxV2::c_datetime("2024-01-15T10:20:30Z"));

    const vrl_v2::XMLDocumentResult written = made.writeString();
    vrl_v2::Vrl read;
    const qbxV2::eqbx_error error = read.loadString(written.getXmlDocument());
    std::cout << qbxV2::get_error_description(error) << '\n';
    return error == qbxV2::EQBX_NO_ERROR &&
                   read.get_Preamble().get_Header().get_Purpose() == L"to be read back"
               ? 0
               : 1;
}
