// Every allocation fails once in turn.

#include <gtest/gtest.h>

#include <cstdlib>
#include <new>
#include <set>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

// Armed, the allocation of this number fails; all others are counted down.
bool g_armed = false;
std::size_t g_left = 0;

bool FailsNow() {
    if (!g_armed) return false;
    if (g_left-- != 0) return false;
    g_armed = false;
    return true;
}

}  // namespace

void* operator new(std::size_t size) {
    void* block = FailsNow() ? nullptr : std::malloc(size != 0 ? size : 1);
    if (block == nullptr) throw std::bad_alloc();
    return block;
}
void* operator new[](std::size_t size) { return operator new(size); }
void operator delete(void* block) noexcept { std::free(block); }
void operator delete[](void* block) noexcept { std::free(block); }
void operator delete(void* block, std::size_t /*size*/) noexcept { std::free(block); }
void operator delete[](void* block, std::size_t /*size*/) noexcept { std::free(block); }

namespace {

using zip_test::Bytes;
using zip_test::RawArchive;
using zip_test::RawEntry;

constexpr int k_badAlloc = -1;

// The outcome of an action whose allocation number `n` fails: a code, or `k_badAlloc`, or 0.
int Outcome(std::size_t n, const std::function<void()>& action, bool& met) {
    g_left = n;
    g_armed = true;
    int outcome = 0;
    try {
        action();
    } catch (const CZipException& exception) {
        outcome = exception.GetCode();
    } catch (const std::bad_alloc&) {
        outcome = k_badAlloc;
    }
    met = !g_armed;
    g_armed = false;
    return outcome;
}

// All codes that come of it until nothing fails any more.
std::set<int> Outcomes(const std::function<void(CZipArchive&, CZipMemFile&)>& run, const Bytes& bytes) {
    std::set<int> outcomes;
    bool met = true;
    for (std::size_t n = 0; met; ++n) {
        CZipMemFile file(65536);
        file.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()));
        CZipArchive archive;
        const int outcome = Outcome(
            n, [&] { run(archive, file); }, met);
        EXPECT_NO_THROW(archive.Close(1)) << n;
        EXPECT_TRUE(archive.IsClosed()) << n;
        if (met)
            outcomes.insert(outcome);
        else
            EXPECT_EQ(outcome, 0) << n;
        if (n > 5000) {
            ADD_FAILURE() << "no end";
            break;
        }
    }
    return outcomes;
}

TEST(FailingAllocation, DuringALoadIsABadAllocOrACodeAndLeaksNothing) {
    const Bytes text = zip_test::SampleText(1000);
    const Bytes bytes =
        RawArchive::Of({RawEntry::DeflatedEntry("a", text), RawEntry::Bzip2Entry("b", text)}).Build();
    const auto load = [](CZipArchive& archive, CZipMemFile& file) {
        archive.Open(file, CZipStorage::openReadOnly);
        for (std::uint16_t i = 0; i < 2; ++i) {
            archive.OpenEntry(i);
            Bytes out(1000, '\0');
            archive.ReadEntry(out.data(), 1000);
            archive.CloseEntry();
        }
        archive.Close();
    };
    const std::set<int> outcomes = Outcomes(load, bytes);
    EXPECT_TRUE(outcomes.count(k_badAlloc)) << "a buffer";
    EXPECT_TRUE(outcomes.count(CZipException::vectorNotGrown)) << "a vector of the engine";
    EXPECT_TRUE(outcomes.count(CZipException::zlibMemory)) << "zlib's";
    EXPECT_TRUE(outcomes.count(CZipException::bzip2Memory)) << "bzip2's";
    for (const int outcome : outcomes) {
        EXPECT_TRUE(outcome == k_badAlloc || outcome == CZipException::vectorNotGrown ||
                    outcome == CZipException::zlibMemory || outcome == CZipException::bzip2Memory)
            << outcome;
    }
}

TEST(FailingAllocation, DuringASaveIsABadAllocOrACodeAndLeaksNothing) {
    const Bytes text = zip_test::SampleText(1000);
    for (const std::uint16_t method : {CZipFileHeader::deflated, CZipFileHeader::bzip2}) {
        const auto save = [&](CZipArchive& archive, CZipMemFile& file) {
            archive.Open(file, CZipStorage::create);
            archive.SetPassword("barn red");
            archive.SetEncryptionMethod(CZipEncryption::aes128);
            archive.SetCompressionMethod(method);
            CZipFileHeader header;
            header.SetFileName("a name that needs memory of its own");
            archive.OpenNewEntry(header, -1);
            archive.WriteNewEntry(text.data(), 1000);
            archive.CloseNewEntry();
            archive.Close();
        };
        const std::set<int> outcomes = Outcomes(save, {});
        EXPECT_TRUE(outcomes.count(k_badAlloc));
        EXPECT_TRUE(outcomes.count(CZipException::vectorNotGrown));
        const int library =
            method == CZipFileHeader::bzip2 ? CZipException::bzip2Memory : CZipException::zlibMemory;
        EXPECT_TRUE(outcomes.count(library));
    }
}

}  // namespace
