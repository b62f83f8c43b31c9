#pragma once

#include <string>

/// Pieces of documents, so that a trial shows only what it is about.
namespace schema_tests {

/// An element of the format.
std::string element(const std::string& name, const std::string& content = {},
                    const std::string& attributes = {});

/// The same as the outermost element of a document.
std::string outermost(const std::string& name, const std::string& content = {},
                      const std::string& attributes = {});

/// The element, present but nil.
std::string nil(const std::string& name);

/// A document: a complete preamble, then `content`.
std::string document(const std::string& content = {});

std::string change_history();                  ///< one entry
std::string color(const std::string& values);  ///< a color named "c" with these color spaces
std::string lab(double l);                     ///< a color value that is valid for a valid lightness
std::string device();
std::string custom_attribute(const std::string& value);

/// A stand-alone color value: what every space has first, then `content`.
std::string color_space(const std::string& space, const std::string& specification,
                        const std::string& content, const std::string& attributes = {});

/// A stand-alone specification of a surface's tristimulus values: `content` follows the spectrum.
std::string tristimulus_specification(const std::string& content);

}  // namespace schema_tests
