#pragma once

#include <sstream>
#include <string>

#include "runtime/namespaces.h"
#include "runtime/writer.h"

/// Writers for the tests of writers.
namespace vrl_test {

inline constexpr qbxV2::s_ns_map k_map[] = {{1000, "a", "urn:a"}, {0, nullptr, nullptr}};

/// A writer on a text of its own.
struct trial {
    std::ostringstream os;
    qbxV2::c_xml_writer out{os, "\t", "\n"};

    trial() { out.conditionally_select_ns_map(k_map); }
    std::string attributes(bool include_xsi = true) {
        os.str("");
        out.conditionally_write_ns_attrs(include_xsi);
        return os.str();
    }
};

/// Asks for everything through its own hooks.
class asking_writer : public qbxV2::c_xml_writer {
public:
    explicit asking_writer(std::ostream& os) : qbxV2::c_xml_writer(os, "\t", "\n"), m_stream(os) {}
    void nest() override { m_stream << "."; }
    const char* endl() override {
        ++ends;
        return "|";
    }
    int ends = 0;

private:
    std::ostream& m_stream;
};

}  // namespace vrl_test
