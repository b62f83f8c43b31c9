#pragma once

#include <string>

#include "codegen/schema_model.h"

/// The words of the reference pages.
namespace vrl_codegen {

/// Text as Markdown shows it unchanged, in a table too.
std::string plain(const std::string& text);
/// `text` as code.
std::string code(const std::string& text);
std::string link_to(const std::string& shown, const std::string& title);

/// What a built-in type is, in a user's words.
std::string words_of_type(const std::string& built_in);
/// Which values facets admit, such as "0 to 100"; empty where they admit all.
std::string words_of_values(const facets& limits);
/// "1", "0..1", "1..n" or "0..n".
std::string words_of_occurrence(const element_declaration& element);

}  // namespace vrl_codegen
