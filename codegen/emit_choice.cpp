#include "codegen/emit.h"

namespace vrl_codegen {

void declare_choice_state(printer& out, const class_plan& made) {
    out.print("    enum eqbx_chosen : int {\n");
    int number = 0;
    for (const member_plan* option : made.children()) {
        out.print("        chosen_$X$ = $number$,\n",
                  {{"X", option->name}, {"number", std::to_string(number++)}});
    }
    out.print(R"(        chosen_none = $none$,
    };
    eqbx_chosen getchosen() const { return m_chosen; }

)",
              {{"none", std::to_string(made.none_state)}});
}

void define_choice(printer& out, const class_plan& made) {
    out.print(R"(
void $C$::choose(eqbx_chosen option) {
    if (m_chosen == option) return;
    release_choice();
    m_chosen = option;
}

void $C$::release_choice() {
)");
    for (const member_plan* option : made.children()) {
        out.print("    m_$X$.release();\n", {{"X", option->name}});
    }
    out.print("    m_chosen = chosen_none;\n}\n");
}

}  // namespace vrl_codegen
