#include "V2/packed_route.h"

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <limits>
#include <new>

#include "tests/V2/documents.h"
#include "tests/zip/raw_archive.h"
#include "tests/zip/support.h"
#include "zip/zip_archive.h"

namespace {

/// Requests above these sizes fail.
std::size_t g_largest_array = std::numeric_limits<std::size_t>::max();
std::size_t g_largest_object = std::numeric_limits<std::size_t>::max();

void* allocate(std::size_t size, std::size_t largest) {
    void* const block = size > largest ? nullptr : std::malloc(size == 0 ? 1 : size);
    if (block == nullptr) throw std::bad_alloc();
    return block;
}

}  // namespace

void* operator new(std::size_t size) { return allocate(size, g_largest_object); }
void* operator new[](std::size_t size) { return allocate(size, g_largest_array); }
void operator delete(void* block) noexcept { std::free(block); }
void operator delete(void* block, std::size_t) noexcept { std::free(block); }
void operator delete[](void* block) noexcept { std::free(block); }
void operator delete[](void* block, std::size_t) noexcept { std::free(block); }

namespace {

using vrl_v2::Vrl;
using zip_test::Bytes;
using zip_test::RawArchive;
using zip_test::RawEntry;

constexpr int k_failed = 1000;

/// What left the call as an exception: its code, and the path that it names. Or the result.
struct outcome {
    int result = -1;
    int thrown = -1;
    std::string path;
};

template <class Call>
outcome outcome_of(const Call& call) {
    outcome what;
    try {
        what.result = call();
    } catch (const CZipException& exception) {
        what.thrown = exception.GetCode();
        what.path = exception.GetPath();
    }
    return what;
}

outcome load(Vrl& document, const std::wstring& path) {
    return outcome_of([&] { return document.loadFile(path); });
}

outcome load(const std::wstring& path) {
    Vrl document;
    return load(document, path);
}

outcome write(const Vrl& document, const std::wstring& path) {
    return outcome_of([&] { return document.writeFile(path); });
}

Vrl complete_document() {
    Vrl document;
    vrl_test::complete(document);
    document.append_Color();
    vrl_test::complete(document.back_Color());
    return document;
}

const Bytes k_text = vrl_test::k_declaration + vrl_test::document(vrl_test::color("packed"));

/// A folder of its own as the current one: where the engine's short names end up.
class PackedRoute : public testing::Test {
protected:
    zip_test::ScratchFolder folder;
    zip_test::CurrentFolder current{folder.Path()};

    void has_only(std::vector<std::string> names) const {
        std::sort(names.begin(), names.end());
        std::vector<std::string> found = folder.Names();
        std::sort(found.begin(), found.end());
        EXPECT_EQ(found, names);
    }
    /// Under the name by which the engine knows "a.vrlz".
    void pack(const RawArchive& archive) const { folder.Write("a", archive.Build()); }
    void pack(RawEntry entry) const { pack(RawArchive::Of({std::move(entry)})); }
};

RawEntry deflated() { return RawEntry::DeflatedEntry("a.vrl", k_text); }
RawEntry stored() { return RawEntry::Stored("a.vrl", k_text); }
RawEntry bzip2ed() { return RawEntry::Bzip2Entry("a.vrl", k_text); }

// Writing --------------------------------------------------------------------------------------------------

TEST_F(PackedRoute, WritesAnEmptyEntryUnderTheFirstCharacterOfThePath) {
    const outcome written = write(complete_document(), L"C:\\data\\a.vrlz");
    EXPECT_EQ(written.result, 0);
    has_only({"C"});

    CZipArchive archive;
    archive.Open("C", CZipStorage::openReadOnly);
    ASSERT_EQ(archive.GetCount(), 1);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "C");
    EXPECT_EQ(archive.GetEntryHeader(0)->GetUncompressedSize(), 0u);
    EXPECT_FALSE(archive.GetEntryHeader(0)->IsEncrypted());
    EXPECT_EQ(zip_test::Run("unzip -t C"), 0);
}

TEST_F(PackedRoute, HandsTheEngineTheBytesOfThePathUpToTheFirstZeroByte) {
    const struct {
        std::wstring path;
        std::string name;
    } rows[] = {
        {L"a.vrlz", "a"},
        {L"\x00E4.vrlz", "\xE4"},
        {L" .vrlz", " "},
        {L"\x0140"
         L"a.vrlz",
         "@\x01"
         "a"},
        {L"\x4E2D\x6587.vrlz",
         "-N\x87"
         "e."},
        {L"\x4E2D\x6587\x4E2D.vrlz",
         "-N\x87"
         "e-N."},
        {L"\x4E2D\x0100.vrlz", "-N"},
        {L"\x6241\x6443.vrlz", "AbCd."},
        {std::wstring(L"\x6241\0\x6443.vrlz", 8), "Ab"},
        // A character beyond 16 bits is two units, however the platform holds it: D83D DE00.
        {L"\xD83D\xDE00.vrlz", "=\xD8"},
        {L"\x1F600.vrlz", "=\xD8"},
        // D83D DE01, then '.'.
        {L"\x1F601.vrlz", "=\xD8\x01\xDE."},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.name);
        EXPECT_EQ(write(complete_document(), row.path).result, 0);
        has_only({row.name});
        folder.Write(row.name, RawArchive::Of({deflated()}).Build());
        Vrl document;
        EXPECT_EQ(load(document, row.path).result, 0);
        EXPECT_EQ(document.size_Color(), 1u);
        std::filesystem::remove(row.name);
    }
}

TEST_F(PackedRoute, HandsOnNoNameForAPathThatBeginsWithAZeroByte) {
    const outcome written = write(complete_document(), L"\x0100.vrlz");
    EXPECT_EQ(written.thrown, ENOENT);
    EXPECT_EQ(written.path, "");
    has_only({"\xC4\x80.vrl"});
    EXPECT_EQ(load(L"\x0100.vrlz").thrown, ENOENT);
}

TEST_F(PackedRoute, NamesTheEntryByTheLastPartOfTheEnginesPath) {
    std::filesystem::create_directory("a");
    // 2F61 0062: "a/b".
    EXPECT_EQ(write(complete_document(),
                    L"\x2F61"
                    L"b.vrlz")
                  .result,
              0);
    CZipArchive archive;
    archive.Open("a/b", CZipStorage::openReadOnly);
    ASSERT_EQ(archive.GetCount(), 1);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "b");
}

TEST_F(PackedRoute, LosesAPlainFileOfTheSameName) {
    folder.Write("a.vrl", "somebody's own");
    EXPECT_EQ(write(complete_document(), L"a.vrlz").result, 0);
    has_only({"a"});
}

TEST_F(PackedRoute, ReplacesAnEarlierArchive) {
    folder.Write("a", Bytes(10000, 'x'));
    EXPECT_EQ(write(complete_document(), L"a.vrlz").result, 0);
    EXPECT_LT(folder.Read("a").size(), 300u);
    EXPECT_EQ(zip_test::Run("unzip -t a"), 0);
}

TEST_F(PackedRoute, StampsTheDocumentLikeAPlainWrite) {
    const Vrl document = complete_document();
    EXPECT_FALSE(document.get_Preamble().get_Header().isset_WriteSDKInformation());
    EXPECT_EQ(write(document, L"a.vrlz").result, 0);
    EXPECT_TRUE(document.get_Preamble().get_Header().isset_WriteSDKInformation());
}

TEST_F(PackedRoute, TouchesNoArchiveForADocumentThatIsNotComplete) {
    folder.Write("a", "earlier");
    folder.Write("a.vrl", "earlier");
    const Vrl document;
    EXPECT_EQ(write(document, L"a.vrlz").result, qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
    has_only({"a"});
    EXPECT_EQ(folder.Read("a"), "earlier");
}

TEST_F(PackedRoute, KeepsThePlainFileWhenTheArchiveCannotBeOpened) {
    const std::wstring path = (folder.Path() / "a.vrlz").wstring();
    const outcome written = write(complete_document(), path);
    EXPECT_EQ(written.thrown, EISDIR) << "the engine was handed \"/\"";
    EXPECT_EQ(written.path, "/");
    has_only({"a.vrl"});
    Vrl document;
    EXPECT_EQ(load(document, L"a.vrl").result, 0);
}

TEST_F(PackedRoute, TakesTheBareSuffixForTheCurrentFolder) {
    EXPECT_EQ(write(complete_document(), L".vrlz").thrown, EISDIR);
    has_only({".vrl"});
}

TEST_F(PackedRoute, LeavesAFolderInThePlaceOfThePlainFile) {
    std::filesystem::create_directory("a.vrl");
    EXPECT_EQ(write(complete_document(), L"a.vrlz").result, 0);
    EXPECT_EQ(write(Vrl(), L"a.vrlz").result, qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
    has_only({"a", "a.vrl"});
}

TEST_F(PackedRoute, WritesNothingBesideAPlainFileThatCannotBeMade) {
    EXPECT_EQ(write(complete_document(), L"missing/a.vrlz").result, 0);
    has_only({"m"});
}

/// Lets files grow to so many bytes and no further.
class file_size_limit {
public:
    explicit file_size_limit(rlim_t bytes) : m_signal(std::signal(SIGXFSZ, SIG_IGN)) {
        ::getrlimit(RLIMIT_FSIZE, &m_before);
        rlimit limit = m_before;
        limit.rlim_cur = bytes;
        ::setrlimit(RLIMIT_FSIZE, &limit);
    }
    file_size_limit(const file_size_limit&) = delete;
    file_size_limit& operator=(const file_size_limit&) = delete;
    ~file_size_limit() {
        ::setrlimit(RLIMIT_FSIZE, &m_before);
        std::signal(SIGXFSZ, m_signal);
    }

private:
    void (*m_signal)(int);
    rlimit m_before{};
};

TEST_F(PackedRoute, GivesThousandAndKeepsThePlainFileWhenPackingFails) {
    const Vrl document = complete_document();
    outcome written;
    {
        const file_size_limit limit(16);
        written = write(document, L"a.vrlz");
    }
    EXPECT_EQ(written.result, k_failed);
    has_only({"a", "a.vrl"});
    EXPECT_EQ(folder.Read("a").find("PK\5\6"), Bytes::npos) << "an archive without a directory";
}

TEST_F(PackedRoute, GivesThousandWhenTheFileToPackCannotBeOpened) {
    std::filesystem::permissions(folder.Path(), std::filesystem::perms::all);
    const bool is_root = ::geteuid() == 0;
    if (is_root) {
        ASSERT_EQ(::seteuid(65534), 0);
    }
    const mode_t mask = ::umask(0777);
    const outcome written = write(complete_document(), L"a.vrlz");
    ::umask(mask);
    if (is_root) {
        ASSERT_EQ(::seteuid(0), 0);
    }
    EXPECT_EQ(written.result, k_failed) << "what has just been created may be written and not read";
    has_only({"a", "a.vrl"});
}

// Reading --------------------------------------------------------------------------------------------------

TEST_F(PackedRoute, ReadsWhatItHasWrittenAsAnEmptyDocument) {
    ASSERT_EQ(write(complete_document(), L"C:\\data\\a.vrlz").result, 0);
    Vrl document;
    EXPECT_EQ(load(L"C:\\data\\a.vrlz").result, document.loadString(L""));
    EXPECT_NE(load(L"C:\\data\\a.vrlz").result, 0);
}

TEST_F(PackedRoute, LetsTheExceptionForAMissingFileLeave) {
    const outcome loaded = load(L"C:\\data\\a.vrlz");
    EXPECT_EQ(loaded.thrown, ENOENT);
    EXPECT_EQ(loaded.path, "C");
}

TEST_F(PackedRoute, ReadsEachMethod) {
    for (const RawEntry& entry : {stored(), deflated(), bzip2ed()}) {
        pack(entry);
        Vrl document;
        EXPECT_EQ(load(document, L"a.vrlz").result, 0) << entry.method;
        ASSERT_EQ(document.size_Color(), 1u);
        EXPECT_EQ(document.get_Color(0).get_ColorName(), L"packed");
    }
}

TEST_F(PackedRoute, NeverLooksAtTheNameOfTheEntry) {
    for (const char* name : {"b.vrl", "picture.png", "../../up.vrl", "/etc/passwd", "folder/", ""}) {
        pack(RawEntry::DeflatedEntry(name, k_text));
        EXPECT_EQ(load(L"a.vrlz").result, 0) << name;
    }
    has_only({"a"});
}

TEST_F(PackedRoute, IgnoresLaterEntries) {
    RawEntry broken = RawEntry::Stored("b.vrl", "no document");
    broken.crc ^= 1;
    pack(RawArchive::Of({deflated(), broken, stored()}));
    EXPECT_EQ(load(L"a.vrlz").result, 0);
    pack(RawArchive::Of({broken, deflated()}));
    EXPECT_EQ(load(L"a.vrlz").result, k_failed);
}

TEST_F(PackedRoute, TakesForTheFirstEntryWhatStandsFirstInTheFile) {
    RawArchive archive = RawArchive::Of({RawEntry::Stored("b.vrl", "no document"), deflated()});
    const auto first = static_cast<std::uint32_t>(archive.entries[0].Local().size());
    archive.entries[0].offset = first;
    archive.entries[1].offset = 0;
    const Bytes bytes = archive.entries[1].Local() + archive.entries[0].Local();
    Bytes built = archive.Build();
    built.replace(0, bytes.size(), bytes);
    folder.Write("a", built);
    EXPECT_EQ(load(L"a.vrlz").result, 0);
}

TEST_F(PackedRoute, ReadsBehindAStub) {
    RawArchive archive = RawArchive::Of({deflated()});
    archive.stub = Bytes(5000, '#');
    archive.comment = "a comment";
    pack(archive);
    EXPECT_EQ(load(L"a.vrlz").result, 0);
}

TEST_F(PackedRoute, LeavesTheBytesOfTheDocumentToTheReader) {
    Bytes utf16 = "\xFF\xFE";
    for (const char c : vrl_test::document(vrl_test::color())) utf16 += Bytes{c, '\0'};
    const Bytes with_mark = "\xEF\xBB\xBF" + k_text;
    for (const Bytes& text : {utf16, with_mark}) {
        pack(RawEntry::DeflatedEntry("a.vrl", text));
        EXPECT_EQ(load(L"a.vrlz").result, 0);
    }
}

TEST_F(PackedRoute, GivesTheReadersOwnCodeForABadDocument) {
    const struct {
        const char* text;
        int code;
    } rows[] = {
        {"<Vrl:Vrl", 0},
        {"no XML", 0},
        {"<Other/>", qbxV2::EQBX_ELEMENT_NOT_FOUND},
    };
    for (const auto& row : rows) {
        pack(RawEntry::DeflatedEntry("a.vrl", row.text));
        Vrl document;
        const int expected = document.unmarshal(std::string(row.text));
        const int code = load(L"a.vrlz").result;
        EXPECT_EQ(code, expected) << row.text;
        EXPECT_NE(code, 0) << row.text;
        if (row.code != 0) {
            EXPECT_EQ(code, row.code);
        }
    }
}

TEST_F(PackedRoute, ReadsIntoAUsedObjectWithoutResettingIt) {
    pack(deflated());
    Vrl document;
    ASSERT_EQ(load(document, L"a.vrlz").result, 0);
    const int again = load(document, L"a.vrlz").result;
    Vrl from_text;
    ASSERT_EQ(from_text.unmarshal(k_text), 0);
    EXPECT_EQ(again, from_text.unmarshal(k_text));
    EXPECT_EQ(document.size_Color(), from_text.size_Color());
}

TEST_F(PackedRoute, TellsSuffixesApartByCase) {
    folder.Write("a.VRLZ", RawArchive::Of({deflated()}).Build());
    const outcome loaded = load(L"a.VRLZ");
    EXPECT_EQ(loaded.thrown, -1);
    EXPECT_GT(loaded.result, 0);
    EXPECT_LT(loaded.result, k_failed) << "read as plain XML";
}

/// What comes of an archive with one thing wrong.
struct damage {
    const char* name;
    void (*apply)(RawArchive&);
    int result;
    int thrown;
};

RawEntry& first(RawArchive& archive) { return archive.entries.front(); }

const damage k_damages[] = {
    // Ahead of the guarded stretch exceptions leave.
    {"NoEntries", [](RawArchive& a) { a.entries.clear(); }, -1, 100},
    {"OnlyAnEnd",
     [](RawArchive& a) {
         a = {};
         a.stub = k_text;
     },
     -1, 100},
    {"LocalSignature", [](RawArchive& a) { first(a).localSignature = "PK\3\5"; }, -1, 101},
    {"CentralSignature", [](RawArchive& a) { first(a).centralSignature = "PK\1\3"; }, -1, 101},
    {"LocalMethod", [](RawArchive& a) { first(a).localMethod = 0; }, -1, 101},
    {"LocalFlags", [](RawArchive& a) { first(a).localFlags = 2; }, -1, 101},
    {"LocalCrc", [](RawArchive& a) { first(a).localCrc = 1; }, -1, 101},
    {"LocalUncompressedSize", [](RawArchive& a) { first(a).localUncompressed = 1; }, -1, 101},
    {"LocalCompressedSize", [](RawArchive& a) { first(a).localCompressed = 1; }, -1, 101},
    {"LocalHeaderElsewhere", [](RawArchive& a) { first(a).offset = 1; }, -1, 101},
    {"DirectoryCutOff",
     [](RawArchive& a) {
         a.total = 2;
         a.entriesHere = 2;
     },
     -1, 101},
    {"OffsetBehindTheEnd", [](RawArchive& a) { a.offset = 0x7FFFFFFF; }, -1, 101},
    {"OneOfSeveralVolumes", [](RawArchive& a) { a.disk = 3; }, -1, ENOENT},
    {"Enciphered",
     [](RawArchive& a) {
         first(a).flags = 1;
         first(a).data = Bytes(12, '?') + first(a).data;
     },
     -1, 112},
    {"EncipheredByAes",
     [](RawArchive& a) {
         const Bytes record = zip_test::ExtraRecord(
             0x9901, zip_test::Number16(1) + "AE" + Bytes(1, '\3') + zip_test::Number16(8));
         first(a).flags = 1;
         first(a).method = 99;
         first(a).localExtra = first(a).centralExtra = record;
         first(a).data = Bytes(18, '?') + first(a).data + Bytes(10, '?');
     },
     -1, 112},
    // From there on everything is 1000.
    {"Crc", [](RawArchive& a) { first(a).crc ^= 1; }, k_failed, -1},
    {"StreamDamaged", [](RawArchive& a) { first(a).data[2] = static_cast<char>(first(a).data[2] ^ 0x55); },
     k_failed, -1},
    {"StreamReserved", [](RawArchive& a) { first(a).data[0] = '\7'; }, k_failed, -1},
    {"StreamCutOff", [](RawArchive& a) { first(a).data.resize(first(a).data.size() / 2); }, k_failed, -1},
    {"StreamEmpty", [](RawArchive& a) { first(a).data.clear(); }, k_failed, -1},
    {"DeclaredSizeAboveTheTrueOne", [](RawArchive& a) { first(a).uncompressed += 1; }, k_failed, -1},
    {"DeclaredSizeBelowTheTrueOne",
     [](RawArchive& a) {
         first(a).uncompressed -= 1;
         first(a).crc = zip_test::Crc32(k_text.substr(0, k_text.size() - 1));
     },
     k_failed, -1},
    {"DeclaredSizeZero",
     [](RawArchive& a) {
         first(a).uncompressed = 0;
         first(a).crc = 0;
     },
     k_failed, -1},
    {"MethodUnknown", [](RawArchive& a) { first(a).method = 9; }, k_failed, -1},
    {"MethodUnknownAndSizeZero",
     [](RawArchive& a) {
         first(a).method = 14;
         first(a).uncompressed = 0;
     },
     k_failed, -1},
    {"StoredShort",
     [](RawArchive& a) {
         first(a) = stored();
         first(a).uncompressed += 5;
     },
     k_failed, -1},
    {"StoredWithAnotherCrc",
     [](RawArchive& a) {
         first(a) = stored();
         first(a).uncompressed -= 5;
     },
     k_failed, -1},
    {"Bzip2Damaged",
     [](RawArchive& a) {
         first(a) = bzip2ed();
         first(a).data[40] = static_cast<char>(first(a).data[40] ^ 0x55);
     },
     k_failed, -1},
    {"Bzip2DeclaredSizeBelowTheTrueOne",
     [](RawArchive& a) {
         first(a) = bzip2ed();
         first(a).uncompressed -= 1;
     },
     k_failed, -1},
};

class DamagedPackedRoute : public PackedRoute, public testing::WithParamInterface<damage> {};

TEST_P(DamagedPackedRoute, EndsAsTold) {
    RawArchive archive = RawArchive::Of({deflated()});
    GetParam().apply(archive);
    pack(archive);
    const std::size_t open = zip_test::OpenDescriptors();
    Vrl document;
    const outcome loaded = load(document, L"a.vrlz");
    EXPECT_EQ(loaded.result, GetParam().result);
    EXPECT_EQ(loaded.thrown, GetParam().thrown);
    EXPECT_EQ(document.size_Color(), 0u) << "nothing was read";
    EXPECT_EQ(zip_test::OpenDescriptors(), open);
}

INSTANTIATE_TEST_SUITE_P(Rows, DamagedPackedRoute, testing::ValuesIn(k_damages),
                         [](const auto& row) { return std::string(row.param.name); });

TEST_F(PackedRoute, ReadsTheDocumentOrNothingWhateverBitIsFlippedAndWhereverItIsCut) {
    const Bytes whole = RawArchive::Of({deflated()}).Build();
    const std::size_t open = zip_test::OpenDescriptors();
    // Always a new file: one that is written over waits for the disk.
    const auto put = [&](const Bytes& bytes) {
        std::filesystem::remove("a");
        folder.Write("a", bytes);
    };
    for (std::size_t bit = 0; bit < 8 * whole.size(); ++bit) {
        Bytes bytes = whole;
        bytes[bit / 8] = static_cast<char>(bytes[bit / 8] ^ (1 << (bit % 8)));
        put(bytes);
        Vrl document;
        const outcome loaded = load(document, L"a.vrlz");
        EXPECT_TRUE(loaded.result == 0 || loaded.result == k_failed || loaded.thrown > 0) << bit;
        ASSERT_EQ(document.size_Color(), loaded.result == 0 ? 1u : 0u) << bit;
        if (loaded.result == 0) {
            EXPECT_EQ(document.get_Color(0).get_ColorName(), L"packed") << bit;
        }
    }
    for (std::size_t size = 0; size < whole.size(); ++size) {
        put(whole.substr(0, size));
        EXPECT_EQ(load(L"a.vrlz").thrown, 101) << size;
    }
    EXPECT_EQ(zip_test::OpenDescriptors(), open);
}

TEST_F(PackedRoute, LetsTheExceptionForAnythingElseThanAnArchiveLeave) {
    for (const Bytes& bytes : {Bytes(), Bytes("PK\3\4"), k_text, Bytes(100000, 'P')}) {
        folder.Write("a", bytes);
        const outcome loaded = load(L"a.vrlz");
        EXPECT_EQ(loaded.thrown, 101);
        EXPECT_EQ(loaded.path, "a");
    }
}

TEST_F(PackedRoute, LetsTheFailureToAllocateTheDeclaredSizeLeave) {
    RawEntry entry = deflated();
    entry.uncompressed = 0xFFFFFFF0;
    pack(entry);
    g_largest_array = std::size_t{1} << 30;
    Vrl document;
    EXPECT_THROW(static_cast<void>(document.loadFile(L"a.vrlz")), std::bad_alloc);
    g_largest_array = std::numeric_limits<std::size_t>::max();
}

TEST_F(PackedRoute, TurnsWhatTheReaderThrowsIntoThousand) {
    constexpr std::size_t k_name = std::size_t{1} << 20;
    pack(RawEntry::DeflatedEntry("a.vrl", vrl_test::document(vrl_test::color(Bytes(k_name, 'n')))));
    Vrl document;
    g_largest_object = k_name / 2;
    const outcome loaded = load(document, L"a.vrlz");
    g_largest_object = std::numeric_limits<std::size_t>::max();
    EXPECT_EQ(loaded.result, k_failed);
}

TEST_F(PackedRoute, ReadsStoredBytesUpToTheDeclaredSizeIfTheirCrcIsRight) {
    RawEntry entry = stored();
    entry.data += "<!-- behind the declared size -->";
    pack(entry);
    EXPECT_EQ(load(L"a.vrlz").result, 0) << "only deflate and bzip2 know where their data ends";
}

TEST_F(PackedRoute, TakesADataDescriptorAsItComes) {
    RawEntry entry = deflated();
    entry.flags = 8;
    entry.localCrc = entry.localCompressed = entry.localUncompressed = 0;
    entry.descriptor = Bytes("PK\7\10") + Bytes(12, '?');
    pack(entry);
    EXPECT_EQ(load(L"a.vrlz").result, 0);
}

}  // namespace
