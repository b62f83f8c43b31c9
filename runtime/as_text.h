#pragma once

#include <iosfwd>
#include <string>

#include "platform/api.h"

namespace qbxV2 {

class c_binary;

/// What each wrapper below has: a reference to a value, built on the spot to select a stream operator. The
/// value must outlive the expression.
template <typename T>
class ct_as_text {
public:
    explicit ct_as_text(const T& value) : m_value(&value) {}
    const T& get() const { return *m_value; }

private:
    const T* m_value;
};

/// The text form of XML documents.
template <typename T>
class c_as_xml : public ct_as_text<T> {
public:
    explicit c_as_xml(const T& value) : ct_as_text<T>(value) {}
};

/// ASCII as it is, "." for every other UTF-16 unit.
template <typename T>
class c_as_ascii : public ct_as_text<T> {
public:
    explicit c_as_ascii(const T& value) : ct_as_text<T>(value) {}
};

/// Bytes as they are, but for the characters that markup needs.
template <typename T>
class c_as_escaped : public ct_as_text<T> {
public:
    explicit c_as_escaped(const T& value) : ct_as_text<T>(value) {}
};

/// RFC 4648, section 4, with no line breaks.
template <typename T>
class c_as_base64 : public ct_as_text<T> {
public:
    explicit c_as_base64(const T& value) : ct_as_text<T>(value) {}
};

/// Two upper-case hexadecimal digits a byte.
template <typename T>
class c_as_hex : public ct_as_text<T> {
public:
    explicit c_as_hex(const T& value) : ct_as_text<T>(value) {}
};

/// "1" or "0".
template <typename T>
class c_as_bool_digit : public ct_as_text<T> {
public:
    explicit c_as_bool_digit(const T& value) : ct_as_text<T>(value) {}
};

/// "true" or "false".
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_xml<bool>& text);
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_bool_digit<bool>& text);

/// "NaN", "INF", "-INF", "0.0", "-0.0", or the stream's own output with 7 (float) or 14 (double) significant
/// digits; precision and format flags of the stream are afterwards as before.
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_xml<float>& text);
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_xml<double>& text);

/// UTF-8 as `append_escaped` makes it.
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_xml<std::wstring>& text);
/// The narrow text is taken to be in the system's 8-bit code page, then as wide text.
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_xml<std::string>& text);
/// An element above 0xFFFF stands for two units and gives two points.
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_ascii<std::wstring>& text);
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_escaped<std::string>& text);

VRL_API std::ostream& operator<<(std::ostream& os, const c_as_base64<c_binary>& text);
/// The stream's fill character is "0" afterwards.
VRL_API std::ostream& operator<<(std::ostream& os, const c_as_hex<c_binary>& text);

/// Appends `text` as UTF-8 with `"`, `'`, `&` and `<` as entity references; one routine for attributes and
/// bodies. The text ends, without an error, at a high surrogate that has no low one behind it: the rest is
/// dropped. A low surrogate by itself gives three bytes; an element above 0xFFFF is the one character that it
/// is.
VRL_API void append_escaped(std::string& out, const std::wstring& text);

/// Appends the bytes of `text` with the same four references; nothing is decoded.
VRL_API void append_escaped(std::string& out, const std::string& text);

}  // namespace qbxV2
