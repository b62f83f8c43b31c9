#pragma once

#include <gtest/gtest.h>

#include <string>

#include "runtime/reader.h"

namespace reader_on_text {

using namespace qbxV2;

inline constexpr s_ns_map k_ns_map[] = {{1000, "V", "doc"}, {0, nullptr, nullptr}};

/// A reader on a text, with the namespaces of the document format.
struct Reading {
    explicit Reading(const std::string& document) : text(document), source(text), reader(source) {
        reader.set_ns_map(k_ns_map);
    }
    /// Reads the next start tag, attributes and all.
    void start_tag() {
        reader.get_element_event(nullptr, &error, &name);
        EXPECT_EQ(reader.get_current_event(), EQXP_NAME);
        while (reader.get_attribute_event(nullptr, &error, &value)) reader.skip_attribute_value();
    }
    /// Reads the next element's name.
    void element() { reader.get_element_event(nullptr, &error, &name); }

    std::string text;
    c_read_string source;
    c_xml_reader reader;
    eqbx_error error = EQBX_NO_ERROR;
    std::string name;
    std::string value;
};

}  // namespace reader_on_text
