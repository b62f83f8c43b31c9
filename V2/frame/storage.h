#pragma once

#include <cstddef>
#include <type_traits>
#include <utility>
#include <vector>

/// How a class of the model keeps its members. Everything that owns does so alone: a copy is deep, and
/// nothing is shared between two objects.
namespace vrl_v2::frame {

// The two steps of swapping objects of a class; access.h has what they do.

/// Lets `mine` have storage for every object that `other` has, all the way down.
template <class T>
void make_room(T& mine, const T& other);
/// Exchanges two objects that have room for each other.
template <class T>
void exchange(T& mine, T& other) noexcept;

/// What a const getter answers where nothing has been stored yet: one default object a type, for ever.
template <class T>
const T& absent() {
    static const T* const object = new T();
    return *object;
}

/// A simple value and whether it is present. Leaving the presence flag behind keeps the value in storage.
template <class T>
struct single {
    T value{};
    bool set = false;

    void swap(single& other) {
        using std::swap;
        swap(value, other.value);
        swap(set, other.set);
    }
};

/// One object of a class of the model, and whether it is present.
///
/// The object stands at one address from its first mutable use until the owner dies; what would be the
/// size of a whole specification in every color space that has none is one pointer until then.
template <class T>
class child {
public:
    child() = default;
    child(const child&) = delete;
    child& operator=(const child&) = delete;
    ~child() { delete m_object; }

    bool is_set() const { return m_set; }
    void unset() { m_set = false; }
    void mark_set() { m_set = true; }

    const T& get() const { return m_object != nullptr ? *m_object : absent<T>(); }

    /// Asking for a mutable reference makes the member present.
    T& get() {
        T& object = storage();
        m_set = true;
        return object;
    }

    /// The object without a change of presence.
    T& storage() {
        if (m_object == nullptr) m_object = new T();
        return *m_object;
    }

    T& assign(const T& value) {
        T copy(value);
        storage().swap(copy);
        return get();
    }

    void make_room_for(const child& other) {
        if (other.m_object != nullptr) make_room(storage(), *other.m_object);
    }
    /// Exchanges contents, so that a reference to either object stays with its owner.
    void exchange(child& other) noexcept {
        if (this == &other) return;
        if (m_object != nullptr) frame::exchange(*m_object, *other.m_object);
        std::swap(m_set, other.m_set);
    }

private:
    T* m_object = nullptr;
    bool m_set = false;
};

/// A repeated member: owned entries, each at an address of its own for as long as it lives.
template <class T>
class list {
public:
    list() = default;
    list(const list&) = delete;
    list& operator=(const list&) = delete;
    ~list() { clear(); }

    bool empty() const { return m_entries.empty(); }
    unsigned size() const { return static_cast<unsigned>(m_entries.size()); }
    auto begin() const { return m_entries.begin(); }
    auto end() const { return m_entries.end(); }

    /// Behind the end: the default object, since there is no entry to refer to.
    const T& get(unsigned i) const { return i < size() ? *m_entries[i] : absent<T>(); }

    /// Grows the list with default entries until there is an entry `i`.
    T& reach(unsigned i) {
        while (size() <= i) append();
        return *m_entries[i];
    }

    T& append() { return adopt_last(new T()); }
    T& append(const T& value) { return adopt_last(new T(value)); }
    T& insert(unsigned i) { return adopt(i, new T()); }
    T& insert(unsigned i, const T& value) { return adopt(i, new T(value)); }

    /// An empty list gets its first entry: there has to be one to refer to.
    T& back() { return m_entries.empty() ? append() : *m_entries.back(); }

    void erase(unsigned i) {
        if (i >= size()) return;
        delete m_entries[i];
        m_entries.erase(m_entries.begin() + static_cast<std::ptrdiff_t>(i));
    }

    void clear() {
        while (!m_entries.empty()) {
            delete m_entries.back();
            m_entries.pop_back();
        }
    }

    void swap(list& other) {
        if (this != &other) m_entries.swap(other.m_entries);
    }

    void copy_from(const list& other) {
        m_entries.reserve(other.m_entries.size());
        for (const T* entry : other.m_entries) append(*entry);
    }

private:
    T& adopt_last(T* entry) {
        try {
            m_entries.push_back(entry);
        } catch (...) {
            delete entry;
            throw;
        }
        return *entry;
    }

    T& adopt(std::size_t i, T* entry) {
        const auto place = m_entries.begin() + static_cast<std::ptrdiff_t>(i < size() ? i : size());
        try {
            m_entries.insert(place, entry);
        } catch (...) {
            delete entry;
            throw;
        }
        return *entry;
    }

    std::vector<T*> m_entries;
};

/// The storage of one option of a choice: a number inline, everything else on the heap while it is chosen.
template <class T, bool inline_value = std::is_arithmetic<T>::value>
class option {
public:
    option() = default;
    option(const option&) = delete;
    option& operator=(const option&) = delete;
    ~option() { release(); }

    const T& get() const { return m_object != nullptr ? *m_object : absent<T>(); }
    T& get() {
        if (m_object == nullptr) m_object = new T();
        return *m_object;
    }
    void release() {
        delete m_object;
        m_object = nullptr;
    }
    void swap(option& other) { std::swap(m_object, other.m_object); }

private:
    T* m_object = nullptr;
};

template <class T>
class option<T, true> {
public:
    const T& get() const { return m_value; }
    T& get() { return m_value; }
    void release() { m_value = T(); }
    void swap(option& other) { std::swap(m_value, other.m_value); }

private:
    T m_value{};
};

/// The one object of a substitution group, held through the head type, and which member it is.
template <class Head>
class held {
public:
    explicit held(int none) : m_none(none), m_state(none) {}
    held(const held&) = delete;
    held& operator=(const held&) = delete;
    ~held() { delete m_object; }

    int state() const { return m_state; }
    bool is_none() const { return m_state == m_none; }
    const Head* object() const { return m_object; }

    /// The object if it is in `state`; else the default object of the type asked for.
    template <class T>
    const T& as(int state) const {
        return m_state == state && m_object != nullptr ? static_cast<const T&>(*m_object) : absent<T>();
    }

    /// The object in `state`: made new where another one is held.
    template <class T>
    T& become(int state) {
        if (m_state != state || m_object == nullptr) adopt(state, new T());
        return static_cast<T&>(*m_object);
    }

    template <class T>
    T& assign(int state, const T& value) {
        T copy(value);
        T& mine = become<T>(state);
        mine.swap(copy);
        return mine;
    }

    void adopt(int state, Head* object) {
        release();
        m_object = object;
        m_state = state;
    }

    void release() {
        delete m_object;
        m_object = nullptr;
        m_state = m_none;
    }

    /// The whole object: what stands under a head element keeps the class that it has.
    void copy_from(const held& other) {
        if (other.m_object != nullptr) adopt(other.m_state, other.m_object->clone());
    }

    void swap(held& other) {
        std::swap(m_state, other.m_state);
        std::swap(m_object, other.m_object);
    }

private:
    int m_none;
    int m_state;
    Head* m_object = nullptr;
};

struct access;

}  // namespace vrl_v2::frame
