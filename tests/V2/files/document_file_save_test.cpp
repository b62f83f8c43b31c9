#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <thread>

#include "document_files.h"
#include "runtime/xml_writer.h"
#include "zip/zip_archive.h"

namespace {

namespace fs = std::filesystem;

using vrl_test::document_of;
using vrl_test::text_of;
using vrl_test::with_crlf;
using vrl_v2::file_failure;
using vrl_v2::file_format;
using vrl_v2::load_document;
using vrl_v2::load_document_from_memory;
using vrl_v2::save_document;
using vrl_v2::save_document_to_memory;
using vrl_v2::save_options;
using vrl_v2::save_result;
using vrl_v2::Vrl;
using zip_test::ScratchFolder;

std::string packed_bytes(const Vrl& document) {
    save_options options;
    options.format = file_format::packed;
    std::string bytes;
    EXPECT_TRUE(save_document_to_memory(document, bytes, options));
    return bytes;
}

/// The one entry of an archive, by the engine itself.
struct entry {
    std::string name;
    std::string text;
    unsigned method = 0;
    unsigned count = 0;
};

entry entry_of(const std::string& path) {
    CZipArchive archive;
    archive.Open(path.c_str(), CZipStorage::openReadOnly);
    entry found;
    found.count = archive.GetCount();
    archive.OpenEntry(0);
    found.name = archive.GetEntryHeader(0)->GetFileName();
    found.method = archive.GetEntryHeader(0)->GetMethod();
    found.text.resize(archive.GetEntryHeader(0)->GetUncompressedSize());
    EXPECT_EQ(archive.ReadEntry(found.text.data(), static_cast<std::uint32_t>(found.text.size())),
              found.text.size());
    EXPECT_EQ(archive.CloseEntry(), 1);
    return found;
}

// What is written ------------------------------------------------------------------------------------------

TEST(SaveDocument, WritesWhatWriteFileWrites) {
    const ScratchFolder folder;
    const auto loaded = load_document_from_memory(vrl_test::rich_document());
    ASSERT_TRUE(loaded);
    ASSERT_TRUE(save_document(*loaded.document, folder / "new.vrl"));
    Vrl copy(*loaded.document);
    ASSERT_EQ(copy.writeFile((folder.Path() / "old.vrl").wstring()), 0);
    EXPECT_EQ(folder.Read("new.vrl"), folder.Read("old.vrl"));
    EXPECT_EQ(folder.Names().size(), 2u);
}

TEST(SaveDocument, WritesTheSameTextToStringsAndStreamsWithBareLineFeeds) {
    const auto loaded = load_document_from_memory(vrl_test::rich_document());
    ASSERT_TRUE(loaded);
    const std::string text = text_of(*loaded.document);
    EXPECT_EQ(text.find('\r'), std::string::npos);
    std::ostringstream stream;
    stream << "before ";
    ASSERT_TRUE(save_document(*loaded.document, stream));
    EXPECT_EQ(stream.str(), "before " + text);
    std::wstring wide;
    qbxV2::convert(&wide, text);
    EXPECT_EQ(Vrl(*loaded.document).writeString().getXmlDocument(), wide);
}

TEST(SaveDocument, WritesEveryChildOfTheRootAsTheRootDoes) {
    using vrl_test::color;
    const std::string palette = vrl_test::element(
        "Palette",
        vrl_test::history() +
            vrl_test::element("ColorSet", vrl_test::history() + color("s"), " ColorSetName=\"s\""),
        " PaletteName=\"p\"");
    const std::string owner = vrl_test::element("Owner", vrl_test::element("OwnerName", "me"));
    for (const std::string& content :
         {std::string(), color("a") + color("b"), palette + palette, vrl_test::quality_control(),
          color("a") + palette + vrl_test::quality_control() + vrl_test::quality_control()}) {
        const auto loaded = load_document_from_memory(vrl_test::document(content));
        ASSERT_TRUE(loaded) << loaded.message;
        Vrl copy(*loaded.document);
        copy.writeString();  // stamps it
        std::string expected;
        ASSERT_EQ(copy.marshal(&expected), 0);
        EXPECT_EQ(text_of(*loaded.document), expected);
    }
}

TEST(SaveDocument, StampsWhatIsWrittenAndNotTheDocument) {
    Vrl document = document_of(1);
    document.get_Preamble().get_Header().get_WriteSDKInformation().set_SDKName(L"somebody else");
    document.get_Preamble().get_Header().get_WriteSDKInformation().get_SDKVersion().set_SDKVersion(L"7");
    std::string before;
    ASSERT_EQ(document.marshal(&before), 0);
    const std::string text = text_of(document);
    EXPECT_NE(text.find("<Vrl:WriteSDKInformation>\n\t\t\t\t<Vrl:SDKName>Vrl2-QBX-3.7.6<"),
              std::string::npos);
    EXPECT_EQ(text.find("somebody else"), std::string::npos);
    std::string after;
    ASSERT_EQ(document.marshal(&after), 0);
    EXPECT_EQ(after, before);
}

TEST(SaveDocument, LetsSeveralThreadsSaveOneDocument) {
    const ScratchFolder folder;
    const Vrl document = document_of(50);
    std::vector<std::thread> threads;
    std::vector<char> saved(4, 0);
    for (std::size_t i = 0; i < saved.size(); ++i) {
        threads.emplace_back([&, i] {
            const std::string name = std::to_string(i) + (i % 2 == 0 ? ".vrl" : ".vrlz");
            saved[i] = save_document(document, folder / name) ? 1 : 0;
        });
    }
    for (std::thread& thread : threads) thread.join();
    for (std::size_t i = 0; i < saved.size(); ++i) EXPECT_EQ(saved[i], 1);
    EXPECT_EQ(folder.Read("0.vrl"), folder.Read("2.vrl"));
}

TEST(SaveDocument, TakesTheFormatFromTheSuffixInAnyCase) {
    const ScratchFolder folder;
    const Vrl document = document_of(3);
    const std::string text = with_crlf(text_of(document));
    for (const char* name : {"a.vrl", "b.VRL", "c.Vrl", "d.vrlz.vrl", ".vrl", "e.VRLZ.vRl"}) {
        ASSERT_TRUE(save_document(document, folder / name)) << name;
        EXPECT_EQ(folder.Read(name), text) << name;
    }
    for (const char* name : {"a.vrlz", "b.VRLZ", "c.VrlZ", "d.vrl.vrlz", ".vrlz"}) {
        ASSERT_TRUE(save_document(document, folder / name)) << name;
        EXPECT_EQ(entry_of(folder / name).text, text) << name;
    }
}

TEST(SaveDocument, RefusesASuffixThatTellsNoFormat) {
    const ScratchFolder folder;
    const Vrl document = document_of(1);
    for (const char* name : {"a.xml", "a", "a.vrl.txt", "vrl", "a.vrlzz", "a.vr", "a.vrl "}) {
        const save_result result = save_document(document, folder / name);
        EXPECT_EQ(result.failure, file_failure::unknown_format) << name;
        EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_2);
        EXPECT_NE(result.message.find(".vrl or .vrlz"), std::string::npos);
        save_options options;
        options.format = file_format::plain;
        EXPECT_TRUE(save_document(document, folder / name, options)) << "told";
        options.format = file_format::packed;
        EXPECT_TRUE(save_document(document, folder / name, options));
        EXPECT_EQ(entry_of(folder / name).count, 1u);
        fs::remove(folder / name);
    }
    EXPECT_TRUE(folder.Names().empty());
}

TEST(SaveDocument, PacksOneDeflatedEntryNamedAfterTheStem) {
    const ScratchFolder folder;
    const Vrl document = document_of(10);
    ASSERT_TRUE(save_document(document, folder / "My Colors.2024.vrlz"));
    const entry packed = entry_of(folder / "My Colors.2024.vrlz");
    EXPECT_EQ(packed.count, 1u);
    EXPECT_EQ(packed.name, "My Colors.2024.vrl");
    EXPECT_EQ(packed.method, 8u);
    EXPECT_EQ(folder.Names().size(), 1u) << "no plain file beside it";
    ASSERT_TRUE(save_document(document, folder / ".vrlz"));
    EXPECT_EQ(entry_of(folder / ".vrlz").name, "document.vrl");
}

TEST(SaveDocument, LeavesAPlainFileOfTheSameStemAlone) {
    const ScratchFolder folder;
    folder.Write("a.vrl", "somebody's own");
    ASSERT_TRUE(save_document(document_of(1), folder / "a.vrlz"));
    EXPECT_EQ(folder.Read("a.vrl"), "somebody's own");
}

TEST(SaveDocument, NamesAnEntryInAsciiAndBesideItInUtf8) {
    const ScratchFolder folder;
    const std::string name = "f\xC3\xA4rg \xE4\xB8\xAD";
    ASSERT_TRUE(save_document(document_of(1), folder / (name + ".vrlz")));
    CZipArchive archive;
    archive.Open((folder / (name + ".vrlz")).c_str(), CZipStorage::openReadOnly);
    CZipFileHeader& header = *archive.GetEntryHeader(0);
    EXPECT_EQ(header.GetFileName(), "f_rg _.vrl");
    const CZipExtraRecord* const record = header.GetCentralExtra().Find(0x7075);
    ASSERT_NE(record, nullptr);
    const std::string bytes(reinterpret_cast<const char*>(record->data.GetBuffer()), record->data.GetSize());
    EXPECT_EQ(bytes, "\1" + zip_test::Number32(zip_test::Crc32("f_rg _.vrl")) + name + ".vrl");
    archive.OpenEntry(0);
    EXPECT_NE(header.GetLocalExtra().Find(0x7075), nullptr);
    ASSERT_TRUE(load_document(folder / (name + ".vrlz")));
}

TEST(SaveDocument, PacksAsStronglyAsAsked) {
    const Vrl document = document_of(300);
    save_options options;
    options.format = file_format::packed;
    std::map<int, std::size_t> sizes;
    for (const int level : {-2, -1, 0, 1, 6, 9, 10}) {
        options.compression_level = level;
        std::string bytes;
        ASSERT_TRUE(save_document_to_memory(document, bytes, options));
        ASSERT_TRUE(load_document_from_memory(bytes));
        sizes[level] = bytes.size();
    }
    EXPECT_GT(sizes[0], with_crlf(text_of(document)).size()) << "stored";
    EXPECT_GT(sizes[1], sizes[9]);
    EXPECT_EQ(sizes[-1], sizes[6]);
    EXPECT_EQ(sizes[-2], sizes[-1]);
    EXPECT_EQ(sizes[10], sizes[-1]);
}

TEST(SaveDocument, PacksToStreamsAndStringsWhatItPacksToFiles) {
    const Vrl document = document_of(100);
    const std::string bytes = packed_bytes(document);
    save_options options;
    options.format = file_format::packed;
    std::ostringstream stream;
    ASSERT_TRUE(save_document(document, stream, options));
    EXPECT_EQ(stream.str().size(), bytes.size());
    const auto loaded = load_document_from_memory(stream.str());
    ASSERT_TRUE(loaded);
    EXPECT_EQ(text_of(*loaded.document), text_of(document));
    const ScratchFolder folder;
    folder.Write("a.vrlz", bytes);
    EXPECT_EQ(entry_of(folder / "a.vrlz").text, with_crlf(text_of(document)));
    EXPECT_EQ(entry_of(folder / "a.vrlz").name, "document.vrl");
}

TEST(SaveDocument, ReturnsWhatItLoads) {
    const ScratchFolder folder;
    for (const unsigned colors : {0U, 1U, 150U, 151U, 1000U}) {
        const Vrl document = document_of(colors);
        for (const char* name : {"a.vrl", "a.vrlz"}) {
            ASSERT_TRUE(save_document(document, folder / name));
            const auto loaded = load_document(folder / name);
            ASSERT_TRUE(loaded) << loaded.message;
            EXPECT_EQ(text_of(*loaded.document), text_of(document));
        }
    }
}

// What is replaced -----------------------------------------------------------------------------------------

TEST(SaveDocument, ReplacesTheOldFileAndLeavesNothingElse) {
    const ScratchFolder folder;
    folder.Write("a.vrl", std::string(100000, 'x'));
    folder.Write("a.vrlz", std::string(100000, 'x'));
    ASSERT_TRUE(save_document(document_of(1), folder / "a.vrl"));
    ASSERT_TRUE(save_document(document_of(1), folder / "a.vrlz"));
    EXPECT_TRUE(load_document(folder / "a.vrl"));
    EXPECT_TRUE(load_document(folder / "a.vrlz"));
    EXPECT_EQ(folder.Names().size(), 2u);
}

TEST(SaveDocument, KeepsTheModeAndTheLinksOfTheTarget) {
    const ScratchFolder folder;
    folder.Write("real.vrl", "old");
    fs::permissions(folder.Path() / "real.vrl", fs::perms(0640));
    fs::create_directory(folder.Path() / "other");
    fs::create_symlink("../real.vrl", folder.Path() / "other" / "link.vrl");
    ASSERT_TRUE(save_document(document_of(1), folder.Path() / "other" / "link.vrl"));
    EXPECT_TRUE(fs::is_symlink(folder.Path() / "other" / "link.vrl"));
    EXPECT_TRUE(load_document(folder / "real.vrl"));
    EXPECT_EQ(fs::status(folder.Path() / "real.vrl").permissions(), fs::perms(0640));
}

TEST(SaveDocument, MakesWhatALinkLeadsToAndLeavesTheLink) {
    const ScratchFolder folder;
    fs::create_directory(folder.Path() / "other");
    fs::create_symlink("other/real.vrl", folder.Path() / "link.vrl");
    ASSERT_TRUE(save_document(document_of(1), folder / "link.vrl"));
    EXPECT_TRUE(fs::is_symlink(folder.Path() / "link.vrl"));
    EXPECT_TRUE(load_document(folder.Path() / "other" / "real.vrl"));
    EXPECT_EQ(folder.Names().size(), 2u);
}

TEST(SaveDocument, LeavesOtherHardLinksTheOldFile) {
    const ScratchFolder folder;
    folder.Write("a.vrl", "old");
    fs::create_hard_link(folder.Path() / "a.vrl", folder.Path() / "b.vrl");
    ASSERT_TRUE(save_document(document_of(1), folder / "a.vrl"));
    EXPECT_TRUE(load_document(folder / "a.vrl"));
    EXPECT_EQ(folder.Read("b.vrl"), "old");
}

TEST(SaveDocument, GivesANewFileTheModeThatTheProcessGives) {
    const ScratchFolder folder;
    const mode_t mask = ::umask(027);
    const save_result result = save_document(document_of(1), folder / "a.vrl");
    ::umask(mask);
    ASSERT_TRUE(result);
    EXPECT_EQ(fs::status(folder.Path() / "a.vrl").permissions(), fs::perms(0640));
}

TEST(SaveDocument, SavesUnderABareName) {
    const ScratchFolder folder;
    const zip_test::CurrentFolder current(folder.Path());
    ASSERT_TRUE(save_document(document_of(1), "a.vrl"));
    ASSERT_TRUE(save_document(document_of(1), vrl_v2::path_from_wide(L"\x4E2D.vrlz")));
    EXPECT_TRUE(load_document("\xE4\xB8\xAD.vrlz"));
    EXPECT_EQ(folder.Names().size(), 2u);
}

TEST(SaveDocument, SavesUnderTheLongestName) {
    const ScratchFolder folder;
    const std::string name = std::string(251, 'n') + ".vrl";
    EXPECT_TRUE(save_document(document_of(1), folder / name));
    const save_result result = save_document(document_of(1), folder / ("n" + name));
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_NE(result.message.find("File name too long"), std::string::npos) << result.message;
    EXPECT_EQ(folder.Names().size(), 1u);
}

// What is refused ------------------------------------------------------------------------------------------

TEST(SaveDocument, CallsAMissingFolderMissing) {
    const ScratchFolder folder;
    const save_result result = save_document(document_of(1), folder.Path() / "nowhere" / "a.vrl");
    EXPECT_EQ(result.failure, file_failure::missing);
    EXPECT_EQ(result.code, qbxV2::EQBX_FILE_NOT_OPENED);
    EXPECT_NE(result.message.find("nowhere"), std::string::npos);
    save_options options;
    options.format = file_format::plain;
    EXPECT_EQ(save_document(document_of(1), "", options).failure, file_failure::missing);
}

TEST(SaveDocument, ReplacesNoFolderAndNoDevice) {
    const ScratchFolder folder;
    fs::create_directory(folder.Path() / "a.vrl");
    ASSERT_EQ(::mkfifo((folder / "b.vrl").c_str(), 0600), 0);
    folder.Write("c", "a file");
    for (const char* name : {"a.vrl", "b.vrl", "c/d.vrl"}) {
        const save_result result = save_document(document_of(1), folder.Path() / name);
        EXPECT_EQ(result.failure, file_failure::not_opened) << name;
    }
    EXPECT_TRUE(fs::is_directory(folder.Path() / "a.vrl"));
    EXPECT_TRUE(fs::is_fifo(folder.Path() / "b.vrl"));
    EXPECT_EQ(folder.Names().size(), 3u);
}

/// As somebody whom permissions hold back, for as long as this lives.
class common_user {
public:
    common_user() {
        if (m_root) {
            EXPECT_EQ(::seteuid(65534), 0);
        }
    }
    common_user(const common_user&) = delete;
    common_user& operator=(const common_user&) = delete;
    ~common_user() {
        if (m_root) {
            EXPECT_EQ(::seteuid(0), 0);
        }
    }

private:
    bool m_root = ::geteuid() == 0;
};

TEST(SaveDocument, ReplacesNoWriteProtectedFile) {
    const ScratchFolder folder;
    fs::permissions(folder.Path(), fs::perms::all);
    folder.Write("a.vrl", "old");
    fs::permissions(folder.Path() / "a.vrl", fs::perms(0444));
    save_result result;
    {
        const common_user user;
        result = save_document(document_of(1), folder / "a.vrl");
    }
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_NE(result.message.find("Permission denied"), std::string::npos) << result.message;
    EXPECT_EQ(folder.Read("a.vrl"), "old");
    EXPECT_EQ(folder.Names().size(), 1u);
}

TEST(SaveDocument, NeedsAFolderThatCanBeWritten) {
    const ScratchFolder folder;
    folder.Write("a.vrl", "old");
    fs::permissions(folder.Path() / "a.vrl", fs::perms(0666));
    fs::permissions(folder.Path(), fs::perms(0555));
    save_result result;
    {
        const common_user user;
        result = save_document(document_of(1), folder / "a.vrl");
    }
    fs::permissions(folder.Path(), fs::perms(0700));
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_NE(result.message.find("Permission denied"), std::string::npos) << result.message;
    EXPECT_EQ(folder.Read("a.vrl"), "old");
}

// Documents that are not complete --------------------------------------------------------------------------

struct gap {
    const char* name;
    void (*make)(Vrl&);
    int code;
    const char* item;
    const char* words;
};

const gap k_gaps[] = {
    {"Header",
     [](Vrl& d) {
         Vrl empty;
         d.swap(empty);
     },
     46, "/Vrl:Vrl/Vrl:Preamble[1]", "child number 1 of /Vrl:Vrl/Vrl:Preamble[1]"},
    {"Color", [](Vrl& d) { d.append_Color(); }, 46, "/Vrl:Vrl", "child number 5 of /Vrl:Vrl"},
    {"PartOfAColor",
     [](Vrl& d) {
         d.append_Color();
         d.back_Color().set_ColorName(L"n");
         d.back_Color().append_ChangeHistory(vrl_test::time());
         d.back_Color().get_ColorSpace(0).get_ColorSpaceCMYK();
     },
     46, "/Vrl:Vrl/Vrl:Color[4]", "child number 2 of /Vrl:Vrl/Vrl:Color[4]"},
    {"GroupWithoutAChoice",
     [](Vrl& d) {
         d.append_Color();
         d.back_Color().set_ColorName(L"n");
         d.back_Color().append_ChangeHistory(vrl_test::time());
         d.back_Color().append_ColorSpace();
     },
     0, "/Vrl:Vrl/Vrl:Color[4]", "child number 2 of"},
    {"DeepInAPalette",
     [](Vrl& d) {
         for (const wchar_t* name : {L"p", L"q"}) {
             d.append_Palette();
             d.back_Palette().set_PaletteName(name);
             d.back_Palette().append_ChangeHistory(vrl_test::time());
         }
         auto& set = d.back_Palette();
         set.append_ColorSet();
         set.back_ColorSet().set_ColorSetName(L"s");
         set.back_ColorSet().append_ChangeHistory(vrl_test::time());
         set.back_ColorSet().append_Color();
     },
     46, "/Vrl:Vrl/Vrl:Palette[2]/Vrl:ColorSet[1]", "child number 2 of"},
    {"WriteSDKInformation", [](Vrl& d) { d.get_Preamble().get_Header().get_WriteSDKInformation(); }, 46,
     "/Vrl:Vrl/Vrl:Preamble[1]/Vrl:Header[1]", "child number"},
};

class Gap : public testing::TestWithParam<gap> {};

TEST_P(Gap, IsRefusedWithItsPlaceAndTheOldFileStays) {
    Vrl document = document_of(3);
    GetParam().make(document);
    const ScratchFolder folder;
    for (const char* name : {"a.vrl", "a.vrlz"}) {
        folder.Write(name, "old");
        const save_result result = save_document(document, folder / name);
        EXPECT_EQ(result.failure, file_failure::bad_document);
        if (GetParam().code != 0) {
            EXPECT_EQ(result.code, GetParam().code);
        }
        EXPECT_EQ(result.item, GetParam().item);
        EXPECT_NE(result.message.find(GetParam().words), std::string::npos) << result.message;
        EXPECT_EQ(folder.Read(name), "old");
    }
    std::string text = "old";
    EXPECT_FALSE(save_document_to_memory(document, text));
    EXPECT_EQ(text, "old");
    EXPECT_EQ(folder.Names().size(), 2u);
}

INSTANTIATE_TEST_SUITE_P(SaveDocument, Gap, testing::ValuesIn(k_gaps),
                         [](const auto& row) { return std::string(row.param.name); });

TEST(SaveDocument, DoesNotFillGapsOfThePreambleByCopyingIt) {
    Vrl document = document_of(1);
    document.get_Preamble().get_Owner();  // present, and nothing in it
    const bool complete_as_it_is = Vrl(document).writeString().getEqbxError() == 0;
    std::string text;
    const save_result result = save_document_to_memory(document, text);
    std::string directly;
    EXPECT_EQ(static_cast<bool>(result), document.marshal(&directly) == 0);
    EXPECT_TRUE(complete_as_it_is || !result);
}

// Streams and progress -------------------------------------------------------------------------------------

/// Takes so many bytes.
class narrow_buffer : public std::stringbuf {
public:
    explicit narrow_buffer(std::streamsize room) : m_room(room) {}

protected:
    std::streamsize xsputn(const char* text, std::streamsize length) override {
        const std::streamsize taken = std::min(length, m_room);
        m_room -= taken;
        return std::stringbuf::xsputn(text, taken);
    }

private:
    std::streamsize m_room;
};

TEST(SaveDocument, ReportsAStreamThatTakesNoMore) {
    const Vrl document = document_of(500);
    for (const file_format format : {file_format::plain, file_format::packed}) {
        for (const bool throws : {false, true}) {
            narrow_buffer buffer(1000);
            std::ostream stream(&buffer);
            if (throws) stream.exceptions(std::ios_base::badbit);
            save_options options;
            options.format = format;
            const save_result result = save_document(document, stream, options);
            EXPECT_EQ(result.failure, file_failure::system_error);
            EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_3);
            EXPECT_NE(result.message, "");
        }
    }
}

/// Throws what is no std::exception.
class careless_buffer : public std::streambuf {
protected:
    std::streamsize xsputn(const char* /*text*/, std::streamsize /*length*/) override { throw 7; }
    int_type overflow(int_type /*c*/) override { throw 7; }
};

TEST(SaveDocument, ReportsAStreamThatThrowsAnything) {
    const Vrl document = document_of(500);
    for (const file_format format : {file_format::plain, file_format::packed}) {
        careless_buffer buffer;
        std::ostream stream(&buffer);
        stream.exceptions(std::ios_base::badbit);
        save_options options;
        options.format = format;
        EXPECT_EQ(save_document(document, stream, options).failure, file_failure::system_error);
    }
}

TEST(SaveDocument, TellsProgressAndCanBeCancelledAtEveryCall) {
    const Vrl document = document_of(700);
    const ScratchFolder folder;
    const std::size_t size = with_crlf(text_of(document)).size();
    for (const char* name : {"a.vrl", "a.vrlz"}) {
        std::vector<std::uint64_t> calls;
        std::size_t cancel_at = 1000;
        save_options options;
        options.progress = [&](std::uint64_t done, std::uint64_t total) {
            calls.push_back(done);
            EXPECT_EQ(total, 0u);
            return calls.size() <= cancel_at;
        };
        ASSERT_TRUE(save_document(document, folder / name, options));
        EXPECT_EQ(calls.back(), size);
        EXPECT_TRUE(std::is_sorted(calls.begin(), calls.end()));
        const std::size_t count = calls.size();
        EXPECT_GE(count, size / 65536);
        folder.Write(name, "old");
        for (cancel_at = 0; cancel_at < count; ++cancel_at) {
            calls.clear();
            const save_result result = save_document(document, folder / name, options);
            EXPECT_EQ(result.failure, file_failure::cancelled);
            EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_5);
            EXPECT_EQ(calls.size(), cancel_at + 1);
            EXPECT_EQ(folder.Read(name), "old");
        }
    }
    EXPECT_EQ(folder.Names().size(), 2u);
    save_options options;
    options.progress = [](std::uint64_t, std::uint64_t) -> bool { throw std::runtime_error("oops"); };
    EXPECT_EQ(save_document(document, folder / "a.vrl", options).failure, file_failure::cancelled);
}

}  // namespace
