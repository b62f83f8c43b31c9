#include <V2/Vrl.h>

#include <string>
#include <type_traits>
#include <utility>

/// Holds one member of each kind to its published accessors, and to no more: a member that is never absent
/// has nothing that asks or unsets its presence.
namespace {

using namespace vrl_v2;
using qbxV2::c_datetime;
using qbxV2::c_xml_reader;
using qbxV2::c_xml_writer;
using qbxV2::eqbx_error;
using std::string;
using std::wstring;

template <class Signature>
constexpr bool is(Signature) {
    return true;
}

// A type with operations to override.
class caller_space : public ColorSpaceCMYKType {
public:
    const char* getid() const override { return id; }
    bool has_id(const char* identity) const override { return identity == id; }
    eqbx_error marshal(c_xml_writer& out, const char* name) const override {
        return ColorSpaceCMYKType::marshal(out, name);
    }
    eqbx_error unmarshal(c_xml_reader& reader, const string& name) override {
        return ColorSpaceCMYKType::unmarshal(reader, name);
    }
};
static_assert(!std::is_abstract_v<caller_space>);
static_assert(is<ColorSpaceType* (*)(int, const string&)>(&ColorSpaceType::factory));

// Simple values: required, optional, with an enumeration, repeated.
static_assert(is<double (ColorSpaceCMYKType::*)() const>(&ColorSpaceCMYKType::get_Black));
static_assert(is<eqbx_error (ColorSpaceCMYKType::*)(double)>(&ColorSpaceCMYKType::set_Black));
static_assert(is<eqbx_error (ColorType::*)(const wstring&)>(&ColorType::set_Comments));
static_assert(is<bool (ColorType::*)() const>(&ColorType::isset_Comments));
static_assert(is<void (ColorType::*)()>(&ColorType::unset_Comments));
static_assert(
    is<SpectrumType::Eenum_SpectrumType (SpectrumType::*)() const>(&SpectrumType::getenum_SpectrumType));
static_assert(
    is<bool (SpectrumType::*)(SpectrumType::Eenum_SpectrumType)>(&SpectrumType::setenum_SpectrumType));
static_assert(is<const c_datetime& (Header::*)(unsigned) const>(&Header::get_ChangeHistory));
static_assert(is<eqbx_error (Header::*)(const c_datetime&)>(&Header::append_ChangeHistory));
static_assert(is<eqbx_error (Header::*)(unsigned, const c_datetime&)>(&Header::insert_ChangeHistory));

// Objects: required, repeated, of a group.
static_assert(is<const Preamble& (Vrl::*)() const>(&Vrl::get_Preamble));
static_assert(is<Preamble& (Vrl::*)()>(&Vrl::get_Preamble));
static_assert(is<Preamble& (Vrl::*)(const Preamble&)>(&Vrl::assign_Preamble));
static_assert(is<const ColorType& (Vrl::*)(unsigned) const>(&Vrl::get_Color));
static_assert(is<ColorType& (Vrl::*)(unsigned)>(&Vrl::get_Color));
static_assert(is<ColorType& (Vrl::*)()>(&Vrl::back_Color));
static_assert(is<eqbx_error (Vrl::*)()>(&Vrl::append_Color));
static_assert(is<SampleSpotType& (sg_Sample::*)()>(&sg_Sample::get_SampleSpot));
static_assert(is<SampleSpotType& (sg_Sample::*)(const SampleSpotType&)>(&sg_Sample::assign_SampleSpot));

// Choices, nil, raw text.
static_assert(is<ValueChoice::eqbx_chosen (ValueChoice::*)() const>(&ValueChoice::getchosen));
static_assert(is<eqbx_error (ValueChoice::*)(double)>(&ValueChoice::set_Double));
static_assert(is<bool (Standard::*)() const>(&Standard::isnil_Standard));
static_assert(is<void (Standard::*)()>(&Standard::setnil_Standard));
static_assert(is<eqbx_error (Revision::*)(const string&)>(&Revision::append_any));

// Documents, whole and by element.
static_assert(is<eqbx_error (Vrl::*)(const wstring&)>(&Vrl::loadFile));
static_assert(is<eqbx_error (Vrl::*)(const wstring&) const>(&Vrl::writeFile));
static_assert(is<XMLDocumentResult (Vrl::*)() const>(&Vrl::writeString));
static_assert(is<eqbx_error (SubstratePaper::*)(std::ostream&) const>(&SubstratePaper::marshal));
static_assert(is<eqbx_error (SubstratePaper::*)(string*) const>(&SubstratePaper::marshal));
static_assert(is<eqbx_error (SubstratePaper::*)(const char*) const>(&SubstratePaper::marshal));
static_assert(is<eqbx_error (SubstratePaper::*)(const char*, unsigned)>(&SubstratePaper::unmarshal));
static_assert(std::is_constructible_v<SubstratePaper, const char*, eqbx_error*> &&
              std::is_constructible_v<SubstratePaper, const string&, eqbx_error*> &&
              std::is_constructible_v<SubstratePaper, const char*, unsigned, eqbx_error*>);

#define LACKS(Class, operation)                                                                     \
    template <class T, class = void>                                                                \
    struct Class##_lacks_##operation : std::true_type {};                                           \
    template <class T>                                                                              \
    struct Class##_lacks_##operation<T, std::void_t<decltype(&T::operation)>> : std::false_type {}; \
    static_assert(Class##_lacks_##operation<Class>::value, #operation)

LACKS(ColorSpaceCMYKType, isset_Black);
LACKS(ColorSpaceCMYKType, unset_Black);
LACKS(Vrl, isset_Preamble);
LACKS(Vrl, isset_Color);
LACKS(ColorSpaceSpecificationType, isset_DeviceFilter);
LACKS(ColorSpaceSpecificationType, unset_DeviceFilter);
LACKS(ValueChoice, isset_Double);
LACKS(sg_Sample, isset_SampleSpot);

}  // namespace
