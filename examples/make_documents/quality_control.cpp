#include <string>
#include <vector>

#include "examples/make_documents/building.h"
#include "examples/make_documents/color_difference.h"
#include "examples/make_documents/documents.h"

namespace examples {
namespace {

/// Sharma, Wu and Dalal, "The CIEDE2000 color-difference formula", Color Research and Application 30 (2005),
/// table 1: pairs 21 to 24 (one standard, four samples that differ from it by 1.0000) and pair 16.
constexpr lab k_standard{50, 2.5, 0};
const std::vector<lab> k_samples = {
    {50, 3.1736, 0.5854}, {50, 3.2972, 0}, {50, 1.8634, 0.5757}, {50, 3.2592, 0.3350}, {50, 0, -2.5}};

void add_instrument(vrl_v2::DeviceType& device) {
    must(device.set_Manufacturer(L"any"));
    must(device.set_Model(L"spectrophotometer, 45/0"));
    must(device.set_SerialNumber(L"0001"));
    must(device.set_DeviceClass(L"DeviceClass_Spot"));
    vrl_v2::CalibrationStateType& state = device.get_CalibrationState();
    must(state.set_CalibrationStateType(L"CalibrationState_Calibrated"));
    must(state.set_CalibrationDateTime(made_on()));
    must(device.get_DeviceSettings().get_Averaging().set_AveragingValue(3));
    must(device.get_DeviceSettings().get_Averaging().set_Averaging(true));
}

void add_measured(vrl_v2::ColorType& color, const std::wstring& name, const lab& value) {
    must(color.set_ColorName(name));
    date(color);
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceCIELab);
    auto& conditions = space.get_ColorSpaceSpecificationSpectrumTristimulus();
    measured_unfiltered(conditions);
    must(conditions.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    seen_under(conditions, L"Illuminant_D65");
    must(conditions.get_GeometryChoice().set_Angle(45));
    must(space.set_L(value.l));
    must(space.set_A(value.a));
    must(space.set_B(value.b));
}

// The weights of the three formulas, as graphic arts and textiles use them.

void weigh(vrl_v2::FunctionDE94Type& function) {
    must(function.set_Param_l(1));
    must(function.set_Param_c(1));
    must(function.set_Param_h(1));
}

void weigh(vrl_v2::FunctionDE2000Type& function) {
    must(function.set_Param_l(1));
    must(function.set_Param_c(1));
    must(function.set_Param_h(1));
}

void weigh(vrl_v2::FunctionDEcmcType& function) {
    must(function.set_Param_l(2));
    must(function.set_Param_c(1));
}

vrl_v2::sg_Function& add_function(vrl_v2::Measurement& measurement) {
    must(measurement.append_Function());
    return measurement.back_Function();
}

void add_differences(vrl_v2::Measurement& measurement, const lab& sample) {
    must(add_function(measurement).get_FunctionDE().set_Result(rounded(delta_e_1976(k_standard, sample), 4)));
    vrl_v2::FunctionDE94Type& de94 = add_function(measurement).get_FunctionDE94();
    weigh(de94);
    must(de94.set_Result(rounded(delta_e_1994(k_standard, sample, 1, 1, 1), 4)));
    vrl_v2::FunctionDE2000Type& de2000 = add_function(measurement).get_FunctionDE2000();
    weigh(de2000);
    must(de2000.set_Result(rounded(delta_e_2000(k_standard, sample, 1, 1, 1), 4)));
    vrl_v2::FunctionDEcmcType& cmc = add_function(measurement).get_FunctionDECMC();
    weigh(cmc);
    must(cmc.set_Result(rounded(delta_e_cmc(k_standard, sample, 2, 1), 4)));
}

template <class Function>
void add_tolerance(vrl_v2::ToleranceType& tolerance, const std::wstring& name,
                   Function& (vrl_v2::sg_Function::*member)(), double limit) {
    must(tolerance.set_Name(name));
    weigh((tolerance.get_Function().*member)());
    must(tolerance.get_Limits().set_HighTolerance(limit));
    must(tolerance.set_PrimaryIlluminant(L"Illuminant_D65"));
    must(tolerance.set_FieldOfView(L"FieldOfView_2_Degree"));
}

void add_standard(vrl_v2::Standard& standard) {
    add_instrument(standard.get_Device());
    add_measured(standard.get_Color(), L"standard", k_standard);
    // 1 is where a difference begins to be seen.
    must(standard.append_Tolerance());
    add_tolerance(standard.back_Tolerance(), L"CIE94", &vrl_v2::sg_Function::get_FunctionDE94, 1);
    must(standard.append_Tolerance());
    add_tolerance(standard.back_Tolerance(), L"CIEDE2000", &vrl_v2::sg_Function::get_FunctionDE2000, 1);
    must(standard.append_Tolerance());
    add_tolerance(standard.back_Tolerance(), L"CMC 2:1", &vrl_v2::sg_Function::get_FunctionDECMC, 1);
}

void add_measurements(vrl_v2::StandardAndMeasurementType& pair) {
    double sum = 0;
    for (std::size_t i = 0; i < k_samples.size(); ++i) {
        must(pair.append_Measurement());
        vrl_v2::Measurement& measurement = pair.back_Measurement();
        add_instrument(measurement.get_Device());
        add_measured(measurement.get_Color(), L"sample " + std::to_wstring(i + 1), k_samples[i]);
        add_differences(measurement, k_samples[i]);
        sum += delta_e_1976(k_standard, k_samples[i]);
    }
    const double mean = rounded(sum / static_cast<double>(k_samples.size()), 4);
    add_function_by_type(pair.back_Measurement(), "FunctionMeanDEType",
                         "<Vrl:Result>" + std::to_string(mean) + "</Vrl:Result>");
}

void add_physical_sample(vrl_v2::PhysicalSampleType& physical) {
    must(physical.set_Coating(L"matte varnish"));
    must(physical.get_Process().set_Name(L"drawdown"));
    must(physical.get_Process().set_Thickness(50));
    vrl_v2::SampleSpotType& spot = physical.get_Sample().get_SampleSpot();
    must(spot.get_Substrate().get_SubstratePaper().set_PaperType(L"contrast card"));
    must(spot.set_Backing(L"Backing_White"));
    must(spot.set_ProductionDate(made_on()));
    must(spot.get_Specification().set_SampleWidth(40));
    must(spot.get_Specification().set_SampleHeight(40));
}

}  // namespace

vrl_v2::Vrl quality_control() {
    vrl_v2::Vrl document;
    describe(document, L"Quality control", L"A standard, five samples and three tolerances")
        .set_Comments(
            L"Lab: Sharma, Wu and Dalal 2005, table 1. Thickness in micrometers, sizes in "
            L"millimeters.");
    must(document.append_ColorQualityControl());
    vrl_v2::ColorQualityControlType& record = document.back_ColorQualityControl();
    must(record.set_Name(L"Drawdowns of a pale red"));
    must(record.set_Description(L"Four samples at CIEDE2000 = 1.0000, and one beyond the tolerance"));
    date(record);
    must(record.append_StandardAndMeasurement());
    add_standard(record.back_StandardAndMeasurement().get_Standard());
    add_measurements(record.back_StandardAndMeasurement());
    add_physical_sample(record.get_PhysicalSample());
    must(record.append_Tolerance());
    add_tolerance(record.back_Tolerance(), L"any part of the job", &vrl_v2::sg_Function::get_FunctionDE2000,
                  2);
    return document;
}

}  // namespace examples
