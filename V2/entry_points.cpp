#include <memory>
#include <ostream>
#include <string_view>

#include "V2/Vrl.h"
#include "V2/frame/text_blocks.h"
#include "V2/library_stamp.h"
#include "V2/packed_route.h"
#include "platform/file_open.h"
#include "platform/text_stream.h"
#include "runtime/xml_reader.h"
#include "runtime/xml_writer.h"

namespace vrl_v2 {
namespace {

using qbxV2::eqbx_error;

constexpr std::wstring_view k_packed_suffix = L".vrlz";
constexpr std::wstring_view k_plain_suffix = L".vrl";

// One of the codes that are left to callers has a meaning here.
constexpr eqbx_error k_unknown_suffix = qbxV2::EQBX_USER_ERROR_2;

/// Exact: case counts, and nothing else of the path is looked at.
bool ends_in(const std::wstring& path, std::wstring_view suffix) {
    return path.size() >= suffix.size() &&
           path.compare(path.size() - suffix.size(), suffix.size(), suffix) == 0;
}

/// Stamps the document, const or not, and writes it.
eqbx_error write_text(Vrl const& document, std::ostream& os) {
    const_cast<Vrl&>(document).get_Preamble().get_Header().assign_WriteSDKInformation(this_library());
    qbxV2::c_xml_writer out(os, qbxV2::c_xml_writer::include_xml_decl, "\t", "\n");
    return document.marshal(out, "Vrl:Vrl");
}

eqbx_error write_plain(Vrl const& document, const std::wstring& path) {
    // Intended: a file that cannot be opened is not reported; the text goes nowhere.
    std::unique_ptr<std::ostream> file = vrl_platform::create_crlf_file(path);
    const eqbx_error result = write_text(document, *file);
    if (result != qbxV2::EQBX_NO_ERROR) vrl_platform::remove_file(path);
    return result;
}

}  // namespace

// Intended: going through the mutable getters makes Preamble and Header present from birth.
void Vrl::init() { get_Preamble().get_Header().assign_ReadSDKInformation(this_library()); }

eqbx_error Vrl::loadFile(std::wstring const& path) {
    if (ends_in(path, k_packed_suffix)) return load_packed(*this, path);
    qbxV2::c_xml_reader_file reader(path.c_str());
    return reader.is_open() ? unmarshal(reader) : qbxV2::EQBX_FILE_NOT_OPENED;
}

eqbx_error Vrl::loadString(std::wstring const& xml) {
    std::string utf8;
    qbxV2::convert(&utf8, xml);
    qbxV2::c_xml_reader_memory reader(utf8.data(), utf8.size());
    return unmarshal(reader);
}

eqbx_error Vrl::writeFile(std::wstring const& path) const {
    const bool packed = ends_in(path, k_packed_suffix);
    if (!packed && !ends_in(path, k_plain_suffix)) return k_unknown_suffix;
    // A packed document is written plain beside its target first, over any file of that name.
    const std::wstring plain =
        packed ? path.substr(0, path.size() - k_packed_suffix.size()).append(k_plain_suffix) : path;
    const eqbx_error result = write_plain(*this, plain);
    return packed && result == qbxV2::EQBX_NO_ERROR ? pack_file(plain, path) : result;
}

XMLDocumentResult Vrl::writeString() const {
    frame::text_blocks blocks;
    std::ostream os(&blocks);
    // Memory that runs out would else end the text early, with no code to tell of it.
    os.exceptions(std::ios_base::badbit);
    const eqbx_error result = write_text(*this, os);
    std::wstring document;
    if (result == qbxV2::EQBX_NO_ERROR) qbxV2::convert(&document, blocks.take());
    return {document, result};
}

}  // namespace vrl_v2
