#pragma once

#include <map>
#include <string>
#include <vector>

#include "codegen/class_plan.h"

namespace vrl_codegen {

/// Plans simple values: their stored types and the constants that hold their facets.
class value_planner {
public:
    /// Throws `schema_error` for a type that has no stored form, and for facets that nothing would check.
    value_plan plan_value(const simple_type& type, const std::string& owner, const std::string& member,
                          const std::string& place);

    /// The facet constants that a class uses, in order of first use.
    std::vector<limits_plan> limits_of(const class_plan& owner) const;

private:
    std::map<std::string, limits_plan> m_limits;
};

/// Throws `schema_error` where storage can't start with the value that an annotation or a default gives.
void check_initial(const value_plan& value, const std::string& text, const std::string& place);

}  // namespace vrl_codegen
