#include <pugixml.hpp>

#include <stdexcept>

#include "bench/contender.h"

namespace bench {
namespace {

void load(pugi::xml_document& tree, const document& input) {
    const pugi::xml_parse_result result = tree.load_buffer(input.bytes.data(), input.bytes.size());
    if (!result) throw std::runtime_error(std::string("pugixml: ") + result.description());
}

/// The whole tree, untyped and unchecked.
class parse final : public contender {
public:
    void run(const document& input) override { load(m_tree, input); }

    std::size_t finish(const document& input) override {
        element_counter counter;
        m_tree.traverse(counter);
        need_elements(counter.elements, input);
        m_tree.reset();
        return input.bytes.size();
    }

private:
    struct element_counter : pugi::xml_tree_walker {
        bool for_each(pugi::xml_node& node) override {
            if (node.type() == pugi::node_element) ++elements;
            return true;
        }
        std::size_t elements = 0;
    };

    pugi::xml_document m_tree;
};

class save final : public contender {
public:
    void prepare(const document& input) override { load(m_tree, input); }
    void run(const document&) override { m_tree.save(m_out); }

    std::size_t finish(const document& input) override {
        need_elements(count_elements(m_out.text), input);
        const std::size_t size = m_out.text.size();
        m_out.text = std::string();
        return size;
    }

private:
    struct string_writer : pugi::xml_writer {
        void write(const void* data, std::size_t size) override {
            text.append(static_cast<const char*>(data), size);
        }
        std::string text;
    };

    pugi::xml_document m_tree;
    string_writer m_out;
};

}  // namespace

std::unique_ptr<contender> pugixml_parse() { return std::make_unique<parse>(); }
std::unique_ptr<contender> pugixml_save() { return std::make_unique<save>(); }

}  // namespace bench
