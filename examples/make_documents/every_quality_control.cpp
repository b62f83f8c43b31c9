#include "examples/make_documents/every_part.h"

namespace examples {
namespace {

using group = vrl_v2::sg_Function;

vrl_v2::sg_Substrate& add_substrate(vrl_v2::ColorSetType& set, const std::wstring& name) {
    vrl_v2::ColorType& color = add_color(set, name);
    add_lab(color, {52, -3, -39});
    return color.get_Substrate();
}

template <class Function>
Function& add_function(vrl_v2::Measurement& measurement, Function& (group::*member)(), double result) {
    must(measurement.append_Function());
    Function& function = (measurement.back_Function().*member)();
    must(function.set_Result(result));
    return function;
}

void add_differences(vrl_v2::Measurement& measurement) {
    add_custom_attribute(add_function(measurement, &group::get_FunctionDE, 1.0));
    add_function(measurement, &group::get_FunctionMeanDE, 1.1);
    auto& de94 = add_function(measurement, &group::get_FunctionDE94, 0.9);
    must(de94.set_Param_l(1));
    must(de94.set_Param_c(1));
    must(de94.set_Param_h(1));
    auto& de2000 = add_function(measurement, &group::get_FunctionDE2000, 0.8);
    must(de2000.set_Param_l(1));
    must(de2000.set_Param_c(1));
    must(de2000.set_Param_h(1));
    auto& cmc = add_function(measurement, &group::get_FunctionDECMC, 0.7);
    must(cmc.set_Param_l(2));
    must(cmc.set_Param_c(1));
    auto& generic = add_function(measurement, &group::get_FunctionGeneric, 0.6);
    must(generic.set_Name(L"DIN99o"));
    must(generic.append_Parameters());
    must(generic.back_Parameters().set_Name(L"kE"));
    must(generic.back_Parameters().get_ValueChoice().set_Double(1));
    must(generic.append_Parameters());
    must(generic.back_Parameters().set_Name(L"of"));
    must(generic.back_Parameters().get_ValueChoice().set_String(L"DIN 6176"));
}

void add_deviations(vrl_v2::Measurement& measurement) {
    add_function(measurement, &group::get_FunctionStdDevX, 0.01);
    add_function(measurement, &group::get_FunctionStdDevY, 0.01);
    add_function(measurement, &group::get_FunctionStdDevZ, 0.02);
    add_function(measurement, &group::get_FunctionStdDevL, 0.1);
    add_function(measurement, &group::get_FunctionStdDevA, 0.2);
    add_function(measurement, &group::get_FunctionStdDevB, 0.2);
    add_function(measurement, &group::get_FunctionStdDevC, 0.3);
    add_function(measurement, &group::get_FunctionStdDevH, 0.4);
    add_function(measurement, &group::get_FunctionAverageStdDevL, 0.1);
    add_function(measurement, &group::get_FunctionAverageStdDevA, 0.2);
    add_function(measurement, &group::get_FunctionAverageStdDevB, 0.2);
}

void fill(vrl_v2::ToleranceType& tolerance) {
    must(tolerance.set_Name(L"under three lights"));
    add_custom_attribute(tolerance);
    tolerance.get_Function().get_FunctionDE();
    vrl_v2::LimitsType& limits = tolerance.get_Limits();
    add_custom_attribute(limits);
    must(limits.set_HighTolerance(2));
    must(limits.set_LowTolerance(0));
    must(tolerance.set_PrimaryIlluminant(L"Illuminant_D65"));
    must(tolerance.set_SecondaryIlluminant(L"Illuminant_A"));
    must(tolerance.set_TertiaryIlluminant(L"Illuminant_F11"));
    must(tolerance.set_FieldOfView(L"FieldOfView_10_Degree"));
}

void fill(vrl_v2::StandardAndMeasurementType& pair) {
    add_custom_attribute(pair);
    must(pair.append_Measurement());
    vrl_v2::Measurement& measurement = pair.back_Measurement();
    add_custom_attribute(measurement);
    fill_device(measurement.get_Device());
    fill_plain(measurement.get_Color(), L"sample");
    add_differences(measurement);
    add_deviations(measurement);
    add_function_by_type(measurement, "FunctionDEType", "");
    vrl_v2::Standard& standard = pair.get_Standard();
    add_custom_attribute(standard);
    fill_device(standard.get_Device());
    fill_plain(standard.get_Color(), L"standard");
    must(standard.append_Tolerance());
    fill(standard.back_Tolerance());
}

template <class Sample>
void fill_sample(Sample& sample) {
    add_custom_attribute(sample);
    must(sample.get_Substrate().get_SubstrateMetal().set_MetalType(L"steel panel"));
    must(sample.set_Backing(L"Backing_Black"));
    must(sample.set_Manufacturer(L"any"));
    must(sample.set_ProductionDate(made_on()));
    must(sample.set_SerialNumber(L"17"));
    must(sample.set_Comment(L"from the middle of the batch"));
}

vrl_v2::PhysicalSampleType& add_record(vrl_v2::Vrl& document, const std::wstring& name) {
    must(document.append_ColorQualityControl());
    vrl_v2::ColorQualityControlType& record = document.back_ColorQualityControl();
    must(record.set_Name(name));
    date(record);
    must(record.append_StandardAndMeasurement());
    return record.get_PhysicalSample();
}

}  // namespace

void add_every_substrate(vrl_v2::ColorSetType& set) {
    vrl_v2::SubstratePaperType& paper = add_substrate(set, L"on paper").get_SubstratePaper();
    add_custom_attribute(paper);
    must(paper.set_PartNumber(L"M 1"));
    fill_plain(paper.get_Color(), L"the paper itself");
    must(paper.set_PaperThickness(0.1));
    must(paper.set_PaperType(L"uncoated"));
    must(add_substrate(set, L"on anything").get_SubstrateGeneric().set_Type(L"plaster"));
    vrl_v2::SubstrateMetalType& metal = add_substrate(set, L"on metal").get_SubstrateMetal();
    must(metal.set_MetalWeight(7.8));
    must(metal.set_MetalType(L"steel"));
    vrl_v2::SubstratePlasticType& plastic = add_substrate(set, L"on plastic").get_SubstratePlastic();
    must(plastic.set_PlasticWeight(0.9));
    must(plastic.set_PlasticType(L"polypropylene"));
    vrl_v2::SubstrateWoodType& wood = add_substrate(set, L"on wood").get_SubstrateWood();
    must(wood.set_WoodWeight(0.7));
    must(wood.set_WoodType(L"oak"));
    vrl_v2::SubstrateVinylType& vinyl = add_substrate(set, L"on vinyl").get_SubstrateVinyl();
    must(vinyl.set_VinylWeight(1.4));
    must(vinyl.set_VinylType(L"siding"));
    vrl_v2::SubstrateTileType& tile = add_substrate(set, L"on tile").get_SubstrateTile();
    must(tile.set_TileWeight(2.3));
    must(tile.set_TileType(L"glazed"));
    vrl_v2::SubstrateFilmType& film = add_substrate(set, L"on film").get_SubstrateFilm();
    must(film.set_FilmWeight(0.05));
    must(film.set_FilmType(L"polyester"));
    vrl_v2::SubstrateTextileType& textile = add_substrate(set, L"on textile").get_SubstrateTextile();
    must(textile.set_TextileWeight(0.15));
    must(textile.set_TextileType(L"linen"));
}

void add_quality_control(vrl_v2::Vrl& document) {
    vrl_v2::PhysicalSampleType& physical = add_record(document, L"Spot");
    add_custom_attribute(physical);
    must(physical.set_Coating(L"two coats"));
    must(physical.get_Process().set_Name(L"spray"));
    must(physical.get_Process().set_Thickness(80));
    vrl_v2::SampleSpotType& spot = physical.get_Sample().get_SampleSpot();
    fill_sample(spot);
    must(spot.get_Specification().set_SampleWidth(100));
    must(spot.get_Specification().set_SampleHeight(150));
    vrl_v2::ColorQualityControlType& record = document.back_ColorQualityControl();
    must(record.set_Description(L"Every function"));
    must(record.set_UniqueID(L"record-1"));
    must(record.set_Comments(L"not a real job"));
    add_custom_attribute(record);
    fill(record.back_StandardAndMeasurement());
    must(record.append_Tolerance());
    fill(record.back_Tolerance());

    vrl_v2::SampleTargetType& target = add_record(document, L"Target").get_Sample().get_SampleTarget();
    fill_sample(target);
    must(target.set_Target(L"Target_Custom"));
    must(target.set_CustomTarget(L"house strip"));
    document.back_ColorQualityControl().back_StandardAndMeasurement().get_Standard().setnil_Standard();
}

}  // namespace examples
