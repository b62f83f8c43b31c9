#include <cstddef>
#include <cstdint>
#include <string>

#include "V2/Vrl.h"
#include "fuzz/finding.h"
#include "fuzz/sources.h"
#include "runtime/xml_reader.h"

// Reads any bytes as a document: with the errors as they come, and carrying on past every one of them.

namespace {

/// Lets reading go on as if no check had failed.
class forgiving_reader : public qbxV2::c_xml_reader {
public:
    using c_xml_reader::c_xml_reader;
    using c_xml_reader::user_handle_error;
    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error) override { return qbxV2::EQBX_NO_ERROR; }
};

/// What reading came to: the code, the last report, and the document as far as it can be written.
template <class Reader>
std::string outcome(qbxV2::c_read& source) {
    Reader reader(source);
    vrl_v2::Vrl document;
    const qbxV2::eqbx_error code = document.unmarshal(reader);
    std::string message;
    reader.get_error_message(&message);
    std::string text;
    const qbxV2::eqbx_error written = document.marshal(&text);
    return std::to_string(code) + " " + message + "\nwritten with " + std::to_string(written) + "\n" + text;
}

template <class Reader>
void read_both_ways(const fuzz::exact_memory& bytes) {
    qbxV2::c_read_memory memory(bytes.data(), bytes.size());
    fuzz::one_byte_source byte_by_byte(bytes);
    fuzz::require_equal("the document read in runs, against byte by byte", outcome<Reader>(memory),
                        outcome<Reader>(byte_by_byte));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::exact_memory bytes(data, size);
    read_both_ways<qbxV2::c_xml_reader>(bytes);
    read_both_ways<forgiving_reader>(bytes);
    return 0;
}
