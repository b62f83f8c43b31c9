#pragma once

#include <filesystem>
#include <string>

#include "codegen/class_plan.h"
#include "codegen/schema_model.h"

namespace codegen_tests {

/// A folder that goes away with its object.
class temporary_folder {
public:
    temporary_folder();
    temporary_folder(const temporary_folder&) = delete;
    temporary_folder& operator=(const temporary_folder&) = delete;
    ~temporary_folder();

    /// Gives the path of the new file.
    std::string write(const std::string& name, const std::string& text) const;

private:
    std::filesystem::path m_path;
};

/// A whole schema around declarations. They start on line 2, with the prefixes xs, v (the schema's own) and b
/// (annotations).
std::string around(const std::string& declarations);

vrl_codegen::schema read(const std::string& declarations);
vrl_codegen::plan plan_of(const std::string& declarations);

/// What is said about a schema that is refused, either on reading or on planning; empty if it isn't.
std::string refusal(const std::string& declarations);

}  // namespace codegen_tests
