#pragma once

#include <V2/Vrl.h>

#include "examples/make_documents/building.h"

/// The parts of the document that uses every element and attribute of the format. Their values are free
/// examples; each lies within its range.
namespace examples {

/// A record's own attribute, with a text for its value.
template <class Record>
void add_custom_attribute(Record& record) {
    must(record.append_CustomAttribute());
    must(record.back_CustomAttribute().set_Name(L"Season"));
    must(record.back_CustomAttribute().get_ValueChoice().set_StringValue(L"spring"));
}

void fill_owner(vrl_v2::OwnerType& owner);
void fill_device(vrl_v2::DeviceType& device);

/// All six specifications.
void fill_collection(vrl_v2::CollectionColorSpaceSpecificationType& collection);

/// One value in each of the color spaces.
void add_every_color_space(vrl_v2::ColorType& color);

/// A color without anything that could be left out.
void fill_plain(vrl_v2::ColorType& color, const std::wstring& name);

/// Colors, each on one of the substrates.
void add_every_substrate(vrl_v2::ColorSetType& set);

/// All functions, tolerances, and both kinds of sample.
void add_quality_control(vrl_v2::Vrl& document);

}  // namespace examples
