#include "tests/flat/every_flat_class.h"

/// What every function says of a null, for every class and member.
namespace vrl_flat_driver {
namespace {

using vrl_driver::any_object;
using vrl_driver::form;
using vrl_driver::value_type;

const char* class_of(const vrl_driver::class_description& c, const flat_member& f) {
    if (f.class_name != nullptr) return f.class_name;
    for (const vrl_driver::member& m : c.members) {
        if (std::string(m.name) == f.name) return m.class_name;
    }
    return "no such member";
}

TEST_P(EveryFlatClass, ReportsANullReference) {
    EXPECT_EQ(flat().copy(nullptr), nullptr);
    expect_message(message(" const & type is null"));
    const any_object object(model());
    if (flat().swap != nullptr) {
        flat().swap(object.get(), nullptr);
        expect_message(message(" & type is null"));
        flat().swap(nullptr, nullptr);
        expect_message(message(" & type is null"));
    }
    for (const flat_member& f : flat().members) {
        if (f.assign == nullptr) continue;
        const std::string told = std::string("vrl_v2::") + class_of(model(), f) + " const & type is null";
        EXPECT_EQ(f.assign(object.get(), 0, nullptr), nullptr) << f.name;
        expect_message(told);
        EXPECT_EQ(f.assign(nullptr, 0, nullptr), nullptr) << f.name;
        expect_message(told);
    }
}

TEST_P(EveryFlatClass, ReportsANullDateAndNullBytes) {
    const any_object object(model());
    for (const vrl_driver::member& m : model().members) {
        const bool date = m.value == value_type::date_time;
        if (m.get == nullptr || (!date && m.value != value_type::binary)) continue;
        const flat_member& f = find_member(flat(), m.name);
        ASSERT_FALSE(f.given_null.empty()) << m.name;
        for (int32_t (*const store)(void*) : f.given_null) {
            EXPECT_EQ(store(object.get()), 0) << m.name;
            expect_message(date ? "qbxV2::tc_datetime const & type is null"
                                : "qbxV2::tc_binary const & type is null");
        }
        if (m.size != nullptr) {
            EXPECT_EQ(m.size(object.get()), 0U) << m.name;
        } else {
            EXPECT_FALSE(m.isset != nullptr && m.isset(object.get())) << m.name;
        }
    }
}

TEST_P(EveryFlatClass, TakesANullWideTextForTheEmptyOne) {
    const any_object object(model());
    const any_object twin(model());
    for (const vrl_driver::member& m : model().members) {
        if (m.get == nullptr || m.kind == form::any_list || m.value != value_type::text) continue;
        const flat_member& f = find_member(flat(), m.name);
        ASSERT_FALSE(f.given_null.empty()) << m.name;
        for (int32_t (*const store)(void*) : f.given_null) {
            EXPECT_EQ(store(object.get()), m.set(twin.get(), "")) << m.name;
        }
    }
    expect_no_message();
    EXPECT_EQ(vrl_driver::contents(model(), object.get()).find("(null)"), std::string::npos);
    for (const vrl_driver::member& m : model().members) {
        if (m.size == nullptr || m.get == nullptr || m.value != value_type::text || m.kind == form::any_list)
            continue;
        // Appended, inserted, and the first overwritten.
        EXPECT_EQ(m.size(object.get()), 2U) << m.name;
        EXPECT_EQ(m.get(object.get(), 0), "") << m.name;
    }
}

TEST_P(EveryFlatClass, ReportsANullText) {
    const any_object object(model());
    if (flat().marshal != nullptr) {
        EXPECT_EQ(flat().marshal(object.get(), nullptr), 0);
        expect_message("null string");
        EXPECT_EQ(flat().unmarshal_path(object.get(), nullptr), 0);
        expect_message("null string");
        EXPECT_EQ(flat().unmarshal_bytes(object.get(), nullptr, 3), 0);
        expect_message("null string");
        EXPECT_EQ(flat().unmarshal_bytes(nullptr, nullptr, 3), 0);
        expect_message("null string");
    }
    if (flat().has_id != nullptr) {
        EXPECT_EQ(flat().has_id(object.get(), nullptr), 0);
        expect_message("null string");
    }
    if (flat().factory != nullptr) {
        EXPECT_EQ(flat().factory(1000, nullptr), nullptr);
        expect_message("null string");
    }
    for (const vrl_driver::member& m : model().members) {
        if (m.kind != form::any_list) continue;
        for (int32_t (*const store)(void*) : find_member(flat(), m.name).given_null) {
            EXPECT_EQ(store(object.get()), 0);
            expect_message("null string");
        }
        EXPECT_EQ(m.size(object.get()), 0U);
    }
}

TEST_P(EveryFlatClass, DeletesNothingInSilence) {
    flat().destroy(nullptr);
    if (flat().upcast != nullptr) {
        EXPECT_EQ(flat().upcast(nullptr), nullptr);
    }
    expect_no_message();
}

/// Calls functions on no object: each gives 0 or null, and tells of the class.
class without_object {
public:
    explicit without_object(std::string told) : m_told(std::move(told)) {}

    template <class Result, class... Parameters, class... Arguments>
    void call(Result (*function)(void*, Parameters...), const Arguments&... arguments) const {
        if (function == nullptr) return;
        if constexpr (std::is_void_v<Result>) {
            function(nullptr, arguments...);
        } else {
            EXPECT_EQ(function(nullptr, arguments...), Result());
        }
        expect_message(m_told);
    }

    /// A value as its text.
    void read(std::string (*get)(void*, uint32_t)) const {
        if (get == nullptr) return;
        const std::string text = get(nullptr, 0);
        EXPECT_TRUE(text == "0" || text == "(null)") << text;
        expect_message(m_told);
    }

private:
    std::string m_told;
};

TEST_P(EveryFlatClass, SurvivesANullObject) {
    const without_object none(message(" & type is null"));
    const any_object object(model());
    none.call(flat().swap, object.get());
    none.call(flat().reset);
    none.call(flat().is_occurs_ok);
    none.call(flat().getchosen);
    none.call(flat().isnil);
    none.call(flat().setnil);
    none.call(flat().marshal, "unused");
    none.call(flat().unmarshal_path, "unused");
    none.call(flat().unmarshal_bytes, "unused", 6U);
    none.call(flat().clone);
    none.call(flat().getid);
    none.call(flat().has_id, "unused");
}

TEST_P(EveryFlatClass, ReachesNoMemberOfANullObject) {
    const without_object none(message(" & type is null"));
    for (const flat_member& f : flat().members) {
        SCOPED_TRACE(f.name);
        none.call(f.isset);
        none.call(f.unset);
        none.call(f.getenum);
        none.call(f.setenum, 1);
        none.call(f.reach, 0U);
        none.call(f.back);
        none.call(f.append);
        none.call(f.insert_object, 0U);
        none.call(f.size);
        none.call(f.erase, 0U);
        none.call(f.clear);
        if (f.assign != nullptr) {
            const any_object value(vrl_driver::find_class(class_of(model(), f)));
            none.call(f.assign, 0U, value.get());
        }
    }
    for (const vrl_driver::member& m : model().members) {
        if (m.get == nullptr || m.kind == form::any_list) continue;
        SCOPED_TRACE(m.name);
        const flat_member& f = find_member(flat(), m.name);
        const std::string text = vrl_driver::legal_text(m, 0);
        none.read(f.get);
        none.call(f.set, text);
        none.call(f.insert, 0U, text);
        none.call(f.set_at, 0U, text);
    }
}

}  // namespace
}  // namespace vrl_flat_driver
