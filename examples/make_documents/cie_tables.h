#pragma once

#include <array>
#include <cstddef>
#include <vector>

/// Tables of CIE 15:2004 "Colorimetry", appendix.
namespace examples {

/// Color matching functions of the CIE 1931 standard observer (2 degrees), 380 to 780 nm in steps
/// of 5.
inline constexpr std::size_t k_observer_points = 81;
extern const std::array<double, 3> k_observer[k_observer_points];

/// The mean and the two characteristic vectors of daylight, 380 to 780 nm in steps of 10.
inline constexpr std::size_t k_daylight_points = 41;
extern const std::array<double, 3> k_daylight_components[k_daylight_points];

/// Illuminant C, 380 to 780 nm in steps of 10.
extern const std::vector<double> k_illuminant_c;

/// Fluorescent lamps FL2 (cool white), FL7 (daylight) and FL11 (narrow bands), 380 to 780 nm in
/// steps of 5.
extern const std::vector<double> k_fluorescent_2;
extern const std::vector<double> k_fluorescent_7;
extern const std::vector<double> k_fluorescent_11;

}  // namespace examples
