#pragma once

#include <V2/Vrl.h>
#include <runtime/values.h>

#include <string>

#include "examples/colorimetry.h"

/// Steps that all the documents have in common.
namespace examples {

/// Throws std::runtime_error with the text of a code that is not success: a figure that the format refuses is
/// a mistake in the source that gives it.
void must(qbxV2::eqbx_error result);

/// The date of everything: the documents have to come out alike on every day.
qbxV2::c_datetime made_on();

template <class Record>
void date(Record& record) {
    must(record.append_ChangeHistory(made_on()));
}

/// Fills the header of a new document.
vrl_v2::Header& describe(vrl_v2::Vrl& document, const std::wstring& name, const std::wstring& purpose);

vrl_v2::PaletteType& add_palette(vrl_v2::Vrl& document, const std::wstring& name);
vrl_v2::ColorSetType& add_color_set(vrl_v2::PaletteType& palette, const std::wstring& name);
vrl_v2::ColorType& add_color(vrl_v2::ColorSetType& set, const std::wstring& name);

/// Appends a value to a color, such as
/// `add_space<vrl_v2::ColorSpaceCMYKType>(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceCMYK)`.
template <class Space>
Space& add_space(vrl_v2::ColorType& color, Space& (vrl_v2::sg_ColorSpace::*member)()) {
    must(color.append_ColorSpace());
    Space& space = (color.back_ColorSpace().*member)();
    date(space);
    return space;
}

/// Values with four decimals, whose specification is nil: the collection says how they were obtained.
void add_lab(vrl_v2::ColorType& color, const lab& value);
void add_lch(vrl_v2::ColorType& color, const lch& value);
/// For materials, whose tristimulus values the format takes from 0 to 1.
void add_xyz(vrl_v2::ColorType& color, const xyz& value);
/// For light, whose tristimulus values have no upper bound.
vrl_v2::ColorSpaceEmissiveCIEXYZType& add_xyz_of_light(vrl_v2::ColorType& color, const xyz& value);
void add_cmyk(vrl_v2::ColorType& color, double cyan, double magenta, double yellow, double black);

/// Appends a function that its element names by `xsi:type` alone. An object of the derived class gets under
/// that element by reading only, so the measurement, which has to be complete, is written, extended and read
/// back.
void add_function_by_type(vrl_v2::Measurement& measurement, const std::string& type,
                          const std::string& content);

/// The first part of a specification, for a measurement without filters.
template <class Specification>
void measured_unfiltered(Specification& conditions) {
    must(conditions.get_DeviceFilter().set_DeviceFilter(L"Filter_None"));
    must(conditions.get_DevicePolarization().set_DevicePolarization(false));
    date(conditions);
}

/// The first part of a specification, for values that no device measured.
template <class Specification>
void computed(Specification& conditions) {
    conditions.get_DeviceFilter().setnil_DeviceFilter();
    conditions.get_DevicePolarization().setnil_DevicePolarization();
    date(conditions);
}

/// The light and the observer of tristimulus values.
template <class Specification>
void seen_under(Specification& conditions, const std::wstring& illuminant) {
    must(conditions.get_IlluminationOptions().get_Illuminant().set_Illuminant(illuminant));
    must(conditions.set_FieldOfView(L"FieldOfView_2_Degree"));
}

}  // namespace examples
