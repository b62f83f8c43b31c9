#pragma once

#include <cstddef>
#include <string>

#include "V2/format.h"
#include "V2/frame/reading.h"
#include "V2/frame/storage.h"
#include "runtime/xml_writer.h"

/// Substitution groups: one of a family of elements, told by its name, or under the head element by
/// `xsi:type`.
namespace vrl_v2::frame {

template <class Head, class T>
Head* make() {
    return new T();
}

/// One class of a family, by its identity.
template <class Head>
struct family_member {
    const char* const* id;
    Head* (*make)();
};

template <class Head, std::size_t n>
Head* make_by_name(const family_member<Head> (&family)[n], int ns_id, const std::string& type_name) {
    if (ns_id != k_document_namespace_id) return nullptr;
    for (const family_member<Head>& member : family) {
        if (*member.id != nullptr && type_name == *member.id) return member.make();
    }
    return nullptr;
}

/// One element of a group; its number is the state of a group that holds it. The head element itself makes
/// nothing: what it holds says its class.
template <class Head>
struct group_member {
    const char* element_name;
    Head* (*make)();
};

/// Whether the reader stands on an element of the group. If not, its event is what it was.
bool is_group_member(qbxV2::c_xml_reader& reader, const qbxV2::s_event_map* first,
                     const qbxV2::s_event_map* last);

template <std::size_t n>
bool is_group_member(qbxV2::c_xml_reader& reader, const qbxV2::s_event_map (&names)[n]) {
    return is_group_member(reader, names, names + n);
}

/// The steps of reading a group's element that don't depend on its family.
class group_reader : public reporting {
public:
    template <std::size_t n>
    group_reader(qbxV2::c_xml_reader& reader, std::string* name, eqbx_error* error, const char* source,
                 const qbxV2::s_event_map (&names)[n])
        : reporting(reader, error, source), m_name(name), m_first(names), m_last(names + n) {}

    /// The number of the current element in the group, or -1.
    int which();
    /// False where the element does not say its type.
    bool named_type(int* ns_id, std::string* type_name) { return m_reader.get_xsi_type(ns_id, type_name); }
    /// Ends the reading past the error handler: an object of unknown class cannot be recovered.
    bool unknown_type() {
        stop(qbxV2::EQBX_UNKNOWN_XSI_TYPE);
        return false;
    }
    template <class Head>
    bool read(Head& object, int line = __builtin_LINE()) {
        const eqbx_error failed = object.unmarshal(m_reader, *m_name);
        if (failed != qbxV2::EQBX_NO_ERROR) {
            stop(failed);
            return false;
        }
        return advance(line);
    }
    /// Passes over an element that is none of the group's.
    bool skip(int line = __builtin_LINE());

private:
    bool advance(int line);

    std::string* m_name;
    const qbxV2::s_event_map* m_first;
    const qbxV2::s_event_map* m_last;
};

template <class Head, std::size_t n>
bool unmarshal_group(held<Head>& group, const group_member<Head> (&members)[n],
                     const qbxV2::s_event_map (&names)[n], qbxV2::c_xml_reader& reader, std::string* name,
                     eqbx_error* error, const char* source) {
    group_reader in(reader, name, error, source, names);
    const int number = in.which();
    if (number < 0) {
        group.release();
        return in.skip();
    }
    Head* object = nullptr;
    if (members[number].make != nullptr) {
        object = members[number].make();
    } else {
        int ns_id = 0;
        std::string type_name;
        if (in.named_type(&ns_id, &type_name)) object = Head::factory(ns_id, type_name);
        if (object == nullptr) return in.unknown_type();
    }
    group.adopt(number, object);
    return in.read(*object);
}

/// Writes what the group holds under its element's name. Under the head element the object has to tell a
/// class of its own, so the head's identity is what the reader would expect.
template <class Head, std::size_t n>
eqbx_error marshal_group(const held<Head>& group, const group_member<Head> (&members)[n], const char* name,
                         qbxV2::c_xml_writer& out, const char* source, int line = __builtin_LINE()) {
    if (group.object() == nullptr) return out.handle_error(qbxV2::EQBX_BAD_CHOICE, name, source, line);
    const group_member<Head>& member = members[group.state()];
    if (member.make == nullptr) out.set_expected_class_identity(Head::id);
    return group.object()->marshal(out, member.element_name);
}

}  // namespace vrl_v2::frame
