#pragma once

#include <cstddef>
#include <string>

#include "V2/frame/access.h"
#include "V2/frame/storage.h"
#include "runtime/values.h"
#include "runtime/xml_writer.h"

/// The writing protocol, once for all classes.
namespace vrl_v2::frame {

using qbxV2::c_xml_writer;
using qbxV2::eqbx_error;

/// The text forms of stored values, as the stream operators of the runtime give them.
void put_value(c_xml_writer& out, double value);
void put_value(c_xml_writer& out, bool value);
void put_value(c_xml_writer& out, int value);
void put_value(c_xml_writer& out, unsigned value);
void put_value(c_xml_writer& out, unsigned char value);
void put_value(c_xml_writer& out, const std::wstring& value);
void put_value(c_xml_writer& out, const qbxV2::c_datetime& value);
void put_value(c_xml_writer& out, const qbxV2::c_binary& value);

/// The attributes of one start tag, in schema order.
class attributes_writer {
public:
    explicit attributes_writer(c_xml_writer& out) : m_out(out) {}

    /// Intended for the one attribute that is written whatever its presence says, too.
    template <std::size_t n, class T>
    void always(const single<T>& member, const char (&name)[n]) {
        m_out.put(" ", 1);
        m_out.put(name, n - 1);
        m_out.put("=\"", 2);
        put_value(m_out, member.value);
        m_out.put("\"", 1);
    }
    template <std::size_t n, class T>
    void if_set(const single<T>& member, const char (&name)[n]) {
        if (member.set) always(member, name);
    }

private:
    c_xml_writer& m_out;
};

/// The children of one element, in schema order. Behind the first failure, every call does nothing.
class children_writer {
public:
    /// `base` is what the base class's content came to.
    explicit children_writer(c_xml_writer& out, eqbx_error base = qbxV2::EQBX_NO_ERROR)
        : m_out(out), m_result(base) {}

    template <std::size_t n, class T>
    void required(const single<T>& member, const char (&name)[n]) {
        value(member.value, name);
    }
    template <std::size_t n, class T>
    void optional(const single<T>& member, const char (&name)[n]) {
        if (member.set) value(member.value, name);
    }
    template <class T>
    void required(const child<T>& member, const char* name) {
        object(member.get(), name);
    }
    template <class T>
    void optional(const child<T>& member, const char* name) {
        if (member.is_set()) object(member.get(), name);
    }
    template <std::size_t n, class T>
    void repeated_values(const list<T>& member, const char (&name)[n]) {
        for (const T* entry : member) value(*entry, name);
    }
    template <class T>
    void repeated(const list<T>& member, const char* name) {
        for (const T* entry : member) object(*entry, name);
    }
    /// A group writes what it holds under that member's own name.
    template <class Group>
    void required_group(const child<Group>& member) {
        group(member.get());
    }
    template <class Group>
    void optional_group(const child<Group>& member) {
        if (member.is_set()) group(member.get());
    }
    template <class Group>
    void groups(const list<Group>& member) {
        for (const Group* entry : member) group(*entry);
    }

    template <std::size_t n, class T>
    void value(const T& stored, const char (&name)[n]) {
        if (m_result != qbxV2::EQBX_NO_ERROR) return;
        m_out.put_indent();
        m_out.put("<", 1);
        m_out.put(name, n - 1);
        m_out.put(">", 1);
        put_value(m_out, stored);
        m_out.put("</", 2);
        m_out.put(name, n - 1);
        m_out.put(">", 1);
        m_out.put_line_end();
    }
    template <class T>
    void object(const T& stored, const char* name) {
        if (m_result == qbxV2::EQBX_NO_ERROR) m_result = stored.marshal(m_out, name);
    }
    /// Well-formed text, as it stands.
    void raw(const std::string& text);

    eqbx_error result() const { return m_result; }

private:
    template <class Group>
    void group(const Group& stored) {
        if (m_result != qbxV2::EQBX_NO_ERROR) return;
        m_result = stored.is_occurs_ok() ? access::marshal_content(stored, m_out)
                                         : qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL;
    }

    c_xml_writer& m_out;
    eqbx_error m_result;
};

}  // namespace vrl_v2::frame
