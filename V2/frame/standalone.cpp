#include "V2/frame/standalone.h"

#include <cstdio>
#include <fstream>
#include <ostream>

#include "V2/frame/text_blocks.h"

namespace vrl_v2::frame {

eqbx_error marshal_to_stream(const document_element& element, std::ostream& os) {
    qbxV2::c_xml_writer out(os, qbxV2::c_xml_writer::include_xml_decl, "\t", "\n");
    return element.write(element.self, out, element.name);
}

eqbx_error marshal_to_string(const document_element& element, std::string* text) {
    text_blocks blocks;
    std::ostream os(&blocks);
    // Memory that runs out would else end the text early, with no code to tell of it.
    os.exceptions(std::ios_base::badbit);
    const eqbx_error result = marshal_to_stream(element, os);
    if (result == qbxV2::EQBX_NO_ERROR) *text = blocks.take();
    return result;
}

eqbx_error marshal_to_path(const document_element& element, const char* path) {
    std::ofstream file(path);
    if (!file.is_open()) return qbxV2::EQBX_FILE_NOT_OPENED;
    const eqbx_error result = marshal_to_stream(element, file);
    file.close();
    if (result != qbxV2::EQBX_NO_ERROR) std::remove(path);
    return result;
}

}  // namespace vrl_v2::frame
