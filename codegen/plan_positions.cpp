#include "codegen/plan_positions.h"

namespace vrl_codegen {
namespace {

/// The names from `first` on, up to and with the first child at or behind `from` that has to be there.
row_range reach(const std::vector<const member_plan*>& children, unsigned first, unsigned from) {
    row_range names{first, from};
    while (names.last < children.size()) {
        if (children[names.last++]->demanded_on_reading()) break;
    }
    return names;
}

}  // namespace

void plan_positions(class_plan& owner) {
    const std::vector<const member_plan*> children = owner.children();
    const row_range all{0, static_cast<unsigned>(children.size())};
    const bool choice = owner.kind == class_kind::choice;
    owner.first_names = choice ? all : reach(children, 0, 0);
    unsigned row = 0;
    for (member_plan& member : owner.members) {
        if (!member.is_child()) continue;
        const unsigned behind = row + 1;
        member.next = choice ? all : reach(children, member.is_list() ? row : behind, behind);
        row = behind;
    }
}

}  // namespace vrl_codegen
