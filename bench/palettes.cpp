#include <cmath>
#include <cstdint>
#include <stdexcept>

#include "V2/Vrl.h"
#include "bench/document.h"

namespace bench {
namespace {

using namespace vrl_v2;
using qbxV2::c_datetime;
using qbxV2::eqbx_error;

constexpr unsigned k_colors_a_set = 1000;
constexpr unsigned k_first_wavelength = 380;  // nm
constexpr unsigned k_last_wavelength = 730;
constexpr unsigned k_wavelength_step = 10;

void need(eqbx_error result) {
    if (result != qbxV2::EQBX_NO_ERROR)
        throw std::runtime_error("a value was refused while making a document");
}

/// The same numbers in every run and on every machine (the generator of Numerical Recipes, 7.1).
class numbers {
public:
    /// From `low` to `high`, with `digits` digits behind the point as an instrument reports them.
    double next(double low, double high, int digits) {
        m_state = m_state * 1664525U + 1013904223U;
        const double scale = std::pow(10.0, digits);
        return std::round((low + (high - low) * (m_state / 4294967296.0)) * scale) / scale;
    }

private:
    std::uint32_t m_state = 1;
};

c_datetime moment(unsigned i) {
    c_datetime when("2024-03-01T08:00:00Z");
    when.set_hours(8 + i / 3600 % 12);
    when.set_mins(i / 60 % 60);
    when.set_secs(static_cast<float>(i % 60));
    return when;
}

void fill_device(DeviceType& device) {
    need(device.set_Manufacturer(L"Instruments & Sons"));
    need(device.set_Model(L"Spectro 45/0"));
    need(device.set_SerialNumber(L"004711"));
    need(device.set_DeviceClass(L"DeviceClass_Spot"));
    need(device.set_FirmwareVersion(L"2.18"));
    need(device.get_CalibrationState().set_CalibrationStateType(L"CalibrationState_Calibrated"));
    need(device.get_CalibrationState().set_CalibrationDateTime(moment(0)));
    DeviceSettings& settings = device.get_DeviceSettings();
    need(settings.set_Aperture(4));
    need(settings.get_Averaging().set_Averaging(true));
    need(settings.get_Averaging().set_AveragingValue(3));
}

void fill_specification(ColorSpaceSpecificationSpectrumSpectral& conditions, unsigned i) {
    fill_device(conditions.get_Device());
    need(conditions.get_DeviceFilter().set_DeviceFilter(L"Filter_None"));
    need(conditions.get_DevicePolarization().set_DevicePolarization(false));
    need(conditions.append_ChangeHistory(moment(i)));
    need(conditions.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    need(conditions.get_GeometryChoice().set_Angle(45.0));
    need(conditions.set_ASTM_Table(L"E308_Table5"));
}

/// No more than must be there. Not nil, the shortest form: the typed peer cannot read that.
void fill_specification(ColorSpaceSpecificationSpectrumTristimulus& conditions, unsigned i) {
    need(conditions.get_DeviceFilter().set_DeviceFilter(L"Filter_None"));
    need(conditions.get_DevicePolarization().set_DevicePolarization(false));
    need(conditions.append_ChangeHistory(moment(i)));
    need(conditions.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    need(conditions.get_IlluminationOptions().get_Illuminant().set_Illuminant(L"Illuminant_D50"));
    need(conditions.set_FieldOfView(L"FieldOfView_2_Degree"));
}

void name_color(ColorType& color, unsigned i) {
    const std::wstring number = std::to_wstring(100000 + i);
    need(color.set_ColorName(L"Measured patch " + number));
    need(color.set_UniqueID(L"patch-" + number));
    need(color.append_ChangeHistory(moment(i)));
}

void fill_spectral_color(ColorType& color, unsigned i, numbers& measured) {
    name_color(color, i);
    need(color.append_ColorSpace());
    ColorSpaceSpectralType& space = color.back_ColorSpace().get_ColorSpaceSpectral();
    need(space.append_ChangeHistory(moment(i)));
    fill_specification(space.get_ColorSpaceSpecificationSpectrumSpectral(), i);
    for (unsigned nm = k_first_wavelength; nm <= k_last_wavelength; nm += k_wavelength_step) {
        need(space.append_ReflectancePoint());
        need(space.back_ReflectancePoint().set_Wavelength(nm));
        need(space.back_ReflectancePoint().set_ReflectancePointType(measured.next(0.02, 0.95, 5)));
    }
}

void fill_short_color(ColorType& color, unsigned i, numbers& measured) {
    name_color(color, i);
    need(color.append_ColorSpace());
    ColorSpaceCIELabType& lab = color.back_ColorSpace().get_ColorSpaceCIELab();
    need(lab.append_ChangeHistory(moment(i)));
    fill_specification(lab.get_ColorSpaceSpecificationSpectrumTristimulus(), i);
    need(lab.set_L(measured.next(5.0, 98.0, 2)));
    need(lab.set_A(measured.next(-80.0, 80.0, 2)));
    need(lab.set_B(measured.next(-80.0, 80.0, 2)));

    need(color.append_ColorSpace());
    ColorSpaceSRGBType& screen = color.back_ColorSpace().get_ColorSpaceSRGB();
    need(screen.append_ChangeHistory(moment(i)));
    fill_specification(screen.get_ColorSpaceSpecificationSpectrumTristimulus(), i);
    need(screen.set_Red(measured.next(0.0, 1.0, 4)));
    need(screen.set_Green(measured.next(0.0, 1.0, 4)));
    need(screen.set_Blue(measured.next(0.0, 1.0, 4)));
    need(screen.set_ColorDepth(L"ColorDepth_8"));
}

void fill_header(Vrl& palette) {
    Header& header = palette.get_Preamble().get_Header();
    need(header.set_Creator(L"vrl_bench"));
    need(header.set_CreatorVersion(L"1"));
    need(header.append_ChangeHistory(moment(0)));
    need(header.set_Purpose(L"Measuring speed and memory"));
}

ColorSetType& append_color_set(PaletteType& palette) {
    need(palette.append_ColorSet());
    ColorSetType& set = palette.back_ColorSet();
    need(set.set_ColorSetName(L"Set " + std::to_wstring(palette.size_ColorSet())));
    need(set.append_ChangeHistory(moment(0)));
    return set;
}

using color_maker = void (*)(ColorType&, unsigned, numbers&);

void fill_palette(Vrl& whole, unsigned colors, color_maker fill) {
    fill_header(whole);
    need(whole.append_Palette());
    PaletteType& palette = whole.back_Palette();
    need(palette.set_PaletteName(L"Palette"));
    need(palette.append_ChangeHistory(moment(0)));
    numbers measured;
    for (unsigned i = 0; i < colors; ++i) {
        ColorSetType& set = i % k_colors_a_set == 0 ? append_color_set(palette) : palette.back_ColorSet();
        need(set.append_Color());
        fill(set.back_Color(), i, measured);
    }
}

document write_palette(const std::string& path, const std::string& name, unsigned colors, color_maker fill) {
    Vrl whole;
    fill_palette(whole, colors, fill);
    std::wstring wide_path;
    need(whole.writeFile(qbxV2::convert(&wide_path, path)));
    return read_document(name, path);
}

document make_palette(const std::string& folder, const std::string& name, std::size_t size,
                      color_maker fill) {
    constexpr unsigned few = 100;
    std::string path = folder;
    path.append("/").append(name).append(".vrl");
    const std::size_t size_of_few = write_palette(path, name, few, fill).bytes.size();
    return write_palette(path, name, static_cast<unsigned>(size * few / size_of_few), fill);
}

}  // namespace

document make_spectral_palette(const std::string& folder, const std::string& name, std::size_t size) {
    return make_palette(folder, name, size, fill_spectral_color);
}

document make_short_palette(const std::string& folder, const std::string& name, std::size_t size) {
    return make_palette(folder, name, size, fill_short_color);
}

}  // namespace bench
