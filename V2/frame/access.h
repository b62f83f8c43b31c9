#pragma once

#include <string>

#include "V2/frame/storage.h"
#include "runtime/xml_reader.h"
#include "runtime/xml_writer.h"

namespace vrl_v2::frame {

/// The one friend of every class: hands the steps that are protected there to the frame.
struct access {
    template <class T, class Steps>
    static constexpr Steps steps_of() {
        return Steps{
            [](void* self, qbxV2::c_xml_reader& reader, const std::string& name, qbxV2::eqbx_error* error) {
                return static_cast<T*>(self)->T::unmarshal_attributes(reader, name, error);
            },
            [](void* self, qbxV2::c_xml_reader& reader) {
                return static_cast<T*>(self)->T::unmarshal_attributes_check(reader);
            },
            [](void* self, qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
               bool has_content) { return body(static_cast<T*>(self), reader, name, error, has_content, 0); },
            [](const void* self) { return is_nil(static_cast<const T*>(self), 0); }};
    }

    template <class T>
    static auto is_nil(const T* self, int) -> decltype(self->m_nil) {
        return self->m_nil;
    }
    template <class T>
    static bool is_nil(const T*, long) {
        return false;
    }

    template <class T>
    static void make_room(T& mine, const T& other) {
        mine.T::make_room_for(other);
    }
    template <class T>
    static void exchange(T& mine, T& other) noexcept {
        mine.T::exchange(other);
    }

    template <class T>
    static void marshal_attributes(const T& self, qbxV2::c_xml_writer& out) {
        self.T::marshal_attributes(out);
    }
    template <class T>
    static qbxV2::eqbx_error marshal_content(const T& self, qbxV2::c_xml_writer& out) {
        return self.T::marshal_child_elements(out);
    }

private:
    /// Only a class with text and no children is told whether there is any.
    template <class T>
    static auto body(T* self, qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                     bool has_content, int)
        -> decltype(self->T::unmarshal_body(reader, name, error, has_content)) {
        return self->T::unmarshal_body(reader, name, error, has_content);
    }
    template <class T>
    static bool body(T* self, qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error, bool,
                     long) {
        return self->T::unmarshal_body(reader, name, error);
    }
};

template <class T>
void make_room(T& mine, const T& other) {
    access::make_room(mine, other);
}

template <class T>
void exchange(T& mine, T& other) noexcept {
    access::exchange(mine, other);
}

}  // namespace vrl_v2::frame
