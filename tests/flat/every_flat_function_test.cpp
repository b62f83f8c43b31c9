#include "tests/flat/every_flat_class.h"

namespace vrl_flat_driver {
namespace {

using vrl_driver::any_object;
using vrl_driver::form;

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
            const auto count = static_cast<int>(m.limits.literals.size());
            for (int number = 1; number <= count; ++number) {
                EXPECT_EQ(f.setenum(object.get(), number), 1);
                EXPECT_EQ(m.get(object.get(), 0), m.limits.literals[static_cast<std::size_t>(number) - 1]);
                EXPECT_EQ(f.getenum(object.get()), number);
            }
            EXPECT_EQ(f.setenum(object.get(), 0), 0);
            EXPECT_EQ(f.setenum(object.get(), count + 1), 0);
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
            if (f.set_at != nullptr) {
                const std::string text = vrl_driver::legal_text(m, 4);
                EXPECT_EQ(f.set_at(self, 2, text), 0);
                EXPECT_EQ(m.get(self, 2), text);
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

TEST_P(EveryFlatClass, HasAnIdentityThatCanBeReplaced) {
    if (flat().id_set == nullptr) return;
    // Nobody frees what was replaced: remembered to the very end, so that no leak is seen where one is meant.
    static auto* const replaced = new std::vector<const char*>();
    const char* const before = flat().id_get();
    const std::string given = "another";
    flat().id_set(given.c_str());
    EXPECT_STREQ(flat().id_get(), "another");
    EXPECT_NE(flat().id_get(), given.c_str()) << "a copy is kept";
    EXPECT_EQ(model().static_id(), flat().id_get());
    replaced->push_back(flat().id_get());
    flat().id_set(nullptr);
    EXPECT_EQ(flat().id_get(), nullptr);
    flat().id_set(before);
    EXPECT_STREQ(flat().id_get(), before);
}

TEST_P(EveryFlatClass, MakesItsFamily) {
    if (flat().factory == nullptr) return;
    for (const char* name : model().factory) {
        void* const made = flat().factory(1000, name);
        ASSERT_NE(made, nullptr) << name;
        EXPECT_STREQ(flat().getid(made), name);
        flat().destroy(made);
        EXPECT_EQ(flat().factory(1, name), nullptr) << name;
    }
    EXPECT_EQ(flat().factory(1000, "Nonsense"), nullptr);
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
