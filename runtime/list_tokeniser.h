#pragma once

#include <cstddef>
#include <string>

#include "platform/api.h"

namespace qbxV2 {

/// Cuts the value of an XML Schema list at white space. Works on a copy of the value.
class VRL_API c_xml_list_tokeniser {
public:
    explicit c_xml_list_tokeniser(const std::string& value) : m_value(value) {}
    /// Starts over with another value.
    void set(const std::string& value);
    /// Replaces `*item` with the next item. False at the end, with `*item` unchanged.
    bool get(std::string* item);

private:
    std::string m_value;
    std::size_t m_cursor = 0;
};

}  // namespace qbxV2
