#pragma once

#include <cstddef>
#include <string>

namespace bench {

/// A document on disk, and its bytes.
struct document {
    std::string name;  ///< What the table calls it.
    std::string path;  ///< Holds exactly `bytes`.
    std::string bytes;
    std::size_t elements = 0;  ///< Start tags and empty-element tags: what every contender has to find.
};

/// The document that stands at `path`. Throws std::runtime_error if it cannot be read.
document read_document(const std::string& name, const std::string& path);

/// Reads a whole file into `bytes`, which gets the size of the file and no more. Throws as above.
void read_file(const std::string& path, std::string* bytes);

/// Counts elements by their tags. Good for what the makers below write: no comments, no CDATA sections.
std::size_t count_elements(const std::string& xml);

// The makers write below `folder`, with the library itself, about `size` bytes.

/// Colors as reflectance spectra of 36 points, each with the whole of its measurement conditions.
document make_spectral_palette(const std::string& folder, const std::string& name, std::size_t size);

/// Colors as CIE Lab and sRGB, with as little as they must have.
document make_short_palette(const std::string& folder, const std::string& name, std::size_t size);

/// One color with `count` attributes on its start tag.
document make_attributes(const std::string& folder, const std::string& name, std::size_t count);

/// One color with `count` children of one name.
document make_siblings(const std::string& folder, const std::string& name, std::size_t count);

/// One color with one text of `size` bytes.
document make_text(const std::string& folder, const std::string& name, std::size_t size);

}  // namespace bench
