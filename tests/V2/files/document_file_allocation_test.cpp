#include <gtest/gtest.h>

#include <cstdlib>
#include <functional>
#include <new>
#include <sstream>

#include "document_files.h"

// Every allocation of a load and of a save fails once in turn: std::bad_alloc comes out, or the failure is
// told. Nothing is lost and nothing is left.

namespace {

// Armed, the allocation of this number fails; those before it are counted down.
bool g_armed = false;
std::size_t g_left = 0;

bool fails_now() {
    if (!g_armed || g_left-- != 0) return false;
    g_armed = false;
    return true;
}

}  // namespace

void* operator new(std::size_t size) {
    void* const block = fails_now() ? nullptr : std::malloc(size == 0 ? 1 : size);
    if (block == nullptr) throw std::bad_alloc();
    return block;
}
void* operator new[](std::size_t size) { return operator new(size); }
void operator delete(void* block) noexcept { std::free(block); }
void operator delete[](void* block) noexcept { std::free(block); }
void operator delete(void* block, std::size_t) noexcept { std::free(block); }
void operator delete[](void* block, std::size_t) noexcept { std::free(block); }

namespace {

using vrl_test::document_of;
using vrl_test::text_of;
using vrl_v2::file_failure;
using vrl_v2::file_outcome;
using zip_test::ScratchFolder;

/// Whether an action that met a failing allocation got through all the same.
enum class passed { no, yes };
/// After each action; told whether it passed.
using check = std::function<void(passed)>;

/// Lets each allocation of an action fail in turn. How many there were.
std::size_t fail_each(const std::function<file_outcome()>& action, const check& judge) {
    std::size_t thrown = 0;
    for (std::size_t n = 0;; ++n) {
        file_outcome outcome;
        bool threw = false;
        g_left = n;
        g_armed = true;
        try {
            outcome = action();
        } catch (const std::bad_alloc&) {
            threw = true;
        }
        const bool met = !g_armed;
        g_armed = false;
        thrown += threw ? 1 : 0;
        if (!threw && !outcome) {
            EXPECT_EQ(outcome.failure, file_failure::system_error) << n << ": " << outcome.message;
        }
        judge(!threw && outcome ? passed::yes : passed::no);
        if (!met) break;
    }
    return thrown;
}

class Allocations : public testing::TestWithParam<const char*> {};

TEST_P(Allocations, OfASaveMayFailAndTheOldFileStays) {
    const ScratchFolder folder;
    const std::string path = folder / GetParam();
    const auto document = document_of(2, L"new");
    const std::string new_text = text_of(document);
    const std::size_t open = zip_test::OpenDescriptors();
    folder.Write(GetParam(), "old");
    const std::size_t thrown = fail_each([&]() -> file_outcome { return save_document(document, path); },
                                         [&](passed how) {
                                             EXPECT_EQ(zip_test::OpenDescriptors(), open);
                                             EXPECT_EQ(folder.Names().size(), 1u);
                                             if (how == passed::no) {
                                                 EXPECT_EQ(folder.Read(GetParam()), "old");
                                                 return;
                                             }
                                             const auto loaded = vrl_v2::load_document(path);
                                             ASSERT_TRUE(loaded) << loaded.message;
                                             EXPECT_EQ(text_of(*loaded.document), new_text);
                                             folder.Write(GetParam(), "old");
                                         });
    EXPECT_GT(thrown, 10u);
}

TEST_P(Allocations, OfALoadMayFail) {
    const ScratchFolder folder;
    const std::string path = folder / GetParam();
    const auto document = document_of(2);
    const std::string text = text_of(document);
    ASSERT_TRUE(save_document(document, path));
    const std::size_t open = zip_test::OpenDescriptors();
    vrl_v2::load_result result;
    const std::size_t thrown = fail_each(
        [&]() -> file_outcome {
            result = {};
            result = vrl_v2::load_document(path);
            return result;
        },
        [&](passed how) {
            EXPECT_EQ(zip_test::OpenDescriptors(), open);
            if (how == passed::no) {
                EXPECT_EQ(result.document, nullptr);
            } else {
                EXPECT_EQ(text_of(*result.document), text);
            }
        });
    EXPECT_GT(thrown, 50u);
}

TEST_P(Allocations, OfASaveToAStringOrAStreamMayFail) {
    const auto document = document_of(2);
    vrl_v2::save_options options;
    if (std::string(GetParam()) == "a.vrlz") options.format = vrl_v2::file_format::packed;
    std::string bytes = "old";
    fail_each([&]() -> file_outcome { return save_document_to_memory(document, bytes, options); },
              [&](passed how) {
                  if (how == passed::no) {
                      EXPECT_EQ(bytes, "old");
                  } else {
                      EXPECT_TRUE(vrl_v2::load_document_from_memory(bytes));
                  }
                  bytes = "old";
              });
    std::string streamed;
    fail_each(
        [&]() -> file_outcome {
            std::ostringstream stream;
            file_outcome outcome = save_document(document, stream, options);
            streamed = std::move(stream).str();
            return outcome;
        },
        [&](passed how) {
            if (how == passed::no) return;
            EXPECT_TRUE(vrl_v2::load_document_from_memory(streamed));
        });
}

INSTANTIATE_TEST_SUITE_P(DocumentFile, Allocations, testing::Values("a.vrl", "a.vrlz"), [](const auto& row) {
    return std::string(row.param) == "a.vrl" ? "Plain" : "Packed";
});

}  // namespace
