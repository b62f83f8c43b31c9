#pragma once

#include <string>

/// One element as text, taken apart and changed by somebody else's XML library.
namespace vrl_driver {

class element_surgery {
public:
    /// An element that uses the prefixes "Vrl" and "xsi" without declaring them.
    explicit element_surgery(const std::string& xml);
    element_surgery(const element_surgery&) = delete;
    element_surgery& operator=(const element_surgery&) = delete;
    ~element_surgery();

    bool has_elements() const;
    bool has_child(const std::string& local_name) const;
    void remove_children(const std::string& local_name);
    void set_child_text(const std::string& local_name, const std::string& text);
    void set_attribute(const std::string& name, const std::string& text);
    void remove_attribute(const std::string& name);
    void set_text(const std::string& text);
    void remove_content();
    std::string xml() const;

private:
    struct tree;
    tree* m_tree;
};

}  // namespace vrl_driver
