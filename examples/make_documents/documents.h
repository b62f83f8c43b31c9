#pragma once

#include <V2/Vrl.h>

/// The documents of examples/documents/, each built by a function of its own, in a source of its name.
namespace examples {

vrl_v2::Vrl css_named_colors();
vrl_v2::Vrl process_inks();
vrl_v2::Vrl light_sources();
vrl_v2::Vrl reflectance_palette();
vrl_v2::Vrl paint_recipe();
vrl_v2::Vrl quality_control();
vrl_v2::Vrl every_element();

}  // namespace examples
