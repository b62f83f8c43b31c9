// Generated from schema/. To change it, change the schema.
#pragma once

/// One number for each name of the format in each of its roles: `a_` as an attribute, `e_` as an element.
namespace vrl_v2::token {

enum : int {
    e_Area = 14,
    e_Shape = 15,
    e_Hole = 16,
    e_Thickness = 17,
    e_Circle = 18,
    e_Square = 19,
    e_RoundHole = 20,
};

}  // namespace vrl_v2::token
