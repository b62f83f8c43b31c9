#pragma once

#include <string>
#include <vector>

#include "codegen/class_plan.h"

namespace vrl_codegen {

/// One exported function of the flat layer: its C declaration, and the one line behind it.
struct flat_function {
    std::string family;  ///< "get", "set", "new", ...: for the counts in exports.txt
    std::string name;
    std::string result;
    std::string parameters;
    std::string body;
};

/// What belongs together in the header: a class, or the free functions.
struct flat_group {
    std::string subject;
    std::vector<flat_function> functions;
};

/// The functions of one class of the model, families in a fixed order.
std::vector<flat_function> flat_functions_of(const class_plan& made);

/// The functions of the runtime's value classes, its free functions and its constants.
std::vector<flat_group> flat_functions_of_values();

}  // namespace vrl_codegen
