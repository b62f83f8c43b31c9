#pragma once

#include <string>
#include <utility>
#include <vector>

#include "tests/driver/model_driver.h"

namespace vrl_driver {

/// An object of any class of the model, with the class's description.
class any_object {
public:
    explicit any_object(const class_description& c) : m_class(&c), m_object(c.create()) {}
    any_object(const class_description& c, void* object) : m_class(&c), m_object(object) {}
    any_object(any_object&& other) noexcept
        : m_class(other.m_class), m_object(std::exchange(other.m_object, nullptr)) {}
    any_object(const any_object& other) = delete;
    any_object& operator=(const any_object& other) = delete;
    ~any_object() {
        if (m_object != nullptr) m_class->destroy(m_object);
    }

    any_object copy() const { return {*m_class, m_class->copy(m_object)}; }
    const class_description& kind() const { return *m_class; }
    void* get() const { return m_object; }

private:
    const class_description* m_class;
    void* m_object;
};

/// A member together with the part of an object that declares it.
struct placed_member {
    const member* m;
    void* self;
    const class_description* owner;
};

/// All members of an object, the bases' first.
std::vector<placed_member> members_of(const class_description& c, void* self);

/// How much of an object `fill` fills.
struct filling {
    unsigned variant = 0;      ///< which of several legal values, options and group members
    unsigned full_levels = 2;  ///< below so many levels, optional members stay absent
    unsigned entries = 2;      ///< of each list
};

/// A legal text for a simple member.
std::string legal_text(const member& m, unsigned variant);

/// Fills an object with legal values: all members, or where `how.full_levels` is 0 the required ones.
void fill(const class_description& c, void* self, const filling& how);
any_object filled(const class_description& c, const filling& how);

/// Everything that an object holds, as text: presence, values, choices, nil flags, entries. Two objects with
/// the same text are equal.
std::string contents(const class_description& c, const void* self);
std::string contents(const any_object& object);

/// The object written as an element of its own name; the code of writing.
struct written {
    eqbx_error code;
    std::string xml;
};
written write(const any_object& object);

/// Reads an element into an object: the namespaces are known without being declared in the text.
eqbx_error read(const any_object& object, const std::string& xml);

}  // namespace vrl_driver
