#include "bench/unit_costs.h"

#include <algorithm>
#include <limits>
#include <memory>
#include <stdexcept>
#include <string>

#include "V2/Vrl.h"
#include "bench/document.h"
#include "bench/race.h"
#include "runtime/as_text.h"

namespace bench {
namespace {

constexpr int k_samples = 7;

/// Makes the compiler believe that somebody looks at `value`.
template <class T>
void look_at(const T& value) {
    asm volatile("" : : "r"(&value) : "memory");
}

/// Nanoseconds that one of `count` calls takes, by the best of a few samples.
template <class Task>
double nanoseconds(int count, Task&& task) {
    double best = std::numeric_limits<double>::infinity();
    for (int sample = 0; sample < k_samples; ++sample) {
        best = std::min(best, seconds([&] {
                            for (int i = 0; i < count; ++i) task(i);
                        }));
    }
    return best / count * 1e9;
}

class meter {
public:
    explicit meter(table& results) : m_results(results) {}

    template <class Task>
    void measure(const char* what, int count, Task&& task) {
        m_results.add_figure("unit cost", what, nanoseconds(count, task), "ns", 1, {});
    }

private:
    table& m_results;
};

void measure_values(meter& by) {
    vrl_v2::ReflectancePointType point;
    by.measure("set a double", 1000000, [&](int i) { look_at(point.set_Wavelength(1.0 + i)); });
    by.measure("get a double", 1000000, [&](int) { look_at(point.get_Wavelength()); });

    const std::wstring wide = L"Measured patch 12345";
    const std::string narrow = "Measured patch 12345";
    std::wstring to_wide;
    std::string to_narrow;
    by.measure("20 characters, UTF-8 to wide", 1000000,
               [&](int) { look_at(qbxV2::convert(&to_wide, narrow)); });
    by.measure("20 characters, wide to UTF-8", 1000000,
               [&](int) { look_at(qbxV2::convert(&to_narrow, wide)); });
    by.measure("20 characters, wide to escaped UTF-8", 1000000, [&](int) {
        to_narrow.clear();
        qbxV2::append_escaped(to_narrow, wide);
        look_at(to_narrow);
    });

    const std::string moment = "2024-03-01T08:00:00Z";
    qbxV2::c_datetime when;
    by.measure("check a date and time", 1000000, [&](int) { look_at(qbxV2::c_datetime::is_valid(moment)); });
    by.measure("parse a date and time", 1000000, [&](int) {
        when = qbxV2::c_datetime(moment);
        look_at(when);
    });
    by.measure("print a date and time", 200000, [&](int) { look_at(when.get_as_string()); });
}

/// The first color of a palette, as it comes out of reading.
std::unique_ptr<vrl_v2::Vrl> load(const document& input) {
    auto whole = std::make_unique<vrl_v2::Vrl>();
    if (whole->unmarshal(input.bytes) != qbxV2::EQBX_NO_ERROR) throw std::runtime_error(input.name);
    return whole;
}

void measure_model(meter& by, const vrl_v2::ColorType& spectral, const vrl_v2::ColorType& brief) {
    by.measure("construct and free a ColorType", 1000000, [](int) { look_at(vrl_v2::ColorType()); });
    by.measure("copy and free a ColorType, Lab and sRGB", 100000,
               [&](int) { look_at(vrl_v2::ColorType(brief)); });
    by.measure("copy and free a ColorType, spectral", 20000,
               [&](int) { look_at(vrl_v2::ColorType(spectral)); });

    const vrl_v2::ColorSpaceType& lab = brief.get_ColorSpace(0).get_ColorSpaceCIELab();
    const vrl_v2::ColorSpaceType& spectrum = spectral.get_ColorSpace(0).get_ColorSpaceSpectral();
    by.measure("clone and free a ColorSpaceCIELabType", 100000,
               [&](int) { look_at(std::unique_ptr<vrl_v2::ColorSpaceType>(lab.clone())); });
    by.measure("clone and free a ColorSpaceSpectralType", 20000,
               [&](int) { look_at(std::unique_ptr<vrl_v2::ColorSpaceType>(spectrum.clone())); });
}

}  // namespace

void measure_unit_costs(const document& spectral, const document& brief, table& results) {
    meter by(results);
    measure_values(by);
    const auto spectra = load(spectral);
    const auto records = load(brief);
    measure_model(by, spectra->get_Palette(0).get_ColorSet(0).get_Color(0),
                  records->get_Palette(0).get_ColorSet(0).get_Color(0));
}

}  // namespace bench
