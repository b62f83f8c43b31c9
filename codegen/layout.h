#pragma once

#include <cstddef>
#include <string>

namespace vrl_codegen {

/// The longest line of generated code, as in the code that is written by hand.
inline constexpr std::size_t k_line_length = 110;

/// Lays generated C++ out: what doesn't fit on a line is broken, doubled blank lines become one.
///
/// A template says what is on a line when there is room; where names are long, the line is broken here, at
/// the outermost place that helps, in this order: a body in braces gets lines of its own; bases and
/// initializers go to the next line; an expression is broken behind "&&" and "||"; arguments are filled in
/// behind their bracket, or if one is too long for that, below it with an indent of four, as lists always
/// are; what a function returns stands ahead of its name; what is assigned, below what it is assigned to.
///
/// Comments and preprocessor lines stay as they are, and no break falls into a literal. The same text always
/// gives the same lines, and what has been laid out once comes out unchanged.
std::string lay_out(const std::string& text);

}  // namespace vrl_codegen
