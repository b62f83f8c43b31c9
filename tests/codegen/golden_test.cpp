#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "codegen/emit.h"
#include "codegen/layout.h"
#include "codegen/schema_reader.h"

namespace {

using vrl_codegen::k_line_length;
using vrl_codegen::make_plan;
using vrl_codegen::module_plan;
using vrl_codegen::plan;
using vrl_codegen::read_schema;

const char k_folder[] = VRL_GOLDEN "/";

std::string content_of(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    std::ostringstream text;
    text << file.rdbuf();
    return text.str();
}

std::vector<std::string> lines_of(const std::string& text) {
    std::vector<std::string> lines;
    std::istringstream in(text);
    for (std::string line; std::getline(in, line);) lines.push_back(line);
    return lines;
}

/// Equal, or where the first difference is.
testing::AssertionResult matches(const std::string& path, const std::string& generated) {
    const std::string golden = content_of(path);
    if (golden == generated) return testing::AssertionSuccess();
    const std::vector<std::string> expected = lines_of(golden);
    const std::vector<std::string> found = lines_of(generated);
    std::size_t i = 0;
    while (i < expected.size() && i < found.size() && expected[i] == found[i]) ++i;
    return testing::AssertionFailure()
           << path << ":" << i + 1 << "\n  golden:    " << (i < expected.size() ? expected[i] : "(end)")
           << "\n  generated: " << (i < found.size() ? found[i] : "(end)")
           << "\nIf the change is meant, run tests/codegen/golden/regenerate.sh and review the difference.";
}

class Golden : public testing::TestWithParam<const char*> {};

TEST_P(Golden, IsWhatTheEmittersMake) {
    const std::string stem = k_folder + std::string(GetParam());
    const plan model = make_plan(read_schema(stem + ".xsd"));
    const module_plan& module = model.modules.at(0);
    EXPECT_TRUE(matches(stem + ".h", emit_module_header(module)));
    EXPECT_TRUE(matches(stem + ".cpp", emit_module_source(module)));
}

INSTANTIATE_TEST_SUITE_P(MemberKinds, Golden,
                         testing::Values("any", "attributes", "choice", "document", "enumerations", "group",
                                         "initial_values", "lists", "nillable", "objects", "polymorphic",
                                         "text", "values"),
                         [](const auto& kind) { return std::string(kind.param); });

TEST(GoldenOfAllModules, IsWhatTheEmittersMake) {
    const std::string shared = std::string(k_folder) + "shared/";
    const plan model = make_plan(read_schema(std::string(k_folder) + "group.xsd"));
    EXPECT_TRUE(matches(shared + "forward.h", emit_forward(model)));
    EXPECT_TRUE(matches(shared + "tokens.h", emit_tokens(model)));
    EXPECT_TRUE(matches(shared + "format.h", emit_format(model)));
    EXPECT_TRUE(matches(shared + "Vrl.h", emit_chief_header(model)));
    EXPECT_TRUE(matches(shared + "driver.cpp", emit_driver(model.modules.at(0))));
    EXPECT_TRUE(matches(shared + "driver_classes.cpp", emit_driver_list(model)));
}

// The real model, too long to keep: its form.

struct generated_file {
    std::string name;
    std::string text;
};

std::vector<generated_file> generated_model() {
    const plan model = make_plan(read_schema(VRL_SCHEMA "/vrl.xsd"));
    std::vector<generated_file> files = {{"forward.h", emit_forward(model)},
                                         {"tokens.h", emit_tokens(model)},
                                         {"format.h", emit_format(model)},
                                         {"Vrl.h", emit_chief_header(model)},
                                         {"driver/classes.cpp", emit_driver_list(model)}};
    for (const module_plan& module : model.modules) {
        files.push_back({module.name + ".h", emit_module_header(module)});
        files.push_back({module.name + ".cpp", emit_module_source(module)});
        files.push_back({"driver/" + module.name + ".cpp", emit_driver(module)});
    }
    return files;
}

class GeneratedModel : public testing::Test {
protected:
    const std::vector<generated_file> m_files = generated_model();
};

TEST_F(GeneratedModel, HasTheModulesOfTheSchema) { EXPECT_EQ(m_files.size(), 5u + 3u * 8u); }

TEST_F(GeneratedModel, KeepsToTheLineLength) {
    for (const generated_file& file : m_files) {
        for (const std::string& line : lines_of(file.text)) {
            EXPECT_LE(line.size(), k_line_length) << file.name << ": " << line;
        }
    }
}

TEST_F(GeneratedModel, HasNoDoubledBlankLineNorTrailingBlanks) {
    for (const generated_file& file : m_files) {
        EXPECT_EQ(file.text.find("\n\n\n"), std::string::npos) << file.name;
        EXPECT_EQ(file.text.find(" \n"), std::string::npos) << file.name;
        EXPECT_EQ(file.text.back(), '\n') << file.name;
    }
}

TEST_F(GeneratedModel, ComesOutTheSameEachTime) {
    const std::vector<generated_file> again = generated_model();
    for (std::size_t i = 0; i < m_files.size(); ++i) {
        EXPECT_TRUE(m_files[i].text == again[i].text) << m_files[i].name;
    }
}

}  // namespace
