#pragma once

#include <string>
#include <vector>

#include "bench/contender.h"
#include "bench/table.h"

namespace bench {

/// The tasks on the way from a document to its packed file, and those on the way back, which find the packed
/// file beside the document: see `make_packed`. Those that are held against each other stand side by side.
const std::vector<entry>& packing_contenders();
const std::vector<entry>& unpacking_contenders();

/// Packs a document into the file of its name that ends in ".vrlz".
void make_packed(const document& input);
std::string packed_path(const document& input);

/// Packing against raw zlib and against the peers, and a save to a packed file against the sum of what it
/// consists of.
void measure_packing(const document& input, int rounds, table& results);
/// The same of unpacking and of a load from a packed file. Takes a fraction of the time.
void measure_unpacking(const document& input, int rounds, table& results);
/// What the packed route adds to the memory of its process beyond the document itself.
void measure_packing_memory(const document& input, table& results);

// By the task's name.
std::unique_ptr<contender> zlib_deflate();
std::unique_ptr<contender> zlib_inflate();
std::unique_ptr<contender> engine_pack();
std::unique_ptr<contender> engine_unpack();
std::unique_ptr<contender> libzip_pack();
std::unique_ptr<contender> libzip_unpack();
std::unique_ptr<contender> minizip_pack();
std::unique_ptr<contender> minizip_unpack();
std::unique_ptr<contender> door_save();
std::unique_ptr<contender> door_load();

}  // namespace bench
