// Generated from schema/. To change it, change the schema.
#include "tests/driver/model_driver.h"

namespace vrl_driver {

void describe_group(std::vector<class_description>& all);

const std::vector<class_description>& classes() {
    static const std::vector<class_description> all = [] {
        std::vector<class_description> made;
        describe_group(made);
        return made;
    }();
    return all;
}

}  // namespace vrl_driver
