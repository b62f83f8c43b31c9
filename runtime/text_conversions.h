#pragma once

#include <cstddef>
#include <string>

#include "platform/api.h"

namespace qbxV2 {

/// 0.0. A function of the library, so that dividing by it happens at run time.
VRL_API double float_zero();

/// Between narrow text (UTF-8) and wide text (one element a UTF-16 unit, on every system).
///
/// Errors   never reported: a bad text yields what could be converted.
/// Cost     one pass, at most one allocation; ASCII is moved in runs. Any thread.
/// Source   RFC 3629 for the byte forms, RFC 2781 for surrogates.

/// Replaces `*out` by `in` as UTF-8, with no escaping, and returns `*out`.
/// A high surrogate with a low one behind it becomes one character. With anything else behind it, it is
/// encoded by itself in three bytes and the element behind it is lost; in last place it is kept too.
/// An element of 0 gives no byte. An element above 0xFFFF is taken as the one character that it is.
VRL_API std::string& convert(std::string* out, const std::wstring& in);

/// As `vtostring` below, into `*out`.
VRL_API std::wstring& convert(std::wstring* out, const std::string& in);

/// Replaces `out` by `in` as UTF-16 units and returns `out`. Conversion ends, keeping what it has, at a byte
/// that begins no sequence, at a sequence cut off or broken, and at a high surrogate (in three-byte form)
/// with no low one behind it, which is dropped. Overlong forms are taken.
VRL_API std::wstring& vtostring(std::wstring& out, const std::string& in);
/// The same for the `size` bytes at `in`, which need no terminator.
VRL_API std::wstring& vtostring(std::wstring& out, const char* in, std::size_t size);

/// Empties `out`, then copies `in`: called with one object for both it leaves that object empty.
VRL_API std::string& vtostring(std::string& out, const std::string& in);

/// A qualified name: a local part (narrow or wide) and the URI of its namespace.
template <typename T>
class ct_qname {
public:
    ct_qname() = default;

    const T& get_local_part() const { return m_local_part; }
    void set_local_part(const T& local_part) { m_local_part = local_part; }
    const std::string& get_namespace() const { return m_namespace; }
    void set_namespace(const std::string& uri) { m_namespace = uri; }

private:
    T m_local_part;
    std::string m_namespace;
};

/// Stores a qualified name in the form that `out` has: as the name stands in the document (`qualified`), or
/// as namespace and local part. Wide parts go through `vtostring`. `out` must not be null.
VRL_API void make_qname(std::string* out, const std::string& qualified, const std::string& uri,
                        const std::string& local_part);
VRL_API void make_qname(std::wstring* out, const std::string& qualified, const std::string& uri,
                        const std::string& local_part);
VRL_API void make_qname(ct_qname<std::string>* out, const std::string& qualified, const std::string& uri,
                        const std::string& local_part);
VRL_API void make_qname(ct_qname<std::wstring>* out, const std::string& qualified, const std::string& uri,
                        const std::string& local_part);

}  // namespace qbxV2
