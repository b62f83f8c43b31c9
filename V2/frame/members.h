#pragma once

#include "V2/frame/access.h"
#include "V2/frame/limits.h"
#include "V2/frame/storage.h"

/// What the accessors, the copy constructors and the cardinality tests of all classes do.
namespace vrl_v2::frame {

/// Checks, then stores. A refused value leaves value and presence as they were.
template <class T, class Limits>
eqbx_error set(single<T>& member, const T& value, const Limits& limits) {
    const eqbx_error refused = limits.check(value);
    if (refused != qbxV2::EQBX_NO_ERROR) return refused;
    member.value = value;
    member.set = true;
    return qbxV2::EQBX_NO_ERROR;
}

/// Intended: overwriting behind the end appends, and no facet is looked at in a list.
template <class T>
eqbx_error set(list<T>& member, unsigned i, const T& value) {
    if (i < member.size()) {
        member.reach(i) = value;
    } else {
        member.append(value);
    }
    return qbxV2::EQBX_NO_ERROR;
}

/// Copies go the way of the accessors. A required value is set from the source's storage whatever its
/// presence there: one that fails its facet is left behind, one that passes becomes present.
template <class T, class Limits>
void copy_required(single<T>& member, const single<T>& source, const Limits& limits) {
    set(member, source.value, limits);
}

template <class T, class Limits>
void copy_optional(single<T>& member, const single<T>& source, const Limits& limits) {
    if (source.set) set(member, source.value, limits);
}

/// Intended: the copy of a required object is present even where the source's was not.
template <class T>
void copy_required(child<T>& member, const child<T>& source) {
    member.assign(source.get());
}

template <class T>
void copy_optional(child<T>& member, const child<T>& source) {
    if (source.is_set()) member.assign(source.get());
}

/// A required choice or group has to be present and to have made its choice.
template <class T>
bool has_chosen(const child<T>& member) {
    return member.is_set() && member.get().is_occurs_ok();
}

/// Whole or not at all: whatever has to be allocated for it is there before the first member moves.
template <class T>
void swap_whole(T& a, T& b) {
    make_room(a, b);
    make_room(b, a);
    exchange(a, b);
}

template <class T>
void assign_by_swap(T& target, const T& source) {
    T copy(source);
    target.swap(copy);
}

template <class T>
void reset_by_swap(T& target) {
    T fresh;
    target.swap(fresh);
}

}  // namespace vrl_v2::frame
