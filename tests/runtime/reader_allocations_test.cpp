#include <gtest/gtest.h>

#include <cstdlib>
#include <new>

#include "runtime/xml_reader.h"

// A program of its own: it counts what the whole program allocates.

namespace {
std::size_t g_allocations = 0;
}

void* operator new(std::size_t size) {
    ++g_allocations;
    if (void* const block = std::malloc(size != 0 ? size : 1)) return block;
    throw std::bad_alloc();
}
void operator delete(void* block) noexcept { std::free(block); }
void operator delete(void* block, std::size_t) noexcept { std::free(block); }

namespace {

using namespace qbxV2;

constexpr s_ns_map k_ns_map[] = {{1000, "V", "doc"}, {0, nullptr, nullptr}};
constexpr s_event_map k_elements[] = {{1000, "Point", 5, 14}, {0, nullptr, 0, 0}};
constexpr s_event_map k_attributes[] = {{1, "Wavelength", 10, 15}, {0, nullptr, 0, 0}};

/// Reads one element the way that a class of the model does. False behind the last one.
bool read_point(c_xml_reader& reader, eqbx_error* error) {
    std::string& name = reader.element_name_buffer();
    reader.get_element_event(k_elements, k_elements + 1, error, &name);
    if (reader.get_current_event() != 14) return false;
    const c_string_stack_node node(reader.get_element_name_stack(), name);
    while (reader.get_attribute_event(nullptr, error, &reader.attribute_name_buffer())) {
        reader.tokenise(k_attributes, EQXP_ATTRIBUTE);
        EXPECT_EQ(reader.get_current_event(), 15);
        EXPECT_TRUE(reader.get_attribute_value(&reader.value_buffer(), EQBX_WS_COLLAPSE));
    }
    c_xml_reader_local scope(reader);
    EXPECT_TRUE(reader.get_element_value(&reader.value_buffer(), EQBX_WS_COLLAPSE, true));
    EXPECT_TRUE(reader.is_element_end_tag(name));
    return true;
}

TEST(ReaderAllocations, ThereAreNoneFromTheSecondElementOn) {
    std::string text = "<V:Points xmlns:V='doc'>\r\n";
    for (int i = 0; i < 1000; ++i) {
        text +=
            "  <V:Point Wavelength=\"400\">  a value longer than a short string has room for </V:Point>\r\n";
    }
    text += "</V:Points>";
    for (const bool use_runs : {true, false}) {
        c_xml_reader_memory reader(text.data(), text.size());
        reader.use_runs(use_runs);
        reader.set_ns_map(k_ns_map);
        c_xml_reader_local root_scope(reader);
        eqbx_error error = EQBX_NO_ERROR;
        reader.get_element_event(nullptr, &error, &reader.element_name_buffer());
        const c_string_stack_node node(reader.get_element_name_stack(), reader.element_name_buffer());
        EXPECT_FALSE(reader.get_attribute_event(nullptr, &error, &reader.attribute_name_buffer()));
        c_xml_reader_local scope(reader);
        ASSERT_TRUE(read_point(reader, &error));
        const std::size_t before = g_allocations;
        int points = 1;
        while (read_point(reader, &error)) ++points;
        EXPECT_EQ(g_allocations, before);
        EXPECT_EQ(points, 1000);
        EXPECT_EQ(error, EQBX_NO_ERROR);
        EXPECT_TRUE(node == reader.element_name_buffer());
    }
}

}  // namespace
