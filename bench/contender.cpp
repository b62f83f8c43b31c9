#include "bench/contender.h"

#include <stdexcept>

#include "bench/packing.h"

namespace bench {

void need_elements(std::size_t elements, const document& input) {
    if (elements == input.elements) return;
    throw std::runtime_error(input.name + ": found " + std::to_string(elements) + " elements of " +
                             std::to_string(input.elements));
}

const std::vector<entry>& contenders() {
    static const std::vector<entry> all = {
        {"expat, bare parse", expat_parse},
        {"vrl, load from memory", vrl_load_memory},
        {"vrl, load from file", vrl_load_file},
        {"vrl, write to string", vrl_write_string},
        {"vrl, write to wide string", vrl_write_wide_string},
        {"libxml2, text reader", libxml2_reader},
        {"libxml2, DOM and schema validation", libxml2_validated_dom},
        {"pugixml, DOM", pugixml_parse},
        {"pugixml, save to string", pugixml_save},
        {"xsdcxx, parse with validation", xsdcxx_parse},
        {"xsdcxx, serialise to string", xsdcxx_serialise},
    };
    return all;
}

const entry& find_contender(const std::string& name) {
    for (const std::vector<entry>* const all :
         {&contenders(), &packing_contenders(), &unpacking_contenders()}) {
        for (const entry& one : *all) {
            if (name == one.name) return one;
        }
    }
    throw std::invalid_argument("no contender is called " + name);
}

}  // namespace bench
