#pragma once

#include <map>
#include <string>
#include <vector>

#include "codegen/class_plan.h"

namespace vrl_codegen {

/// Plans simple values: their stored types and the constants that hold their facets.
class value_planner {
public:
    value_plan plan_value(const simple_type& type, const std::string& owner, const std::string& member);
    /// The value that storage starts with, as C++: from the annotation or the schema's default.
    static std::string initial_value(const value_plan& value, const std::string& text);

    /// The facet constants that a module's classes use, in order of first use.
    std::vector<limits_plan> limits_of(const class_plan& owner) const;

private:
    std::string limits_name(const simple_type& type, const std::string& owner, const std::string& member);

    std::map<std::string, limits_plan> m_limits;
};

/// Works out which names may follow at each position of a class's content.
void plan_positions(class_plan& owner);

/// A name that C++ can take: everything else becomes an underscore.
std::string identifier(const std::string& text);

}  // namespace vrl_codegen
