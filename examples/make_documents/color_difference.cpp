#include "examples/make_documents/color_difference.h"

#include <cmath>

namespace examples {
namespace {

const double k_degree = std::acos(-1.0) / 180;

double chroma(const lab& color) { return std::hypot(color.a, color.b); }

double square(double x) { return x * x; }

/// Delta H*ab, squared: what is left of the difference when lightness and chroma are taken away. Rounding can
/// make it a trace less than nothing.
double hue_difference_squared(const lab& p, const lab& q) {
    return std::fmax(0, square(p.a - q.a) + square(p.b - q.b) - square(chroma(p) - chroma(q)));
}

double degrees_of(double a, double b) {
    if (a == 0 && b == 0) return 0;
    const double angle = std::atan2(b, a) / k_degree;
    return angle < 0 ? angle + 360 : angle;
}

/// The difference of two hues on the shorter way around, -180 to 180; 0 where a color has none.
double turned(double from, double to, double chroma_product) {
    if (chroma_product == 0) return 0;
    const double difference = to - from;
    if (difference > 180) return difference - 360;
    return difference < -180 ? difference + 360 : difference;
}

/// The mean of two hues on the shorter way around.
double mean_hue(double h1, double h2, double chroma_product) {
    if (chroma_product == 0) return h1 + h2;
    if (std::abs(h1 - h2) <= 180) return (h1 + h2) / 2;
    return h1 + h2 < 360 ? (h1 + h2 + 360) / 2 : (h1 + h2 - 360) / 2;
}

double seventh_power_share(double c) {
    return std::sqrt(std::pow(c, 7) / (std::pow(c, 7) + std::pow(25.0, 7)));
}

/// The function T of CIEDE2000: the weight of hue goes up and down around the circle.
double hue_weight(double hue) {
    return 1 - 0.17 * std::cos((hue - 30) * k_degree) + 0.24 * std::cos(2 * hue * k_degree) +
           0.32 * std::cos((3 * hue + 6) * k_degree) - 0.20 * std::cos((4 * hue - 63) * k_degree);
}

}  // namespace

double delta_e_1976(const lab& standard, const lab& sample) {
    return std::sqrt(square(standard.l - sample.l) + square(standard.a - sample.a) +
                     square(standard.b - sample.b));
}

double delta_e_1994(const lab& standard, const lab& sample, double kl, double kc, double kh) {
    const double c = chroma(standard);
    const double dl = (standard.l - sample.l) / kl;
    const double dc = (c - chroma(sample)) / (kc * (1 + 0.045 * c));
    const double dh2 = hue_difference_squared(standard, sample) / square(kh * (1 + 0.015 * c));
    return std::sqrt(dl * dl + dc * dc + dh2);
}

double delta_e_2000(const lab& standard, const lab& sample, double kl, double kc, double kh) {
    const double g = 0.5 * (1 - seventh_power_share((chroma(standard) + chroma(sample)) / 2));
    const double a1 = (1 + g) * standard.a;
    const double a2 = (1 + g) * sample.a;
    const double c1 = std::hypot(a1, standard.b);
    const double c2 = std::hypot(a2, sample.b);
    const double h1 = degrees_of(a1, standard.b);
    const double h2 = degrees_of(a2, sample.b);
    const double mean_l = (standard.l + sample.l) / 2;
    const double mean_c = (c1 + c2) / 2;
    const double mean_h = mean_hue(h1, h2, c1 * c2);

    const double sl = 1 + 0.015 * square(mean_l - 50) / std::sqrt(20 + square(mean_l - 50));
    const double sc = 1 + 0.045 * mean_c;
    const double sh = 1 + 0.015 * mean_c * hue_weight(mean_h);
    const double turn = 60 * std::exp(-square((mean_h - 275) / 25)) * k_degree;
    const double rt = -2 * seventh_power_share(mean_c) * std::sin(turn);

    const double dl = (sample.l - standard.l) / (kl * sl);
    const double dc = (c2 - c1) / (kc * sc);
    const double dh = 2 * std::sqrt(c1 * c2) * std::sin(turned(h1, h2, c1 * c2) / 2 * k_degree) / (kh * sh);
    return std::sqrt(dl * dl + dc * dc + dh * dh + rt * dc * dh);
}

double delta_e_cmc(const lab& standard, const lab& sample, double l, double c) {
    const double c1 = chroma(standard);
    const double h1 = degrees_of(standard.a, standard.b);
    const double f = std::sqrt(std::pow(c1, 4) / (std::pow(c1, 4) + 1900));
    const double t = h1 >= 164 && h1 <= 345 ? 0.56 + std::abs(0.2 * std::cos((h1 + 168) * k_degree))
                                            : 0.36 + std::abs(0.4 * std::cos((h1 + 35) * k_degree));
    const double sl = standard.l < 16 ? 0.511 : 0.040975 * standard.l / (1 + 0.01765 * standard.l);
    const double sc = 0.0638 * c1 / (1 + 0.0131 * c1) + 0.638;
    const double sh = sc * (f * t + 1 - f);
    const double dl = (standard.l - sample.l) / (l * sl);
    const double dc = (c1 - chroma(sample)) / (c * sc);
    return std::sqrt(dl * dl + dc * dc + hue_difference_squared(standard, sample) / square(sh));
}

}  // namespace examples
