#pragma once

#include "codegen/class_plan.h"

namespace vrl_codegen {

/// Works out which names may follow at each position of a class's content: those from where reading stands
/// up to and with the next child that has to be there.
void plan_positions(class_plan& owner);

}  // namespace vrl_codegen
