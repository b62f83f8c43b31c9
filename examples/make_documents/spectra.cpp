#include "examples/make_documents/spectra.h"

#include <array>
#include <cmath>

#include "examples/make_documents/cie_tables.h"

namespace examples {
namespace {

constexpr std::size_t k_points = 1 + static_cast<std::size_t>((k_last - k_first) / k_step);

double planck(double nanometers, double kelvin, double c2) {
    const double meters = nanometers * 1e-9;
    return std::pow(meters, -5) / (std::exp(c2 / (meters * kelvin)) - 1);
}

spectrum planck_spectrum(double kelvin, double c2) {
    spectrum light{k_first, k_step, std::vector<double>(k_points)};
    for (std::size_t i = 0; i < k_points; ++i) {
        light.values[i] = 100 * planck(light.wavelength(i), kelvin, c2) / planck(560, kelvin, c2);
    }
    return light;
}

/// A component of daylight at the points of a lamp's spectrum: its table has steps of 10 nm, between which it
/// is linear.
double component(const std::array<double, 3>* rows, std::size_t i, std::size_t which) {
    const std::size_t row = i / 2;
    if (i % 2 == 0) return rows[row][which];
    return (rows[row][which] + rows[row + 1][which]) / 2;
}

/// The chromaticity coordinate x of a phase of daylight, by CIE 15:2004.
double daylight_x(double kelvin) {
    const double t = 1e3 / kelvin;
    if (kelvin <= 7000) return ((-4.6070 * t + 2.9678) * t + 0.09911) * t + 0.244063;
    return ((-2.0064 * t + 1.9018) * t + 0.24748) * t + 0.237040;
}

std::size_t index_of(const spectrum& light, double wavelength) {
    return static_cast<std::size_t>(std::lround((wavelength - light.first) / light.step));
}

}  // namespace

spectrum blackbody(double kelvin) { return planck_spectrum(kelvin, 1.4388e-2); }

spectrum illuminant_a() { return planck_spectrum(2848, 1.435e-2); }

spectrum daylight(double kelvin) {
    const double x = daylight_x(kelvin);
    const double y = (-3.0 * x + 2.870) * x - 0.275;
    const double m = 0.0241 + 0.2562 * x - 0.7341 * y;
    // CIE 15:2004 has the two factors rounded to three decimals, and its tables come from these.
    const double m1 = rounded((-1.3515 - 1.7703 * x + 5.9114 * y) / m, 3);
    const double m2 = rounded((0.0300 - 31.4424 * x + 30.0717 * y) / m, 3);
    spectrum light{k_first, k_step, std::vector<double>(k_points)};
    for (std::size_t i = 0; i < k_points; ++i) {
        light.values[i] = component(k_daylight_components, i, 0) +
                          m1 * component(k_daylight_components, i, 1) +
                          m2 * component(k_daylight_components, i, 2);
    }
    return light;
}

double daylight_kelvin(double nominal) { return nominal * 1.4388 / 1.4380; }

spectrum equal_energy() { return {k_first, k_step, std::vector<double>(k_points, 100.0)}; }

xyz light_tristimulus(const spectrum& light) {
    xyz sum{0, 0, 0};
    for (std::size_t i = 0; i < light.values.size(); ++i) {
        const std::array<double, 3>& observer =
            k_observer[static_cast<std::size_t>(std::lround((light.wavelength(i) - k_first) / k_step))];
        sum.x += light.values[i] * observer[0];
        sum.y += light.values[i] * observer[1];
        sum.z += light.values[i] * observer[2];
    }
    return {100 * sum.x / sum.y, 100, 100 * sum.z / sum.y};
}

xyz material_tristimulus(const spectrum& reflectance, const spectrum& light) {
    xyz sum{0, 0, 0};
    double white = 0;
    for (std::size_t i = 0; i < reflectance.values.size(); ++i) {
        const std::size_t row = index_of(light, reflectance.wavelength(i));
        const double power = light.values[row];
        white += power * k_observer[row][1];
        sum.x += power * k_observer[row][0] * reflectance.values[i];
        sum.y += power * k_observer[row][1] * reflectance.values[i];
        sum.z += power * k_observer[row][2] * reflectance.values[i];
    }
    return {sum.x / white, sum.y / white, sum.z / white};
}

}  // namespace examples
