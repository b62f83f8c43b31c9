#pragma once

#include <array>
#include <cstddef>
#include <vector>

/// Tables of CIE 15:2004 "Colorimetry".
namespace examples {

/// Table T.4: color matching functions of the CIE 1931 standard observer (2 degrees), 380 to 780 nm in steps
/// of 5.
inline constexpr std::size_t k_observer_points = 81;
extern const std::array<double, 3> k_observer[k_observer_points];

/// Table T.2: the mean and the two characteristic vectors of daylight, 380 to 780 nm in steps of 10.
inline constexpr std::size_t k_daylight_points = 41;
extern const std::array<double, 3> k_daylight_components[k_daylight_points];

/// Table T.1: illuminant C, 380 to 780 nm in steps of 10.
extern const std::vector<double> k_illuminant_c;

/// Table T.6.1: fluorescent lamps FL2 (cool white), FL7 (daylight) and FL11 (narrow bands), 380 to 780 nm in
/// steps of 5.
extern const std::vector<double> k_fluorescent_2;
extern const std::vector<double> k_fluorescent_7;
extern const std::vector<double> k_fluorescent_11;

}  // namespace examples
