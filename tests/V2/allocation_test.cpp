#include <gtest/gtest.h>

#include <cstdlib>
#include <functional>
#include <memory>
#include <new>
#include <string>

#include "tests/V2/documents.h"

/// Memory that runs out at every point: what was built is given back, and the failure reaches the caller.
namespace {

long g_left = -1;  // allocations until the first that fails; negative for no limit
long g_live = 0;   // blocks that nobody has given back
bool g_counting = false;
bool g_failed = false;

void* allocate(std::size_t size) {
    if (g_counting) {
        if (g_left == 0) {
            g_failed = true;
            return nullptr;
        }
        if (g_left > 0) --g_left;
    }
    void* const block = std::malloc(size == 0 ? 1 : size);
    if (g_counting && block != nullptr) ++g_live;
    return block;
}

}  // namespace

// A block is counted by whether it was made while counting: tests free inside what they allocate inside.
void* operator new(std::size_t size) {
    void* const block = allocate(size);
    if (block == nullptr) throw std::bad_alloc();
    return block;
}
void* operator new(std::size_t size, const std::nothrow_t&) noexcept { return allocate(size); }
void operator delete(void* block) noexcept {
    if (g_counting && block != nullptr) --g_live;
    std::free(block);
}
void operator delete(void* block, std::size_t) noexcept { operator delete(block); }
void operator delete(void* block, const std::nothrow_t&) noexcept { operator delete(block); }

namespace {

using namespace vrl_v2;

/// Runs an action with its first allocation failing, then its second, and so on, until none fails any more.
/// All blocks of each attempt have to be given back by its end.
void run_out_of_memory(const std::function<void()>& action) {
    action();  // whatever is made once a program exists by now
    g_failed = true;
    long limit = 0;
    for (; g_failed && limit < 20000; ++limit) {
        g_failed = false;
        g_live = 0;
        g_left = limit;
        g_counting = true;
        try {
            action();
        } catch (const std::bad_alloc&) {
        }
        g_counting = false;
        ASSERT_EQ(g_live, 0) << "with allocation " << limit << " failing";
    }
    EXPECT_FALSE(g_failed);
    EXPECT_GT(limit, 1) << "something was allocated";
}

Vrl small_document() {
    Vrl document;
    vrl_test::complete(document);
    vrl_test::complete(document.get_Color(0));
    document.get_Color(0).get_Substrate().get_SubstratePaper().set_PaperType(L"a text beyond small strings");
    document.get_Palette(0).set_PaletteName(L"a name beyond what small strings hold");
    vrl_test::complete(document.get_Palette(0).get_CustomAttribute(0));
    document.get_Preamble().get_Header().get_Revision(0).append_any("<a>a text beyond small strings</a>");
    return document;
}

TEST(OutOfMemory, CopyingGivesBackWhatItBuilt) {
    const Vrl document = small_document();
    run_out_of_memory([&document] { const Vrl copy(document); });
}

TEST(OutOfMemory, AssigningChangesNothing) {
    const Vrl document = small_document();
    Vrl target;
    target.get_Palette(0).set_PaletteName(L"before");
    for (long limit = 0;; ++limit) {
        g_left = limit;
        g_counting = true;
        bool failed = false;
        try {
            target = document;
        } catch (const std::bad_alloc&) {
            failed = true;
        }
        g_counting = false;
        if (!failed) break;
        ASSERT_EQ(target.get_Palette(0).get_PaletteName(), L"before") << limit;
        ASSERT_EQ(target.size_Color(), 0u) << limit;
    }
    EXPECT_EQ(target.size_Color(), 1u);
}

TEST(OutOfMemory, ReadingGivesBackWhatItBuilt) {
    const std::string xml = vrl_test::document(
        vrl_test::color("c", vrl_test::element("SubstratePaper", vrl_test::element("PaperType", "p"))));
    run_out_of_memory([&xml] {
        Vrl document;
        document.unmarshal(xml);
    });
}

TEST(OutOfMemory, ParsingConstructorGivesBackWhatItBuilt) {
    const std::string xml = vrl_test::document(vrl_test::color());
    run_out_of_memory([&xml] {
        qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
        try {
            const Vrl document(xml, &error);
            EXPECT_EQ(error, 0);
        } catch (const std::bad_alloc&) {
            EXPECT_EQ(error, 42) << "undefined, until reading has come to its end";
            throw;
        }
    });
}

TEST(OutOfMemory, CloningGivesBackWhatItBuilt) {
    ColorSpaceCMYKType space;
    vrl_test::complete(space);
    const ColorSpaceType& base = space;
    run_out_of_memory([&base] { const std::unique_ptr<ColorSpaceType> copy(base.clone()); });
}

TEST(OutOfMemory, EditingGivesBackWhatItBuilt) {
    run_out_of_memory([] {
        Vrl document = small_document();
        document.insert_Color(0);
        document.get_Color(3);
        document.get_Color(1).get_ColorSpace(0).get_ColorSpaceNCS();
        document.get_Preamble().get_Owner().insert_Company(0, L"a text beyond what small strings hold");
        document.clear_Color();
    });
}

TEST(OutOfMemory, WritingGivesBackWhatItBuilt) {
    Vrl document = small_document();
    document.clear_Palette();
    run_out_of_memory([&document] {
        std::string text;
        document.marshal(&text);
    });
}

}  // namespace
