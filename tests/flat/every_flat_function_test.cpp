#include <gtest/gtest.h>

#include <stdexcept>

#include "tests/driver/any_object.h"
#include "tests/flat/flat_driver.h"

namespace vrl_flat_driver {
namespace {

using vrl_driver::any_object;
using vrl_driver::class_description;
using vrl_driver::form;

std::string g_message;
int g_calls = 0;

void take_message(const char* message, const char* parameter) {
    EXPECT_EQ(parameter, nullptr);
    g_message = message;
    ++g_calls;
}

const flat_member& find_member(const flat_class& c, const std::string& name) {
    for (const flat_member& m : c.members) {
        if (name == m.name) return m;
    }
    throw std::runtime_error(std::string(c.name) + " has no " + name);
}

class EveryFlatClass : public testing::TestWithParam<const flat_class*> {
protected:
    void SetUp() override {
        SWIGRegisterExceptionArgumentCallbacks_VrlModule(nullptr, &take_message, nullptr);
        g_calls = 0;
    }

    const flat_class& flat() const { return *GetParam(); }
    const class_description& model() const { return vrl_driver::find_class(flat().name); }
    std::string message(const char* form) const { return std::string("vrl_v2::") + flat().name + form; }

    void expect_message(const std::string& text) {
        EXPECT_EQ(g_calls, 1) << text;
        EXPECT_EQ(g_message, text);
        g_calls = 0;
    }
};

TEST_P(EveryFlatClass, ReportsANullReference) {
    EXPECT_EQ(flat().copy(nullptr), nullptr);
    expect_message(message(" const & type is null"));
    const any_object object(model());
    if (flat().swap != nullptr) {
        flat().swap(object.get(), nullptr);
        expect_message(message(" & type is null"));
    }
    for (const flat_member& m : flat().members) {
        if (m.assign == nullptr) continue;
        EXPECT_EQ(m.assign(object.get(), 0, nullptr), nullptr) << m.name;
        EXPECT_EQ(g_calls, 1) << m.name;
        EXPECT_NE(g_message.find(" const & type is null"), std::string::npos) << g_message;
        g_calls = 0;
    }
    flat().destroy(nullptr);
    EXPECT_EQ(g_calls, 0) << "nothing to delete is nothing to report";
}

TEST_P(EveryFlatClass, SurvivesANullObject) {
    for (const flat_member& m : flat().members) {
        if (m.size != nullptr) {
            EXPECT_EQ(m.size(nullptr), 0U);
            expect_message(message(" & type is null"));
        }
        if (m.reach != nullptr) {
            EXPECT_EQ(m.reach(nullptr, 0), nullptr);
            expect_message(message(" & type is null"));
        }
    }
    if (flat().marshal != nullptr) {
        EXPECT_EQ(flat().marshal(nullptr, "unused"), 0);
        expect_message(message(" & type is null"));
    }
}

TEST_P(EveryFlatClass, ReportsANullText) {
    if (flat().marshal != nullptr) {
        const any_object object(model());
        EXPECT_EQ(flat().marshal(object.get(), nullptr), 0);
        expect_message("null string");
        EXPECT_EQ(flat().unmarshal_path(object.get(), nullptr), 0);
        expect_message("null string");
        EXPECT_EQ(flat().unmarshal_bytes(object.get(), nullptr, 3), 0);
        expect_message("null string");
    }
    if (flat().factory != nullptr) {
        EXPECT_EQ(flat().factory(1000, nullptr), nullptr);
        expect_message("null string");
    }
}

TEST_P(EveryFlatClass, SetsWhatTheModelThenHolds) {
    const any_object object(model());
    for (const vrl_driver::member& m : model().members) {
        if (m.set == nullptr || m.size != nullptr) continue;
        const flat_member& f = find_member(flat(), m.name);
        for (unsigned variant = 0; variant < 5; ++variant) {
            const std::string text = vrl_driver::legal_text(m, variant);
            EXPECT_EQ(f.set(object.get(), text), 0) << m.name;
            EXPECT_EQ(m.get(object.get(), 0), text) << m.name;
            const bool truth = m.value == vrl_driver::value_type::boolean;
            const std::string crossed = truth ? (text == "true" ? "1" : "0") : text;
            EXPECT_EQ(f.get(object.get(), 0), crossed) << m.name;
            if (f.getenum != nullptr) {
                EXPECT_EQ(f.getenum(object.get()), m.getenum(object.get()));
            }
        }
        if (f.setenum != nullptr) {
            EXPECT_EQ(f.setenum(object.get(), 1), 1);
            EXPECT_EQ(m.get(object.get(), 0), m.limits.literals[0]);
            EXPECT_EQ(f.setenum(object.get(), 0), 0);
        }
        if (f.isset != nullptr) {
            EXPECT_EQ(f.isset(object.get()), 1) << m.name;
            f.unset(object.get());
            EXPECT_EQ(f.isset(object.get()), 0) << m.name;
        }
    }
}

TEST_P(EveryFlatClass, FillsListsThatTheModelThenHolds) {
    const any_object object(model());
    void* const self = object.get();
    for (const vrl_driver::member& m : model().members) {
        if (m.size == nullptr) continue;
        const flat_member& f = find_member(flat(), m.name);
        if (f.append != nullptr) {
            EXPECT_EQ(f.append(self), 0);
            EXPECT_EQ(f.back(self), m.reach(self, 0));
            EXPECT_EQ(f.insert_object(self, 0), 0);
            EXPECT_EQ(f.reach(self, 3), m.reach(self, 3));
            const any_object value = vrl_driver::filled(vrl_driver::find_class(m.class_name), {0, 0, 1});
            EXPECT_EQ(f.assign(self, 1, value.get()), m.reach(self, 1));
            EXPECT_EQ(vrl_driver::contents(value.kind(), m.look(self, 1)), vrl_driver::contents(value));
        } else {
            for (unsigned i = 0; i < 4; ++i) {
                const std::string text = m.kind == form::any_list ? "<a/>" : vrl_driver::legal_text(m, i);
                EXPECT_EQ(i % 2 == 0 ? f.set(self, text) : f.insert(self, 0, text), 0);
                EXPECT_EQ(m.get(self, i % 2 == 0 ? i : 0), text);
                EXPECT_EQ(f.get(self, i % 2 == 0 ? i : 0), text);
            }
        }
        EXPECT_EQ(f.size(self), 4U);
        f.erase(self, 1);
        EXPECT_EQ(m.size(self), 3U);
        f.clear(self);
        EXPECT_EQ(m.size(self), 0U);
    }
}

TEST_P(EveryFlatClass, ReachesItsObjects) {
    const any_object object(model());
    void* const self = object.get();
    for (const vrl_driver::member& m : model().members) {
        if (m.make == nullptr || m.size != nullptr) continue;
        const flat_member& f = find_member(flat(), m.name);
        EXPECT_EQ(f.reach(self, 0), m.make(self)) << m.name;
        const any_object value = vrl_driver::filled(vrl_driver::find_class(m.class_name), {0, 0, 1});
        EXPECT_EQ(f.assign(self, 0, value.get()), m.make(self));
        EXPECT_EQ(vrl_driver::contents(value.kind(), m.look(self, 0)), vrl_driver::contents(value));
        if (f.isset != nullptr) {
            EXPECT_EQ(f.isset(self), 1);
            f.unset(self);
            EXPECT_FALSE(m.isset(self));
        }
    }
    int state = 0;
    for (const vrl_driver::group_member& option : model().group) {
        const flat_member& f = find_member(flat(), option.element);
        EXPECT_EQ(f.reach(self, 0), option.make(self));
        EXPECT_EQ(flat().getchosen(self), state++);
    }
}

TEST_P(EveryFlatClass, OwnsCopiesAndLetsGo) {
    const any_object object = vrl_driver::filled(model(), {1, 1, 1});
    void* const copy = flat().copy(object.get());
    EXPECT_EQ(vrl_driver::contents(model(), copy), vrl_driver::contents(object));
    void* const fresh = flat().create();
    if (flat().swap != nullptr) {
        flat().swap(fresh, copy);
        EXPECT_EQ(vrl_driver::contents(model(), fresh), vrl_driver::contents(object));
        EXPECT_EQ(flat().is_occurs_ok(fresh), 1);
        flat().reset(fresh);
        EXPECT_EQ(vrl_driver::contents(model(), fresh), vrl_driver::contents(any_object(model())));
    }
    if (flat().upcast != nullptr) {
        EXPECT_EQ(flat().upcast(fresh), model().to_base(fresh));
    }
    if (flat().setnil != nullptr) {
        EXPECT_EQ(flat().isnil(fresh), 0);
        flat().setnil(fresh);
        EXPECT_EQ(flat().isnil(fresh), 1);
    }
    flat().destroy(copy);
    flat().destroy(fresh);
}

TEST_P(EveryFlatClass, TellsItsIdentity) {
    if (flat().clone == nullptr) return;
    const any_object object = vrl_driver::filled(model(), {0, 0, 1});
    void* const clone = flat().clone(object.get());
    EXPECT_EQ(vrl_driver::contents(model(), clone), vrl_driver::contents(object));
    EXPECT_EQ(flat().getid(clone), flat().id_get());
    EXPECT_EQ(flat().has_id(clone, flat().id_get()), 1);
    EXPECT_EQ(flat().has_id(clone, "another"), 0);

    flat().destroy(clone);
}

TEST_P(EveryFlatClass, ReadsAndWritesFiles) {
    if (flat().marshal == nullptr) return;
    const any_object object = vrl_driver::filled(model(), {0, 1, 1});
    const std::string path = testing::TempDir() + "flat_" + flat().name + ".vrl";
    ASSERT_EQ(flat().marshal(object.get(), path.c_str()), 0);
    const any_object back(model());
    ASSERT_EQ(flat().unmarshal_path(back.get(), path.c_str()), 0);
    EXPECT_EQ(vrl_driver::contents(back), vrl_driver::contents(object));
    std::string text;
    ASSERT_EQ(model().marshal_string(object.get(), &text), 0);
    const any_object again(model());
    ASSERT_EQ(flat().unmarshal_bytes(again.get(), text.data(), static_cast<std::uint32_t>(text.size())), 0);
    EXPECT_EQ(vrl_driver::contents(again), vrl_driver::contents(object));
    std::remove(path.c_str());
}

std::vector<const flat_class*> all_classes() {
    std::vector<const flat_class*> all;
    for (const flat_class& c : flat_classes()) all.push_back(&c);
    return all;
}

std::string class_name(const testing::TestParamInfo<const flat_class*>& tested) { return tested.param->name; }

INSTANTIATE_TEST_SUITE_P(Flat, EveryFlatClass, testing::ValuesIn(all_classes()), class_name);

}  // namespace
}  // namespace vrl_flat_driver
