#pragma once

#include <vector>

#include "examples/colorimetry.h"

namespace examples {

/// Values at equal steps of wavelength, in nanometers.
struct spectrum {
    double first;
    double step;
    std::vector<double> values;

    double wavelength(std::size_t i) const { return first + step * static_cast<double>(i); }
};

/// The spectra of lamps here: 380 to 780 nm in steps of 5, as in the tables of CIE 15.
inline constexpr double k_first = 380;
inline constexpr double k_last = 780;
inline constexpr double k_step = 5;

/// A blackbody, relative to 100 at 560 nm: Planck's law with c2 = 1.4388e-2 m K.
spectrum blackbody(double kelvin);
/// CIE standard illuminant A: the blackbody of 2848 K with c2 = 1.435e-2 m K, by ISO 11664-2.
spectrum illuminant_a();
/// A phase of daylight, relative to 100 at 560 nm: CIE 15:2004, from 4000 to 25000 K.
spectrum daylight(double kelvin);
/// The correlated color temperature behind the name of a daylight illuminant: 6504 K for 6500. Planck's
/// second constant has changed since they got their names.
double daylight_kelvin(double nominal);
/// CIE illuminant E.
spectrum equal_energy();

/// Tristimulus values of a light source for the CIE 1931 observer, scaled to Y = 100 (CIE 15:2004, 7.1).
xyz light_tristimulus(const spectrum& light);
/// Those of a reflecting material in that light, relative to Y = 1 of the perfect reflecting diffuser, over
/// the wavelengths of `reflectance`, which have to be among the light's.
xyz material_tristimulus(const spectrum& reflectance, const spectrum& light);

}  // namespace examples
