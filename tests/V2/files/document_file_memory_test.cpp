#include <gtest/gtest.h>
#include <malloc.h>

#include <algorithm>
#include <cstdlib>
#include <new>

#include "document_files.h"

// How much memory a load and a save take beside the document itself.

namespace {

std::size_t g_used = 0;
std::size_t g_most = 0;

void* take(std::size_t size) {
    void* const block = std::malloc(size == 0 ? 1 : size);
    if (block == nullptr) throw std::bad_alloc();
    g_used += ::malloc_usable_size(block);
    g_most = std::max(g_most, g_used);
    return block;
}

void give_back(void* block) {
    if (block != nullptr) g_used -= ::malloc_usable_size(block);
    std::free(block);
}

}  // namespace

void* operator new(std::size_t size) { return take(size); }
void* operator new[](std::size_t size) { return take(size); }
void operator delete(void* block) noexcept { give_back(block); }
void operator delete(void* block, std::size_t) noexcept { give_back(block); }
void operator delete[](void* block) noexcept { give_back(block); }
void operator delete[](void* block, std::size_t) noexcept { give_back(block); }

namespace {

using vrl_v2::load_document;
using vrl_v2::save_document;

/// What the compressors take beside that, with malloc: deflate some 268 KB, inflate 44 KB. (zconf.h)
constexpr std::size_t k_library = 300 << 10;
constexpr std::size_t k_allowed = (1 << 20) - k_library;

/// The most that an action had at a time, above what there was before it.
template <class Action>
std::size_t most_taken(const Action& action) {
    const std::size_t before = g_used;
    g_most = g_used;
    action();
    return g_most - before;
}

/// A large text whose document is a small one: what is read is passed over.
std::string text_with_comments(std::size_t size) {
    std::string text = vrl_test::k_declaration;
    std::uint32_t state = 1;
    while (text.size() < size) {
        text += "<!-- ";
        for (int i = 0; i < 100; ++i) {
            state = state * 1664525U + 1013904223U;
            text += static_cast<char>('a' + (state >> 24) % 26);
        }
        text += " -->\n";
    }
    return text + vrl_test::document(vrl_test::color());
}

TEST(DocumentFileMemory, LoadsHoldNoMoreThanAWindow) {
    const zip_test::ScratchFolder folder;
    {
        const std::string text = text_with_comments(16 << 20);
        folder.Write("a.vrl", text);
        folder.Write("a.vrlz",
                     zip_test::RawArchive::Of({zip_test::RawEntry::DeflatedEntry("a", text)}).Build());
        folder.Write("b.vrlz", zip_test::RawArchive::Of({zip_test::RawEntry::Stored("a", text)}).Build());
    }
    for (const char* name : {"a.vrl", "a.vrlz", "b.vrlz"}) {
        const std::string path = folder / name;
        const std::size_t most = most_taken([&] { EXPECT_TRUE(load_document(path)); });
        EXPECT_LT(most, k_allowed) << name;
        EXPECT_GT(most, 60000u) << "the window itself was counted";
    }
}

TEST(DocumentFileMemory, SavesHoldNoMoreThanABuffer) {
    const zip_test::ScratchFolder folder;
    std::size_t of_small = 0;
    for (const unsigned colors : {100U, 8000U}) {
        const vrl_v2::Vrl document = vrl_test::document_of(colors);
        for (const char* name : {"a.vrl", "a.vrlz"}) {
            const std::string path = folder / name;
            const std::size_t most = most_taken([&] { EXPECT_TRUE(save_document(document, path)); });
            EXPECT_LT(most, k_allowed) << name;
            if (colors == 100) of_small = std::max(of_small, most);
            if (colors == 8000) {
                EXPECT_LT(most, of_small + 65536) << "constant in the document's size";
            }
        }
    }
}

}  // namespace
