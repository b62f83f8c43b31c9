#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <functional>
#include <memory>
#include <new>
#include <string>

#include "tests/V2/documents.h"
#include "tests/temporary_folder.h"

/// Memory that runs out at every point: what was built is given back, and the failure reaches the caller.
namespace {

long g_left = -1;  // allocations until the first that fails; negative for no limit
long g_live = 0;   // blocks that nobody has given back
bool g_counting = false;
bool g_fails_once = false;  // and memory is there again behind the failure
bool g_failed = false;

void* allocate(std::size_t size) {
    if (g_counting) {
        if (g_left == 0) {
            g_failed = true;
            if (g_fails_once) g_left = -1;
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

void do_nothing() {}

/// Runs an action with its first allocation failing, then its second, and so on, until none fails any more.
/// Each failure has to reach the caller, and all blocks of the attempt have to be given back by then.
/// `look` is called behind each failure.
void run_out_of_memory(const std::function<void()>& action, const std::function<void()>& look = do_nothing) {
    action();  // whatever is made once a program exists by now
    g_failed = true;
    long limit = 0;
    for (; g_failed && limit < 20000; ++limit) {
        g_failed = false;
        g_live = 0;
        g_left = limit;
        bool thrown = false;
        g_counting = true;
        try {
            action();
        } catch (const std::bad_alloc&) {
            thrown = true;
        }
        g_counting = false;
        ASSERT_EQ(g_live, 0) << "with allocation " << limit << " failing";
        ASSERT_EQ(thrown, g_failed) << "with allocation " << limit << " failing";
        if (thrown) look();
    }
    EXPECT_FALSE(g_failed);
    EXPECT_GT(limit, 1) << "something was allocated";
}

/// The same with one allocation failing, and none behind it.
void miss_one_allocation(const std::function<void()>& action) {
    g_fails_once = true;
    run_out_of_memory(action);
    g_fails_once = false;
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

std::string text_of(const Vrl& document) {
    std::string text;
    EXPECT_EQ(document.marshal(&text), 0);
    return text;
}

/// Two documents that differ in everything; each holds objects that the other one does not.
struct two_documents {
    two_documents() {
        vrl_test::complete(target);
        target.get_Preamble().get_Header().set_Name(L"target");
        target.get_Preamble().get_Version().set_Version(L"1");
        vrl_test::complete(source);
        source.get_Preamble().get_Header().set_Name(L"source");
        source.get_Preamble().get_Header().get_WritePlatformInformation().set_OperatingSystem(L"o");
        source.get_Preamble().get_Header().get_WritePlatformInformation().set_OperatingSystemVersion(L"1");
        source.get_Preamble().get_Owner().append_Company(L"a text beyond what small strings hold");
        vrl_test::complete(source.get_Color(0));
    }
    Vrl target;
    Vrl source;
};

/// Runs an action on two fresh documents with every allocation failing in turn.
void expect_whole_or_not_at_all(const std::function<void(Vrl& target, Vrl& source)>& action) {
    const two_documents untouched;
    const std::string target = text_of(untouched.target);
    const std::string source = text_of(untouched.source);
    long limit = 0;
    for (;; ++limit) {
        two_documents documents;
        bool failed = false;
        g_left = limit;
        g_counting = true;
        try {
            action(documents.target, documents.source);
        } catch (const std::bad_alloc&) {
            failed = true;
        }
        g_counting = false;
        ASSERT_EQ(text_of(documents.target), failed ? target : source) << limit;
        if (!failed) break;
        ASSERT_EQ(text_of(documents.source), source) << limit;
    }
    EXPECT_GT(limit, 0) << "something was allocated";
}

TEST(OutOfMemory, AssigningChangesNothing) {
    expect_whole_or_not_at_all([](Vrl& target, Vrl& source) { target = source; });
}

TEST(OutOfMemory, SwappingChangesNothing) {
    expect_whole_or_not_at_all([](Vrl& target, Vrl& source) { target.swap(source); });
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

Vrl writable_document() {
    Vrl document = small_document();
    document.clear_Palette();
    return document;
}

TEST(OutOfMemory, WritingToATextLeavesItAlone) {
    const Vrl document = writable_document();
    const auto write = [&document] {
        std::string text = "before";
        try {
            EXPECT_EQ(document.marshal(&text), 0);
        } catch (const std::bad_alloc&) {
            EXPECT_EQ(text, "before");
            throw;
        }
    };
    run_out_of_memory(write);
    miss_one_allocation(write);
}

TEST(OutOfMemory, WritingAStringReachesTheCaller) {
    const Vrl document = writable_document();
    const auto write = [&document] { EXPECT_EQ(document.writeString().getEqbxError(), 0); };
    run_out_of_memory(write);
    miss_one_allocation(write);
}

TEST(OutOfMemory, WritingAFileReachesTheCallerAndLeavesTheFileAsFarAsItGoes) {
    const vrl_test::temporary_folder folder;
    const Vrl document = writable_document();
    const std::wstring path = folder.wide_path(L"a.vrl");
    bool was_left = false;
    run_out_of_memory([&] { EXPECT_EQ(document.writeFile(path), 0); },
                      [&] {
                          was_left = was_left || folder.has("a.vrl");
                          std::filesystem::remove(folder.path("a.vrl"));
                      });
    EXPECT_TRUE(was_left);
}

TEST(OutOfMemory, LoadingReachesTheCaller) {
    const vrl_test::temporary_folder folder;
    const std::string xml = vrl_test::document(vrl_test::color());
    folder.write("a.vrl", xml);
    const std::wstring path = folder.wide_path(L"a.vrl");
    run_out_of_memory([&path] { EXPECT_EQ(Vrl().loadFile(path), 0); });
    const std::wstring wide(xml.begin(), xml.end());
    run_out_of_memory([&wide] { EXPECT_EQ(Vrl().loadString(wide), 0); });
}

}  // namespace
