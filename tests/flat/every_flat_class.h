#pragma once

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

#include "tests/driver/any_object.h"
#include "tests/flat/flat_driver.h"
#include "tests/flat/reported_null.h"

namespace vrl_flat_driver {

inline const flat_member& find_member(const flat_class& c, const std::string& name) {
    for (const flat_member& m : c.members) {
        if (name == m.name) return m;
    }
    throw std::runtime_error(std::string(c.name) + " has no " + name);
}

/// Each class by its C functions and, beside them, by the C++ functions behind them.
class EveryFlatClass : public testing::TestWithParam<const flat_class*> {
protected:
    void SetUp() override { listen_for_nulls(); }

    const flat_class& flat() const { return *GetParam(); }
    const vrl_driver::class_description& model() const { return vrl_driver::find_class(flat().name); }
    std::string message(const char* form) const { return std::string("vrl_v2::") + flat().name + form; }
};

}  // namespace vrl_flat_driver
