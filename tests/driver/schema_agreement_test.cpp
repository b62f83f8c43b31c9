#include <gtest/gtest.h>

#include <set>

#include "tests/driver/any_object.h"
#include "tests/driver/document_mutations.h"
#include "tests/schema/document_judge.h"

namespace vrl_driver {
namespace {

std::vector<const class_description*> documents() {
    std::vector<const class_description*> all;
    for (const class_description& c : classes()) {
        if (c.standalone) all.push_back(&c);
    }
    return all;
}

std::string document_of(const class_description& c, const filling& how) {
    const any_object object = filled(c, how);
    std::string text;
    EXPECT_EQ(c.marshal_string(object.get(), &text), qbxV2::EQBX_NO_ERROR);
    return text;
}

/// The places where reading is more lenient than the schema, by the names of elements.
struct leniencies {
    std::set<std::string> simple;          ///< without a class: nobody looks at its attributes
    std::set<std::string> text_only;       ///< text with attributes
    std::set<std::string> may_be_missing;  ///< group members, and what reading does not demand
    std::set<std::string> may_be_empty;    ///< where emptiness is accepted, nobody asks for what is missing

    leniencies() {
        for (const class_description& c : classes()) {
            if (c.accepts_empty) may_be_empty.insert(c.xml_name);
            if (c.text_only && !c.nillable) text_only.insert(c.xml_name);
            for (const group_member& option : c.group) {
                may_be_missing.insert(option.element);
                if (find_class(option.class_name).accepts_empty) may_be_empty.insert(option.element);
            }
            for (const member& m : c.members) add(m);
        }
    }

private:
    void add(const member& m) {
        const bool child = m.kind != form::attribute && m.kind != form::text;
        if (child && m.set != nullptr) simple.insert(m.name);
        if (m.read_optional) may_be_missing.insert(m.name);
        const bool object = m.kind == form::object || m.kind == form::object_list;
        if (object && find_class(m.class_name).accepts_empty) may_be_empty.insert(m.name);
    }
};

/// "/Vrl:Vrl/Vrl:Color[2]" is the element Color below Vrl.
std::string element_name(const std::string& path, unsigned levels_up) {
    std::size_t end = path.size();
    for (unsigned i = 0; i < levels_up && end != std::string::npos && end > 0; ++i)
        end = path.rfind('/', end - 1);
    const std::size_t start = path.rfind(':', end - 1);
    const std::string step = path.substr(start + 1, end - start - 1);
    return step.substr(0, step.find('['));
}

/// Why reading may take what the schema refuses; empty if it must not.
std::string reason_to_accept(const std::string& mutation_name, const std::string& path) {
    static const leniencies known;
    const std::string name = element_name(path, 0);
    if (path == "/Vrl:Function" || path.rfind("/Vrl:Function/", 0) == 0) {
        return "a document of the head element alone needs no xsi:type";
    }
    if (mutation_name == "an attribute has a name that the format does not know" &&
        known.simple.count(name) != 0) {
        return "attributes of an element without a class are not looked at";
    }
    if (mutation_name == "an element is missing") {
        if (known.may_be_missing.count(name) != 0) return "reading does not demand it";
        if (known.may_be_empty.count(element_name(path, 1)) != 0) return "its parent may be empty";
    }
    const bool emptied = mutation_name == "an element is empty" || mutation_name == "an element is nil";
    if (emptied && known.may_be_empty.count(name) != 0) return "it may be empty";
    if (mutation_name == "an element is nil" && known.simple.count(name) + known.text_only.count(name) != 0) {
        return "xsi:nil means nothing where it is not declared";
    }
    return {};
}

TEST(WrittenDocument, IsValidForTheSchema) {
    for (const class_description* c : documents()) {
        // Intended: the head element alone is written without xsi:type, which the schema demands of it.
        if (std::string("Function") == c->name) continue;
        for (unsigned variant = 0; variant < 8; ++variant) {
            const std::string text = document_of(*c, {variant, 3, 2});
            EXPECT_EQ(schema_tests::complaints(text), "") << c->name;
        }
    }
}

TEST(WrittenDocument, IsValidForTheSchemaWithEveryMemberOfEveryGroup) {
    for (unsigned variant = 0; variant < 27; ++variant) {
        const std::string text = document_of(find_class("Vrl"), {variant, 5, 1});
        EXPECT_EQ(schema_tests::complaints(text), "") << variant;
    }
}

std::vector<const mutation*> all_mutations() {
    std::vector<const mutation*> all;
    for (const mutation& m : mutations()) all.push_back(&m);
    return all;
}

class SchemaAndReader : public testing::TestWithParam<const mutation*> {
protected:
    void judge(const class_description& c, const std::string& path, const std::string& text) {
        const bool valid = schema_tests::complaints(text).empty();
        const any_object object(c);
        const int code = c.unmarshal_string(object.get(), text);
        if (valid && code == qbxV2::EQBX_VALUE_BAD_FORMAT) {
            // libxml2 passes over stray characters in base64; the format does not.
            EXPECT_EQ(element_name(path, 0), "ProfileFile") << text;
        } else if (valid) {
            EXPECT_EQ(code, 0) << path << '\n' << text;
        } else if (code == 0) {
            EXPECT_NE(reason_to_accept(GetParam()->name, path), "") << c.name << ' ' << path << '\n' << text;
        } else {
            ++m_refused;
            EXPECT_TRUE(GetParam()->codes.count(code) != 0) << code << ' ' << c.name << ' ' << path;
        }
    }

    int m_refused = 0;
};

TEST_P(SchemaAndReader, AgreeOnWhatIsWrong) {
    for (const class_description* c : documents()) {
        for (unsigned variant = 0; variant < 3; ++variant) {
            for_each_mutation(
                *GetParam(), document_of(*c, {variant, 1, 1}),
                [&](const std::string& path, const std::string& text) { judge(*c, path, text); });
        }
    }
    EXPECT_GT(m_refused, 0);
}

std::string mutation_name(const testing::TestParamInfo<const mutation*>& tested) {
    std::string name = tested.param->name;
    for (char& c : name) c = c == ' ' ? '_' : c;
    return name;
}

INSTANTIATE_TEST_SUITE_P(Mutations, SchemaAndReader, testing::ValuesIn(all_mutations()), mutation_name);

}  // namespace
}  // namespace vrl_driver
