#include <cstddef>
#include <cstdint>
#include <string>

#include "fuzz/event_walk.h"
#include "fuzz/finding.h"
#include "fuzz/sources.h"

// Reads any bytes as XML, on every way that bytes can take into the reader. All have to tell the same:
// events, values, codes and line numbers.

namespace {

/// Small, so that a few bytes of entities cannot fill a whole run of the fuzzer.
constexpr std::size_t k_max_expansion = 5000;

std::string walk(qbxV2::c_read& source, bool use_runs, fuzz::record form) {
    qbxV2::c_xml_reader reader(source);
    reader.use_runs(use_runs);
    reader.set_max_entity_expansion(k_max_expansion);
    return fuzz::event_walk(reader, form).run();
}

/// A way that bytes can take, to be judged by the one byte by byte.
struct way {
    const char* name;
    std::string (*walk)(const fuzz::exact_memory& bytes, fuzz::record form);
};

std::string byte_by_byte(const fuzz::exact_memory& bytes, fuzz::record form) {
    fuzz::one_byte_source source(bytes);
    return walk(source, true, form);
}

std::string in_runs(const fuzz::exact_memory& bytes, fuzz::record form) {
    qbxV2::c_read_memory source(bytes.data(), bytes.size());
    return walk(source, true, form);
}

std::string without_runs(const fuzz::exact_memory& bytes, fuzz::record form) {
    qbxV2::c_read_memory source(bytes.data(), bytes.size());
    return walk(source, false, form);
}

std::string in_short_runs(const fuzz::exact_memory& bytes, fuzz::record form) {
    fuzz::short_run_source source(bytes, 1 + bytes.size() % 7);
    return walk(source, true, form);
}

const way k_ways[] = {{"in runs", in_runs}, {"without runs", without_runs}, {"in short runs", in_short_runs}};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::exact_memory bytes(data, size);
    const std::string expected = byte_by_byte(bytes, fuzz::record::compact);
    for (const way& other : k_ways) {
        if (other.walk(bytes, fuzz::record::compact) == expected) continue;
        fuzz::require_equal(other.name, other.walk(bytes, fuzz::record::readable),
                            byte_by_byte(bytes, fuzz::record::readable));
        fuzz::report_finding(std::string(other.name) +
                             ": differs from byte by byte, but not from run to run");
    }
    return 0;
}
