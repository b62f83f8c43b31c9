#pragma once

#include <string>

#include "platform/api.h"

namespace qbxV2 {

/// An element of any name kept as text: the URI of its namespace, its name, and the element itself as XML.
/// All UTF-8.
class VRL_API c_any_info {
public:
    c_any_info() = default;
    explicit c_any_info(const std::string& uri, const std::string& name = std::string(),
                        const std::string& value = std::string())
        : m_namespace(uri), m_name(name), m_value(value) {}

    const std::string& get_namespace() const { return m_namespace; }
    void set_namespace(const std::string& uri) { m_namespace = uri; }
    const std::string& get_name() const { return m_name; }
    void set_name(const std::string& name) { m_name = name; }
    const std::string& get_value() const { return m_value; }
    void set_value(const std::string& value) { m_value = value; }

private:
    std::string m_namespace;
    std::string m_name;
    std::string m_value;
};

}  // namespace qbxV2
