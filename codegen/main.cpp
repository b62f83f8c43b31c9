#include <exception>
#include <filesystem>
#include <iostream>

#include "codegen/class_plan.h"
#include "codegen/emit.h"
#include "codegen/output_file.h"
#include "codegen/schema_reader.h"

namespace {

void write_reference(const std::string& schema_path, const std::filesystem::path& file) {
    const vrl_codegen::schema source = vrl_codegen::read_schema(schema_path);
    const vrl_codegen::plan model = vrl_codegen::make_plan(source);
    vrl_codegen::write_if_changed(file, emit_reference(plan_reference(source, model)));
}

void generate(const std::string& schema_path, const std::filesystem::path& out) {
    using namespace vrl_codegen;
    const schema source = read_schema(schema_path);
    const plan model = make_plan(source);
    const std::filesystem::path v2 = out / "V2";
    write_if_changed(v2 / "forward.h", emit_forward(model));
    write_if_changed(v2 / "tokens.h", emit_tokens(model));
    write_if_changed(v2 / "format.h", emit_format(model));
    write_if_changed(v2 / "Vrl.h", emit_chief_header(model));
    write_if_changed(out / "driver" / "classes.cpp", emit_driver_list(model));
    const std::filesystem::path flat = out / "flat";
    write_if_changed(flat / "vrl_flat.h", emit_flat_header(model));
    write_if_changed(flat / "class_names.h", emit_flat_names(model));
    write_if_changed(flat / "exports.txt", emit_flat_exports(model));
    write_if_changed(flat / "values.cpp", emit_flat_values_source());
    write_if_changed(out / "flat_driver" / "classes.cpp", emit_flat_driver_list(model));
    for (const module_plan& module : model.modules) {
        write_if_changed(flat / (module.name + ".cpp"), emit_flat_source(module));
        write_if_changed(out / "flat_driver" / (module.name + ".cpp"), emit_flat_driver(module));
        write_if_changed(v2 / (module.name + ".h"), emit_module_header(module));
        write_if_changed(v2 / (module.name + ".cpp"), emit_module_source(module));
        write_if_changed(out / "driver" / (module.name + ".cpp"), emit_driver(module));
    }
}

}  // namespace

int main(int argc, char** argv) {
    const bool reference = argc == 4 && std::string(argv[2]) == "--reference";
    if (argc != 3 && !reference) {
        std::cerr << "usage: vrl_codegen SCHEMA OUTPUT_FOLDER\n"
                     "           compiles the document schema into the C++ classes of the model\n"
                     "       vrl_codegen SCHEMA --reference FILE\n"
                     "           writes the reference pages of the format\n";
        return 2;
    }
    try {
        if (reference) {
            write_reference(argv[1], argv[3]);
        } else {
            generate(argv[1], argv[2]);
        }
    } catch (const std::exception& failure) {
        std::cerr << "vrl_codegen: " << failure.what() << '\n';
        return 1;
    }
    return 0;
}
