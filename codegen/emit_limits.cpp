#include "codegen/emit.h"

namespace vrl_codegen {
namespace {

std::string range_expression(const facets& facet) {
    std::string built = "frame::range()";
    const auto bound = [&built](const char* call, const std::optional<std::string>& value) {
        if (value) built.append(call).append("(").append(*value).append(")");
    };
    bound(".from", facet.min_inclusive);
    bound(".above", facet.min_exclusive);
    bound(".to", facet.max_inclusive);
    bound(".below", facet.max_exclusive);
    return built;
}

std::string length_list(const facets& facet) {
    std::string bounds = std::to_string(facet.min_length.value_or(0));
    if (facet.max_length) bounds.append(", ").append(std::to_string(*facet.max_length));
    return bounds;
}

std::string text_list(const facets& facet) {
    std::vector<std::string> texts;
    for (const std::string& text : facet.enumeration) texts.push_back(wide_quoted(text));
    return join(texts, ", ");
}

void define_length(printer& out, const limits_plan& limits) {
    const printer_scope scope(out, {{"bounds", length_list(limits.facet)}});
    out.print(limits.collapsed ? "constexpr frame::collapsed<frame::length> $name${{$bounds$}};\n"
                               : "constexpr frame::length $name${$bounds$};\n");
}

}  // namespace

void define_limits(printer& out, const limits_plan& limits) {
    const printer_scope scope(out, {{"name", limits.name}});
    switch (limits.kind) {
        case limits_plan::form::none:
            out.print(limits.collapsed ? "constexpr frame::collapsed<frame::no_limits> $name${};\n"
                                       : "constexpr frame::no_limits $name$;\n");
            break;
        case limits_plan::form::range:
            out.print("constexpr frame::range $name$ = $range$;\n",
                      {{"range", range_expression(limits.facet)}});
            break;
        case limits_plan::form::length:
            define_length(out, limits);
            break;
        case limits_plan::form::whole:
            out.print("constexpr frame::whole $name${$lowest$, $highest$};\n",
                      {{"lowest", quoted(limits.lowest)}, {"highest", quoted(limits.highest)}});
            break;
        case limits_plan::form::literals:
            out.print(R"(constexpr std::wstring_view $name$_texts[] = {$texts$};
constexpr frame::literals $name$($name$_texts);
)",
                      {{"texts", text_list(limits.facet)}});
            break;
    }
}

}  // namespace vrl_codegen
