#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include "bench/document.h"

namespace bench {

/// One task that a program does with a document, through one library. An object serves one document, as often
/// as it is asked to; only `run` is timed. All calls throw std::exception on failure, also when the outcome
/// is not the whole document: a contender that did half of the work must not look fast.
class contender {
public:
    virtual ~contender() = default;
    /// What an application does once: read the schema, load what will be written.
    virtual void prepare(const document&) {}
    /// The task.
    virtual void run(const document& input) = 0;
    /// Checks the outcome of `run`, frees it, and returns the bytes that were read or written.
    virtual std::size_t finish(const document& input) = 0;
};

/// Throws unless `elements` is the number of elements of `input`.
void need_elements(std::size_t elements, const document& input);

/// A contender as the table names it.
struct entry {
    const char* name;
    std::unique_ptr<contender> (*make)();
};

// By the task's name: the first is the measure of all others.
std::unique_ptr<contender> expat_parse();

std::unique_ptr<contender> vrl_load_memory();
std::unique_ptr<contender> vrl_load_file();
std::unique_ptr<contender> vrl_write_string();
std::unique_ptr<contender> vrl_write_wide_string();

std::unique_ptr<contender> libxml2_reader();
std::unique_ptr<contender> libxml2_validated_dom();

std::unique_ptr<contender> pugixml_parse();
std::unique_ptr<contender> pugixml_save();

std::unique_ptr<contender> xsdcxx_parse();
std::unique_ptr<contender> xsdcxx_serialise();

/// All of them, in the order of the table. Those that pack stand in bench/packing.h.
const std::vector<entry>& contenders();

/// The contender of that name, of either list. Throws std::invalid_argument if there is none.
const entry& find_contender(const std::string& name);

}  // namespace bench
