#include "codegen/emit_class.h"

namespace vrl_codegen {

void declare_states(printer& out, const std::vector<std::string>& names, int none_state) {
    out.print("    enum eqbx_chosen : int {\n");
    int number = 0;
    for (const std::string& name : names) {
        out.print("        chosen_$X$ = $number$,\n", {{"X", name}, {"number", std::to_string(number++)}});
    }
    out.print("        chosen_none = $none$,\n    };\n", {{"none", std::to_string(none_state)}});
}

void declare_choice(printer& out, const class_plan& made) {
    std::vector<std::string> names;
    for (const member_plan* option : made.children()) names.push_back(option->name);
    declare_states(out, names, made.none_state);
    out.print("    eqbx_chosen getchosen() const { return m_chosen; }\n\n");
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
