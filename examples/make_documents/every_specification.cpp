#include "examples/make_documents/every_part.h"

namespace examples {
namespace {

void fill_device_settings(vrl_v2::DeviceSettings& settings) {
    add_custom_attribute(settings);
    must(settings.set_Aperture(4));
    must(settings.set_LensPosition(-1));
    must(settings.set_GlassCompensation(false));
    must(settings.get_GlossCompensation().set_CompensationValue(0.04));
    must(settings.get_GlossCompensation().set_GlossCompensation(true));
    must(settings.get_Averaging().set_AveragingValue(3));
    must(settings.get_Averaging().set_Averaging(true));
    must(settings.set_FleetTuner(true));
}

/// A parameter of each kind: named by one character, as the format wants it.
void add_parameters(vrl_v2::ProfileType& profile) {
    must(profile.append_Parameters());
    must(profile.back_Parameters().set_Name(L"g"));
    must(profile.back_Parameters().get_ValueChoice().set_DoubleValue(2.2));
    must(profile.append_Parameters());
    must(profile.back_Parameters().set_Name(L"i"));
    must(profile.back_Parameters().get_ValueChoice().set_IntegerValue(1));
    must(profile.append_Parameters());
    must(profile.back_Parameters().set_Name(L"t"));
    must(profile.back_Parameters().get_ValueChoice().set_StringValue(L"perceptual"));
}

/// A profile in the document itself.
void fill_embedded(vrl_v2::ProfileType& profile) {
    const unsigned char beginning[] = {'a', 'c', 's', 'p'};  // the mark of an ICC profile, not a whole one
    must(profile.set_Direction(L"Profile_Input"));
    vrl_v2::ProfileFile& file = profile.get_ProfileChoice().get_ProfileFile();
    must(file.set_ProfileName(L"scanner"));
    must(file.set_ProfileFile(qbxV2::c_binary(beginning, sizeof beginning)));
    add_parameters(profile);
    must(profile.set_Created(made_on()));
}

/// A profile that is elsewhere.
void fill_linked(vrl_v2::ProfileType& profile) {
    must(profile.set_Direction(L"Profile_Both"));
    must(profile.get_ProfileChoice().set_ProfileURI(L"https://example.org/profiles/press.icc"));
}

/// What all specifications have, every part of it.
template <class Specification>
void fill_conditions(Specification& conditions) {
    must(conditions.set_Comments(L"as measured"));
    must(conditions.set_UniqueID(L"conditions-1"));
    add_custom_attribute(conditions);
    fill_embedded(conditions.get_Profile());
    fill_device(conditions.get_Device());
    must(conditions.get_DeviceFilter().set_DeviceFilter(L"Filter_Custom"));
    must(conditions.get_DeviceFilter().set_CustomOrPartial(L"420 nm cut-off"));
    must(conditions.get_DevicePolarization().set_DevicePolarization(true));
    date(conditions);
}

template <class Specification>
void fill_emissive(Specification& conditions) {
    computed(conditions);
    must(conditions.set_EmissiveType(L"Emissive_SpotAmbient"));
    must(conditions.set_EmissiveMode(L"EmissiveMode_Diffuser"));
}

/// What the specifications of computed values have alike.
template <class Specification>
void fill_observer(Specification& conditions) {
    must(conditions.set_FieldOfView(L"FieldOfView_10_Degree"));
    must(conditions.set_ASTM_Table(L"E308_Table5"));
    must(conditions.set_Gamma(2.2));
}

void fill(vrl_v2::ColorSpaceSpecificationSpectrumGenericType& conditions) {
    fill_conditions(conditions);
    must(conditions.get_Spectrum().set_SpectrumType(L"Spectrum_Custom"));
    must(conditions.get_Spectrum().set_CustomTypeName(L"fluorescence"));
    must(conditions.get_GeometryChoice().set_SphereGeometry(L"Sphere_Included"));
    vrl_v2::IlluminationOptionsType& light = conditions.get_IlluminationOptions();
    must(light.set_Description(L"the booth of the inspection room"));
    must(light.get_Illuminant().set_Illuminant(L"Illuminant_Custom"));
    must(light.get_Illuminant().set_CustomName(L"booth"));
    fill_observer(conditions);
    must(conditions.set_DensityStatus(L"Status_E"));
}

void fill(vrl_v2::ColorSpaceSpecificationSpectrumSpectralType& conditions) {
    measured_unfiltered(conditions);
    fill_linked(conditions.get_Profile());
    must(conditions.get_Spectrum().set_SpectrumType(L"Spectrum_Transmittance"));
    must(conditions.get_GeometryChoice().set_Angle(8));
    must(conditions.set_ASTM_Table(L"E308_Table6"));
}

void fill(vrl_v2::ColorSpaceSpecificationSpectrumTristimulusType& conditions) {
    measured_unfiltered(conditions);
    must(conditions.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    vrl_v2::WhitePointChromaticity& white = conditions.get_IlluminationOptions().get_WhitePointChromaticity();
    must(white.set_CoordinateX(0.3127));
    must(white.set_CoordinateY(0.3290));
    must(conditions.get_GeometryChoice().set_UnknownGeometry(L"by eye"));
    fill_observer(conditions);
}

void fill(vrl_v2::ColorSpaceSpecificationEmissiveGenericType& conditions) {
    fill_emissive(conditions);
    must(conditions.get_GeometryChoice().set_Angle(0));
    must(conditions.get_IlluminationOptions().set_ColorTemperature(5000));
    fill_observer(conditions);
    must(conditions.set_DensityStatus(L"Status_DIN-NB"));
}

void fill(vrl_v2::ColorSpaceSpecificationEmissiveSpectralType& conditions) {
    fill_emissive(conditions);
    must(conditions.get_GeometryChoice().set_Angle(0));
    must(conditions.set_ASTM_Table(L"E308_Table5"));
}

void fill(vrl_v2::ColorSpaceSpecificationEmissiveTristimulusType& conditions) {
    fill_emissive(conditions);
    must(conditions.get_IlluminationOptions().set_ColorTemperature(9300));
    must(conditions.get_GeometryChoice().set_SphereGeometry(L"Sphere_Excluded"));
    fill_observer(conditions);
}

}  // namespace

void fill_device(vrl_v2::DeviceType& device) {
    add_custom_attribute(device);
    must(device.set_Manufacturer(L"any"));
    must(device.set_Model(L"spectrophotometer"));
    must(device.set_SerialNumber(L"0001"));
    must(device.set_DeviceClass(L"DeviceClass_Scanning"));
    must(device.set_FirmwareVersion(L"1.1"));
    must(device.set_BootFirmwareVersion(L"1.0"));
    must(device.get_CalibrationState().set_CalibrationStateType(L"CalibrationState_Calibrated"));
    must(device.get_CalibrationState().set_CalibrationDateTime(made_on()));
    fill_device_settings(device.get_DeviceSettings());
}

void fill_collection(vrl_v2::CollectionColorSpaceSpecificationType& collection) {
    fill(collection.get_ColorSpaceSpecificationSpectrumGeneric());
    fill(collection.get_ColorSpaceSpecificationSpectrumSpectral());
    fill(collection.get_ColorSpaceSpecificationSpectrumTristimulus());
    fill(collection.get_ColorSpaceSpecificationEmissiveGeneric());
    fill(collection.get_ColorSpaceSpecificationEmissiveSpectral());
    fill(collection.get_ColorSpaceSpecificationEmissiveTristimulus());
}

}  // namespace examples
