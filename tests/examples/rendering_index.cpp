#include "tests/examples/rendering_index.h"

#include <cmath>
#include <utility>

namespace vrl_test {
namespace {

using examples::spectrum;
using examples::xyz;

/// CIE 1960 UCS coordinates.
struct ucs {
    double u, v;
};

ucs to_ucs(const xyz& color) {
    const double sum = color.x + 15 * color.y + 3 * color.z;
    return {4 * color.x / sum, 6 * color.y / sum};
}

double distance_squared(const ucs& p, const ucs& q) {
    return (p.u - q.u) * (p.u - q.u) + (p.v - q.v) * (p.v - q.v);
}

/// The temperature of the blackbody nearest to a chromaticity: a search by thirds on the logarithm.
double color_temperature(const ucs& wanted) {
    double low = std::log(1500.0);
    double high = std::log(25000.0);
    const auto distance = [&](double logarithm) {
        return distance_squared(to_ucs(examples::light_tristimulus(examples::blackbody(std::exp(logarithm)))),
                                wanted);
    };
    while (high - low > 1e-5) {
        const double third = (high - low) / 3;
        if (distance(low + third) < distance(high - third)) {
            high -= third;
        } else {
            low += third;
        }
    }
    return std::exp((low + high) / 2);
}

/// The quantities c and d of the adaptation by von Kries.
std::pair<double, double> adaptation(const ucs& p) {
    return {(4 - p.u - 10 * p.v) / p.v, (1.708 * p.v + 0.404 - 1.481 * p.u) / p.v};
}

ucs adapted(const ucs& sample, const ucs& from, const ucs& to) {
    const auto [c_from, d_from] = adaptation(from);
    const auto [c_to, d_to] = adaptation(to);
    const auto [c, d] = adaptation(sample);
    const double cr = c_to / c_from * c;
    const double dr = d_to / d_from * d;
    const double divisor = 16.518 + 1.481 * cr - dr;
    return {(10.872 + 0.404 * cr - 4 * dr) / divisor, 5.520 / divisor};
}

/// CIE 1964 U*V*W*, where 1 in Y is 100 in the formula.
struct uvw {
    double u, v, w;
};

uvw to_uvw(const ucs& sample, double y, const ucs& white) {
    const double w = 25 * std::cbrt(100 * y) - 17;
    return {13 * w * (sample.u - white.u), 13 * w * (sample.v - white.v), w};
}

double special_rendering_index(const spectrum& sample, const spectrum& lamp, const spectrum& reference) {
    const ucs lamp_white = to_ucs(examples::light_tristimulus(lamp));
    const ucs white = to_ucs(examples::light_tristimulus(reference));
    const xyz under_lamp = examples::material_tristimulus(sample, lamp);
    const xyz under_reference = examples::material_tristimulus(sample, reference);
    const uvw p = to_uvw(adapted(to_ucs(under_lamp), lamp_white, white), under_lamp.y, white);
    const uvw q = to_uvw(to_ucs(under_reference), under_reference.y, white);
    return 100 -
           4.6 * std::sqrt((p.u - q.u) * (p.u - q.u) + (p.v - q.v) * (p.v - q.v) + (p.w - q.w) * (p.w - q.w));
}

}  // namespace

double general_rendering_index(const spectrum& lamp, const std::vector<spectrum>& test_colors) {
    const double kelvin = color_temperature(to_ucs(examples::light_tristimulus(lamp)));
    const spectrum reference = kelvin < 5000 ? examples::blackbody(kelvin) : examples::daylight(kelvin);
    double sum = 0;
    for (std::size_t i = 0; i < 8; ++i) sum += special_rendering_index(test_colors[i], lamp, reference);
    return sum / 8;
}

}  // namespace vrl_test
