#include "tests/codegen/small_schema.h"

#include <fstream>
#include <random>

#include "codegen/schema_reader.h"
#include "codegen/xml_dom.h"

namespace codegen_tests {

temporary_folder::temporary_folder()
    : m_path(std::filesystem::temp_directory_path() /
             ("vrl_codegen_" + std::to_string(std::random_device()()) +
              std::to_string(std::random_device()()))) {
    std::filesystem::create_directories(m_path);
}

temporary_folder::~temporary_folder() {
    std::error_code ignored;
    std::filesystem::remove_all(m_path, ignored);
}

std::string temporary_folder::write(const std::string& name, const std::string& text) const {
    const std::filesystem::path file = m_path / name;
    std::ofstream(file, std::ios::binary) << text;
    return file.string();
}

std::string around(const std::string& declarations) {
    return R"(<xs:schema xmlns:xs="http://www.w3.org/2001/XMLSchema" xmlns:v="urn:v" xmlns:b="urn:vrl:codegen")"
           R"( targetNamespace="urn:v" elementFormDefault="qualified" attributeFormDefault="unqualified">)" +
           ("\n" + declarations + "\n</xs:schema>\n");
}

vrl_codegen::schema read(const std::string& declarations) {
    const temporary_folder folder;
    return vrl_codegen::read_schema(folder.write("small.xsd", around(declarations)));
}

vrl_codegen::plan plan_of(const std::string& declarations) {
    return vrl_codegen::make_plan(read(declarations));
}

std::string refusal(const std::string& declarations) {
    try {
        plan_of(declarations);
    } catch (const vrl_codegen::schema_error& refused) {
        return refused.what();
    }
    return {};
}

}  // namespace codegen_tests
