#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <fstream>
#include <sstream>
#include <stdexcept>

#include "document_files.h"

namespace {

using vrl_test::packed;
using vrl_v2::file_failure;
using vrl_v2::file_format;
using vrl_v2::load_document;
using vrl_v2::load_document_from_memory;
using vrl_v2::load_options;
using vrl_v2::load_result;
using zip_test::RawArchive;
using zip_test::RawEntry;
using zip_test::ScratchFolder;

const std::string k_text = vrl_test::k_declaration + vrl_test::document(vrl_test::color("loaded"));

bool is_the_document(const load_result& result) {
    return result && result.document && result.document->size_Color() == 1 &&
           result.document->get_Color(0).get_ColorName() == L"loaded";
}

bool contains(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

// Kinds of files -------------------------------------------------------------------------------------------

TEST(LoadDocument, TellsTheFormatByTheFirstBytesWhateverTheName) {
    const ScratchFolder folder;
    for (const char* name : {"a.vrl", "a.vrlz", "A.VRLZ", "a.xml", "a", "a.vrlz.txt"}) {
        folder.Write(name, k_text);
        EXPECT_TRUE(is_the_document(load_document(folder / name))) << name;
        folder.Write(name, packed(k_text).Build());
        EXPECT_TRUE(is_the_document(load_document(folder / name))) << name;
    }
}

TEST(LoadDocument, TakesTheWholePath) {
    const ScratchFolder folder;
    const std::string name = "\xE4\xB8\xAD\xE6\x96\x87 f\xC3\xA4rg \xF0\x9F\x98\x80.vrlz";
    folder.Write(name, packed(k_text).Build());
    EXPECT_TRUE(is_the_document(load_document(folder / name)));
    for (const wchar_t* wide :
         {L"\x4E2D\x6587 f\xE4rg \x1F600.vrlz", L"\x4E2D\x6587 f\xE4rg \xD83D\xDE00.vrlz"}) {
        EXPECT_TRUE(is_the_document(load_document(folder.Path() / vrl_v2::path_from_wide(wide))));
    }
    const load_result missing = load_document(folder.Path() / vrl_v2::path_from_wide(L"\x4E2D.vrl"));
    EXPECT_TRUE(contains(missing.message, "\xE4\xB8\xAD.vrl")) << missing.message;
}

TEST(LoadDocument, CanBeToldTheFormat) {
    const std::string archive = packed(k_text).Build();
    load_options options;
    options.format = file_format::plain;
    EXPECT_EQ(load_document_from_memory(archive, options).failure, file_failure::bad_document);
    EXPECT_TRUE(is_the_document(load_document_from_memory(k_text, options)));
    options.format = file_format::packed;
    EXPECT_EQ(load_document_from_memory(k_text, options).failure, file_failure::bad_archive);
    EXPECT_TRUE(is_the_document(load_document_from_memory(archive, options)));
    RawArchive behind_a_stub = packed(k_text);
    behind_a_stub.stub = "#!/bin/sh\n";
    EXPECT_TRUE(is_the_document(load_document_from_memory(behind_a_stub.Build(), options)));
}

TEST(LoadDocument, AnArchiveThatPointsBeyondItsEndIsBadFromMemoryAsFromDisk) {
    const ScratchFolder folder;
    for (const std::uint32_t offset : {1000U, 0x7FFFFFFFU, 0x80000000U, 0xFFFFFFFFU}) {
        RawArchive lying_entry = packed(k_text);
        lying_entry.entries[0].offset = offset;
        RawArchive lying_directory = packed(k_text);
        lying_directory.offset = offset;
        for (const RawArchive& archive : {lying_entry, lying_directory}) {
            const std::string bytes = archive.Build();
            folder.Write("a.vrlz", bytes);
            const load_result from_memory = load_document_from_memory(bytes);
            const load_result from_disk = load_document(folder / "a.vrlz");
            EXPECT_EQ(from_memory.failure, file_failure::bad_archive) << offset;
            EXPECT_EQ(from_disk.failure, file_failure::bad_archive) << offset;
            EXPECT_TRUE(contains(from_disk.message, from_memory.message)) << from_disk.message << "\n"
                                                                          << from_memory.message;
        }
    }
}

TEST(LoadDocument, LoadsFromMemoryAndFromStreams) {
    for (const std::string& bytes : {k_text, packed(k_text).Build()}) {
        EXPECT_TRUE(is_the_document(load_document_from_memory(bytes)));
        EXPECT_TRUE(is_the_document(load_document_from_memory(bytes.data(), bytes.size())));
        std::istringstream stream(bytes);
        EXPECT_TRUE(is_the_document(load_document(stream)));
        std::istringstream later("12345" + bytes);
        later.ignore(5);
        EXPECT_TRUE(is_the_document(load_document(later))) << "from where it stands";
    }
}

TEST(LoadDocument, LoadsWhatSpansManyPieces) {
    const vrl_v2::Vrl document = vrl_test::document_of(2000);
    const std::string text = vrl_test::text_of(document);
    ASSERT_GT(text.size(), 800000u);
    const ScratchFolder folder;
    folder.Write("a.vrl", text);
    folder.Write("a.vrlz", packed(text).Build());
    std::istringstream stream(text);
    std::istringstream packed_stream(packed(text).Build());
    for (const load_result& loaded :
         {load_document(folder / "a.vrl"), load_document(folder / "a.vrlz"), load_document(stream),
          load_document(packed_stream), load_document_from_memory(text)}) {
        ASSERT_TRUE(loaded) << loaded.message;
        EXPECT_EQ(vrl_test::text_of(*loaded.document), text);
    }
}

TEST(LoadDocument, ReadsOtherEncodingsToo) {
    std::string utf16 = "\xFF\xFE";
    for (const char c : vrl_test::document(vrl_test::color("loaded"))) utf16 += std::string{c, '\0'};
    EXPECT_TRUE(is_the_document(load_document_from_memory(utf16)));
    EXPECT_TRUE(is_the_document(load_document_from_memory(packed(utf16).Build())));
    EXPECT_TRUE(is_the_document(load_document_from_memory("\xEF\xBB\xBF" + k_text)));
}

TEST(LoadDocument, ReadsEachMethodOfPacking) {
    for (const RawEntry& entry : {RawEntry::Stored("x", k_text), RawEntry::DeflatedEntry("", k_text),
                                  RawEntry::Bzip2Entry("z/", k_text)}) {
        EXPECT_TRUE(is_the_document(load_document_from_memory(RawArchive::Of({entry}).Build())));
    }
}

TEST(LoadDocument, TakesTheFirstEntryAndNoOther) {
    const RawEntry other = RawEntry::Stored("a.vrl", "no document");
    const RawEntry document = RawEntry::DeflatedEntry("../../outside.vrl", k_text);
    EXPECT_TRUE(is_the_document(load_document_from_memory(RawArchive::Of({document, other}).Build())));
    EXPECT_EQ(load_document_from_memory(RawArchive::Of({other, document}).Build()).failure,
              file_failure::bad_document);
}

TEST(LoadDocument, ReadsAPipe) {
    for (const std::string& bytes : {k_text, packed(k_text).Build()}) {
        int ends[2];
        ASSERT_EQ(::pipe(ends), 0);
        ASSERT_EQ(::write(ends[1], bytes.data(), bytes.size()), static_cast<ssize_t>(bytes.size()));
        ::close(ends[1]);
        EXPECT_TRUE(is_the_document(load_document("/dev/fd/" + std::to_string(ends[0]))));
        ::close(ends[0]);
    }
}

// Files that cannot be read --------------------------------------------------------------------------------

TEST(LoadDocument, CallsAMissingFileMissing) {
    const ScratchFolder folder;
    const load_result result = load_document(folder / "nowhere.vrl");
    EXPECT_EQ(result.failure, file_failure::missing);
    EXPECT_EQ(result.code, qbxV2::EQBX_FILE_NOT_OPENED);
    EXPECT_EQ(result.document, nullptr);
    EXPECT_EQ(result.line, 0);
    EXPECT_TRUE(contains(result.message, folder / "nowhere.vrl")) << result.message;
    EXPECT_TRUE(contains(result.message, "No such file")) << result.message;
}

TEST(LoadDocument, RefusesAFolder) {
    const ScratchFolder folder;
    const load_result result = load_document(folder.Path());
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_EQ(result.code, qbxV2::EQBX_FILE_NOT_OPENED);
    EXPECT_TRUE(contains(result.message, "folder")) << result.message;
}

TEST(LoadDocument, NeedsThePermissionToRead) {
    const ScratchFolder folder;
    folder.Write("a.vrl", k_text);
    std::filesystem::permissions(folder.Path(), std::filesystem::perms::all);
    std::filesystem::permissions(folder.Path() / "a.vrl", std::filesystem::perms::none);
    const bool is_root = ::geteuid() == 0;
    if (is_root) {
        ASSERT_EQ(::seteuid(65534), 0);
    }
    const load_result result = load_document(folder / "a.vrl");
    if (is_root) {
        ASSERT_EQ(::seteuid(0), 0);
    }
    EXPECT_EQ(result.failure, file_failure::not_opened);
    EXPECT_TRUE(contains(result.message, "Permission denied")) << result.message;
}

TEST(LoadDocument, RefusesAStreamThatIsNotGood) {
    std::ifstream missing("/nowhere/at/all.vrl");
    EXPECT_EQ(load_document(missing).failure, file_failure::not_opened);
    std::istream without_buffer(nullptr);
    EXPECT_EQ(load_document(without_buffer).failure, file_failure::not_opened);
}

/// Gives some bytes, then throws.
class failing_buffer : public std::streambuf {
public:
    explicit failing_buffer(std::string bytes) : m_bytes(std::move(bytes)) {
        setg(m_bytes.data(), m_bytes.data(), m_bytes.data() + m_bytes.size());
    }

protected:
    int_type underflow() override { throw std::runtime_error("the cable was pulled"); }

private:
    std::string m_bytes;
};

TEST(LoadDocument, ReportsAStreamThatFailsOnTheWay) {
    for (const std::string& bytes : {k_text, packed(k_text).Build()}) {
        failing_buffer buffer(bytes.substr(0, bytes.size() / 2));
        std::istream stream(&buffer);
        const load_result result = load_document(stream);
        EXPECT_EQ(result.failure, file_failure::system_error);
        EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_3);
        EXPECT_TRUE(contains(result.message, "the cable was pulled")) << result.message;
    }
}

/// Throws what is no std::exception.
class careless_buffer : public std::streambuf {
protected:
    int_type underflow() override { throw 7; }
};

TEST(LoadDocument, ReportsAStreamThatThrowsAnything) {
    careless_buffer buffer;
    std::istream stream(&buffer);
    EXPECT_EQ(load_document(stream).failure, file_failure::system_error);
}

/// The beginning of an archive, and then zeros for ever.
class endless_buffer : public std::streambuf {
protected:
    std::streamsize xsgetn(char* out, std::streamsize count) override {
        std::fill_n(out, count, '\0');
        if (!m_begun) std::copy_n("PK\3\4", 4, out);
        m_begun = true;
        return count;
    }

private:
    bool m_begun = false;
};

TEST(LoadDocument, TakesNoMoreOfAPackedStreamThanItsTextMayHave) {
    endless_buffer buffer;
    std::istream stream(&buffer);
    load_options options;
    options.max_unpacked_size = 1000000;
    const load_result result = load_document(stream, options);
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_4);
    EXPECT_TRUE(contains(result.message, "more than 1000000 bytes")) << result.message;
}

TEST(LoadDocument, CanBeCancelledWhileAPackedStreamIsTakenIn) {
    endless_buffer buffer;
    std::istream stream(&buffer);
    int asked = 0;
    load_options options;
    options.progress = [&](std::uint64_t done, std::uint64_t) {
        EXPECT_EQ(done, 0u);
        return ++asked < 5;
    };
    EXPECT_EQ(load_document(stream, options).failure, file_failure::cancelled);
    EXPECT_EQ(asked, 5);
}

// Documents that are not valid -----------------------------------------------------------------------------

TEST(LoadDocument, TellsLineItemAndWhatIsWrong) {
    const ScratchFolder folder;
    folder.Write("a.vrl", vrl_test::k_declaration + "\n\n" +
                              vrl_test::document(vrl_test::color("c") + "\n" + vrl_test::cmyk("101")));
    const load_result result = load_document(folder / "a.vrl");
    EXPECT_FALSE(result);
    EXPECT_EQ(result.failure, file_failure::bad_document);
    EXPECT_EQ(result.code, qbxV2::EQBX_BAD_END_OF_ELEMENT);
    EXPECT_EQ(result.line, 5);
    EXPECT_EQ(result.item, "Vrl:Vrl");
    EXPECT_EQ(result.document, nullptr);
    EXPECT_EQ(result.message,
              (folder / "a.vrl") +
                  ", line 5: Vrl:Vrl was expected to end, but found Vrl:ColorSpaceCMYK, in Vrl:Vrl");
    ASSERT_EQ(result.reports.size(), 1u);
    EXPECT_EQ(result.reports[0].code, result.code);
    EXPECT_EQ(result.reports[0].line, 5);
    EXPECT_EQ(result.reports[0].item, "Vrl:Vrl");
}

TEST(LoadDocument, SaysWhatWasExpectedAndFound) {
    using vrl_test::element;
    const struct {
        std::string document;
        int code;
        std::string words;
    } rows[] = {
        {"", 34, "there is no element in the document"},
        {"<Other/>", 16, "does not begin with Vrl:Vrl, but with Other"},
        {vrl_test::outermost("Vrl", ""), 32, "Vrl:Vrl must not be empty"},
        {vrl_test::outermost("Vrl", vrl_test::color()), 21, "expected Vrl:Preamble, but found Vrl:Color"},
        {vrl_test::outermost("Vrl", vrl_test::preamble(), " a=\"1\""), 39, "must not have the attribute a"},
        {vrl_test::document("<Vrl:Color/>"), 25, "the attribute ColorName is missing"},
        {vrl_test::document("text"), 10, "but found text"},
        {vrl_test::document(
             element("Color", vrl_test::history() + vrl_test::cmyk("101"), " ColorName=\"n\"")),
         36, "\"101\" is above the largest value of Vrl:Black"},
        {vrl_test::document(element("Color", vrl_test::history() + vrl_test::cmyk("-1"), " ColorName=\"n\"")),
         37, "\"-1\" is below the smallest value of Vrl:Black"},
        {vrl_test::document(
             element("Color", vrl_test::history() + vrl_test::cmyk("much"), " ColorName=\"n\"")),
         35, "\"much\" is no value of Vrl:Black, in Vrl:Vrl/Vrl:Color/Vrl:ColorSpaceCMYK"},
        {vrl_test::document(element("Color", element("ChangeHistory", "now"), " ColorName=\"n\"")), 35,
         "\"now\" is no value of Vrl:ChangeHistory"},
        {vrl_test::document(
             element("Color",
                     vrl_test::history() +
                         element("ColorSpaceCMYK",
                                 vrl_test::history() + element("ColorSpaceSpecificationSpectrumGeneric",
                                                               element("DeviceFilter", "none"))),
                     " ColorName=\"n\"")),
         38, "\"none\" is none of the values that Vrl:DeviceFilter can have"},
        {k_text.substr(0, k_text.size() - 5), 23, ""},
        {vrl_test::document(vrl_test::color("&unknown;")), 28,
         "the attribute ColorName holds a reference to nothing"},
        {vrl_test::document().replace(vrl_test::document().find("maker"), 5, "&unknown;"), 29,
         "the value of Vrl:Creator holds a reference to nothing"},
        {k_text.substr(0, k_text.find("ker")), 29, "(Unexpected end of message)"},
    };
    for (const auto& row : rows) {
        const load_result result = load_document_from_memory(row.document);
        EXPECT_EQ(result.code, row.code) << row.document;
        EXPECT_EQ(result.failure, file_failure::bad_document);
        EXPECT_TRUE(contains(result.message, row.words)) << result.message << "\n" << row.words;
        EXPECT_EQ(result.document, nullptr);
    }
}

TEST(LoadDocument, GivesTheCodeOfLoadFile) {
    const ScratchFolder folder;
    for (std::size_t cut = 0; cut < k_text.size(); cut += 7) {
        const std::string text = k_text.substr(0, cut) + "<" + k_text.substr(cut);
        folder.Write("a.vrl", text);
        vrl_v2::Vrl document;
        const int code = document.loadFile((folder.Path() / "a.vrl").wstring());
        EXPECT_EQ(load_document(folder / "a.vrl").code, code) << text;
    }
}

TEST(LoadDocument, ShortensLongValuesBetweenCharacters) {
    std::string value = "x";
    for (int i = 0; i < 100; ++i) value += "\xC3\xA4";
    const load_result result = load_document_from_memory(vrl_test::document(
        vrl_test::element("Color", vrl_test::history() + vrl_test::cmyk(value), " ColorName=\"n\"")));
    EXPECT_EQ(result.code, 35);
    EXPECT_TRUE(contains(result.message, "\xC3\xA4...\" is no value of Vrl:Black")) << result.message;
    EXPECT_LT(result.message.size(), 250u);
}

// All that is wrong at once --------------------------------------------------------------------------------

load_options collecting() {
    load_options options;
    options.collect_reports = true;
    return options;
}

TEST(LoadDocument, CollectsReportsWithLineItemAndCode) {
    using vrl_test::element;
    const std::string good = vrl_test::color("good") + "\n";
    const std::string text = vrl_test::document(
        "\n" + vrl_test::color("a", vrl_test::element("Nonsense", "<Vrl:x>1</Vrl:x>")) + "\n" + good +
        element("Color", vrl_test::history() + vrl_test::cmyk("101"), " ColorName=\"n\"") + "\n" + good +
        element("Color", vrl_test::history() + vrl_test::cmyk()) + "\n" + good);
    const load_result result = load_document_from_memory(text, collecting());
    EXPECT_FALSE(result);
    EXPECT_EQ(result.document, nullptr);
    const struct {
        int code;
        int line;
        const char* item;
    } expected[] = {{10, 2, "Vrl:Color"}, {36, 4, "Vrl:Black"}, {25, 6, "ColorName"}};
    ASSERT_EQ(result.reports.size(), std::size(expected));
    for (std::size_t i = 0; i < std::size(expected); ++i) {
        EXPECT_EQ(result.reports[i].code, expected[i].code);
        EXPECT_EQ(result.reports[i].line, expected[i].line);
        EXPECT_EQ(result.reports[i].item, expected[i].item);
        EXPECT_FALSE(result.reports[i].message.empty());
    }
    EXPECT_EQ(result.code, 10);
    EXPECT_EQ(result.line, 2);
    EXPECT_EQ(result.item, "Vrl:Color");
    EXPECT_TRUE(contains(result.message, "(and 2 more)")) << result.message;
}

TEST(LoadDocument, PassesOverSurplusContentUpToTheEndOfItsElement) {
    for (const char* surplus : {"<Vrl:A/>", "<Vrl:A><Vrl:Color><b/></Vrl:Color></Vrl:A><Vrl:B/>", "text",
                                "text<Vrl:A/>more", "<Vrl:Vrl>1</Vrl:Vrl>"}) {
        const load_result result = load_document_from_memory(
            vrl_test::document(vrl_test::color("a", surplus) + vrl_test::color("b", surplus)), collecting());
        ASSERT_EQ(result.reports.size(), 2u) << surplus;
        EXPECT_EQ(result.reports[0].code, 10);
        EXPECT_EQ(result.reports[1].code, 10);
    }
}

TEST(LoadDocument, CollectsNothingFromAGoodDocument) {
    const load_result result = load_document_from_memory(k_text, collecting());
    EXPECT_TRUE(is_the_document(result));
    EXPECT_TRUE(result.reports.empty());
    EXPECT_EQ(result.message, "");
}

TEST(LoadDocument, StopsCollectingWhereTheInputCannotBeReadOn) {
    for (const std::string& text :
         {k_text.substr(0, k_text.size() / 2), std::string("<Other>") + k_text + "</Other>", std::string("<"),
          std::string(vrl_test::k_declaration + "<!DOCTYPE"), vrl_test::document("<Vrl:Color <<<")}) {
        const load_result result = load_document_from_memory(text, collecting());
        EXPECT_FALSE(result);
        EXPECT_GE(result.reports.size(), 1u);
        EXPECT_LE(result.reports.size(), 4u) << text;
    }
}

TEST(LoadDocument, CollectsAsManyReportsAsAllowed) {
    std::string colors;
    for (int i = 0; i < 50; ++i) colors += "<Vrl:Color ColorName=\"a\"/>";
    load_options options = collecting();
    EXPECT_GE(load_document_from_memory(vrl_test::document(colors), options).reports.size(), 50u);
    options.max_reports = 10;
    EXPECT_EQ(load_document_from_memory(vrl_test::document(colors), options).reports.size(), 10u);
    options.max_reports = 0;
    EXPECT_EQ(load_document_from_memory(vrl_test::document(colors), options).reports.size(), 1u);
}

TEST(LoadDocument, EndsOnEveryDamagedDocumentWhileCollecting) {
    const std::string good = vrl_test::rich_document();
    std::size_t reports = 0;
    for (std::size_t i = 0; i < good.size(); ++i) {
        std::string damaged = good;
        damaged[i] = i % 3 == 0 ? '<' : i % 3 == 1 ? '>' : '"';
        reports += load_document_from_memory(damaged, collecting()).reports.size();
        reports += load_document_from_memory(good.substr(0, i), collecting()).reports.size();
    }
    EXPECT_GT(reports, good.size());
}

// Limits ---------------------------------------------------------------------------------------------------

TEST(LoadDocument, LimitsDepth) {
    load_options options;
    options.max_depth = 5;
    const load_result result = load_document_from_memory(vrl_test::rich_document(), options);
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_EQ(result.code, qbxV2::EQBX_BADLY_FORMED);
    EXPECT_TRUE(contains(result.message, "nested more than 5 deep")) << result.message;
    EXPECT_TRUE(load_document_from_memory(vrl_test::rich_document()));
}

TEST(LoadDocument, LimitsTheExpansionOfEntities) {
    std::string text = "<!DOCTYPE Vrl:Vrl [<!ENTITY a0 \"0123456789\">";
    for (int i = 1; i < 6; ++i) {
        text += "<!ENTITY a" + std::to_string(i) + " \"";
        for (int k = 0; k < 10; ++k) text += "&a" + std::to_string(i - 1) + ";";
        text += "\">";
    }
    text += "]>" + vrl_test::document();
    text.replace(text.find("maker"), 5, "&a5;");
    const load_result whole = load_document_from_memory(text);
    ASSERT_TRUE(whole) << whole.message;
    EXPECT_EQ(whole.document->get_Preamble().get_Header().get_Creator().size(), 1000000u);
    load_options options;
    options.max_entity_expansion = 100000;
    const load_result result = load_document_from_memory(text, options);
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_EQ(result.code, qbxV2::EQBX_ELEMENT_VALUE_UNREADABLE);
    EXPECT_EQ(result.document, nullptr);
    EXPECT_TRUE(contains(result.message, "entities expand to more than 100000 bytes")) << result.message;
}

TEST(LoadDocument, TellsAnEntityThatContainsItselfFromOneThatIsTooLarge) {
    std::string text = "<!DOCTYPE Vrl:Vrl [<!ENTITY a \"&a;\">]>" + vrl_test::document();
    text.replace(text.find("maker"), 5, "&a;");
    const load_result result = load_document_from_memory(text);
    EXPECT_EQ(result.failure, file_failure::bad_document);
    EXPECT_TRUE(contains(result.message, "(Badly formed DTD)")) << result.message;
}

std::string bomb(std::size_t size) { return k_text + std::string(size, ' '); }

TEST(LoadDocument, RefusesABombByItsRatio) {
    const std::string archive = packed(bomb(20 << 20)).Build();
    ASSERT_GT(20 << 20, 1000 * static_cast<int>(archive.size()));
    const load_result result = load_document_from_memory(archive);
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_4);
    EXPECT_TRUE(contains(result.message, "500 times")) << result.message;
    load_options options;
    options.max_ratio = 2000;
    EXPECT_TRUE(is_the_document(load_document_from_memory(archive, options)));
}

TEST(LoadDocument, RefusesABombThatLiesAboutItsPackedSize) {
    RawArchive archive = packed(bomb(20 << 20));
    // Room enough behind the stream for a harmless ratio.
    archive.entries[0].data += std::string(1 << 20, '\0');
    std::uint64_t reached = 0;
    load_options options;
    options.max_ratio = 50;
    options.progress = [&](std::uint64_t done, std::uint64_t) {
        reached = done;
        return true;
    };
    const load_result result = load_document_from_memory(archive.Build(), options);
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_LT(reached, std::uint64_t{10 << 20}) << "judged by what has been used of it";
}

TEST(LoadDocument, LeavesSmallTextsAloneHoweverWellTheyArePacked) {
    EXPECT_TRUE(is_the_document(load_document_from_memory(packed(bomb(1000000)).Build())));
}

TEST(LoadDocument, LimitsTheUnpackedSize) {
    const std::string archive = packed(k_text).Build();
    load_options options;
    options.max_unpacked_size = k_text.size();
    EXPECT_TRUE(is_the_document(load_document_from_memory(archive, options)));
    options.max_unpacked_size = k_text.size() - 1;
    const load_result result = load_document_from_memory(archive, options);
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_4);
    EXPECT_TRUE(contains(result.message, std::to_string(k_text.size()) + " bytes")) << result.message;
    EXPECT_TRUE(is_the_document(load_document_from_memory(k_text, options)))
        << "a plain file is its own size";
}

TEST(LoadDocument, RefusesAnArchiveBeyond32BitsByItsSize) {
    const ScratchFolder folder;
    folder.Write("a.vrlz", packed(k_text).Build());
    // Only its size is that large: nothing is stored for what was never written.
    std::filesystem::resize_file(folder.Path() / "a.vrlz", std::uintmax_t{5} << 30);
    const load_result result = load_document(folder / "a.vrlz");
    EXPECT_EQ(result.failure, file_failure::limit_exceeded);
    EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_4);
    EXPECT_TRUE(contains(result.message, "4 GB at most")) << result.message;
}

TEST(LoadDocument, RefusesADeclaredSizeWithoutAllocatingIt) {
    RawArchive archive = packed(k_text);
    archive.entries[0].uncompressed = 0xFFFFFFFF;
    EXPECT_EQ(load_document_from_memory(archive.Build()).failure, file_failure::limit_exceeded);
}

// Lies of archives -----------------------------------------------------------------------------------------

struct lie {
    const char* name;
    void (*tell)(RawArchive&);
    const char* words;
};

RawEntry& first(RawArchive& archive) { return archive.entries.front(); }

const lie k_lies[] = {
    {"NoEntries", [](RawArchive& a) { a.entries.clear(); }, "no entries"},
    {"Crc", [](RawArchive& a) { first(a).crc ^= 1; }, "CRC"},
    {"LocalCrc", [](RawArchive& a) { first(a).localCrc = 1; }, "damaged"},
    {"LocalSize", [](RawArchive& a) { first(a).localUncompressed = 1; }, "damaged"},
    {"LocalPackedSize", [](RawArchive& a) { first(a).localCompressed = 1; }, "damaged"},
    {"LocalMethod", [](RawArchive& a) { first(a).localMethod = 0; }, "damaged"},
    {"SizeAboveTheTrueOne", [](RawArchive& a) { first(a).uncompressed += 1; }, "ends after"},
    {"SizeBelowTheTrueOne",
     [](RawArchive& a) {
         // What is left is still a whole document, with the right CRC.
         const std::string text = k_text + " ";
         first(a) = RawEntry::DeflatedEntry("a", text);
         first(a).uncompressed -= 1;
         first(a).crc = zip_test::Crc32(k_text);
     },
     "damaged"},
    {"SizeZero",
     [](RawArchive& a) {
         first(a).uncompressed = 0;
         first(a).crc = 0;
     },
     "damaged"},
    {"StreamCutOff", [](RawArchive& a) { first(a).data.resize(first(a).data.size() - 20); }, "ends after"},
    {"StreamShorterThanDeclared", [](RawArchive& a) { first(a).data += "more"; }, "in 4 bytes less"},
    {"StreamMuchShorterThanDeclared", [](RawArchive& a) { first(a).data += std::string(500000, '!'); },
     "in 500000 bytes less"},
    {"Bzip2ShorterThanDeclared",
     [](RawArchive& a) {
         first(a) = RawEntry::Bzip2Entry("a", k_text);
         first(a).data += std::string(500000, '!');
     },
     "in 500000 bytes less"},
    {"StoredLonger",
     [](RawArchive& a) {
         first(a) = RawEntry::Stored("a", k_text);
         first(a).data += "more";
     },
     "in 4 bytes less"},
    {"StreamDamaged", [](RawArchive& a) { first(a).data[0] = '\7'; }, "compressed data is damaged"},
    {"Bzip2Damaged",
     [](RawArchive& a) {
         first(a) = RawEntry::Bzip2Entry("a", k_text);
         first(a).data[40] = static_cast<char>(first(a).data[40] ^ 0x55);
     },
     "compressed data is damaged"},
    {"StoredShort",
     [](RawArchive& a) {
         first(a) = RawEntry::Stored("a", k_text);
         first(a).uncompressed += 1;
     },
     "ends after"},
    {"Descriptor",
     [](RawArchive& a) {
         first(a).flags = 8;
         first(a).descriptor = "PK\7\10" + zip_test::Number32(first(a).crc) + zip_test::Number32(1) +
                               zip_test::Number32(first(a).uncompressed);
     },
     "damaged"},
    {"Enciphered",
     [](RawArchive& a) {
         first(a).flags = 1;
         first(a).data = std::string(12, '?') + first(a).data;
     },
     "password"},
    {"MethodUnknown", [](RawArchive& a) { first(a).method = 9; }, "method 9; expected deflate"},
    {"Spanned", [](RawArchive& a) { a.disk = 3; }, "damaged"},
    {"Zip64",
     [](RawArchive& a) {
         a.beforeEnd = std::string("PK\6\7") + std::string(16, '\0');
         a.size = 0xFFFFFFFF;
     },
     "ZIP64"},
};

class Lie : public testing::TestWithParam<lie> {};

TEST_P(Lie, IsReportedAndThereIsNoDocument) {
    RawArchive archive = packed(k_text);
    GetParam().tell(archive);
    const std::string bytes = archive.Build();
    const ScratchFolder folder;
    folder.Write("a.vrlz", bytes);
    std::istringstream stream(bytes);
    const std::size_t open = zip_test::OpenDescriptors();
    for (const load_result& result :
         {load_document_from_memory(bytes), load_document(stream), load_document(folder / "a.vrlz")}) {
        EXPECT_EQ(result.failure, file_failure::bad_archive) << result.message;
        EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_1);
        EXPECT_EQ(result.document, nullptr);
        EXPECT_TRUE(result.reports.empty());
        EXPECT_TRUE(contains(result.message, GetParam().words) ||
                    (std::string(GetParam().name) == "Spanned" && contains(result.message, "volume")))
            << result.message;
    }
    EXPECT_EQ(zip_test::OpenDescriptors(), open);
}

INSTANTIATE_TEST_SUITE_P(LoadDocument, Lie, testing::ValuesIn(k_lies),
                         [](const auto& row) { return std::string(row.param.name); });

TEST(LoadDocument, JudgesTheArchiveEvenBehindADocumentThatIsNotValid) {
    RawArchive archive = packed(k_text.substr(0, k_text.size() - 10) + std::string(200000, ' '));
    EXPECT_EQ(load_document_from_memory(archive.Build()).failure, file_failure::bad_document);
    first(archive).crc ^= 1;
    EXPECT_EQ(load_document_from_memory(archive.Build()).failure, file_failure::bad_archive)
        << "the damage may be why it is not valid";
}

TEST(LoadDocument, JudgesWhatStandsBehindTheDocumentToo) {
    RawArchive archive = packed(k_text + std::string(300000, '\n'));
    EXPECT_TRUE(is_the_document(load_document_from_memory(archive.Build())));
    first(archive).crc ^= 1;
    EXPECT_EQ(load_document_from_memory(archive.Build()).failure, file_failure::bad_archive);
}

TEST(LoadDocument, AcceptsAnHonestDataDescriptor) {
    RawArchive archive = packed(k_text);
    first(archive).flags = 8;
    first(archive).localCrc = first(archive).localCompressed = first(archive).localUncompressed = 0;
    const std::string numbers = zip_test::Number32(first(archive).crc) +
                                zip_test::Number32(static_cast<std::uint32_t>(first(archive).data.size())) +
                                zip_test::Number32(first(archive).uncompressed);
    for (const std::string& signature : {std::string(), std::string("PK\7\10")}) {
        first(archive).descriptor = signature + numbers;
        EXPECT_TRUE(is_the_document(load_document_from_memory(archive.Build())));
    }
}

TEST(LoadDocument, SurvivesEveryBitAndEveryLengthOfASmallArchive) {
    const std::string good = packed(k_text).Build();
    std::size_t refused = 0;
    for (std::size_t i = 0; i < good.size(); ++i) {
        EXPECT_FALSE(load_document_from_memory(good.substr(0, i))) << i;
        for (int bit = 0; bit < 8; ++bit) {
            std::string changed = good;
            changed[i] = static_cast<char>(changed[i] ^ (1 << bit));
            const load_result result = load_document_from_memory(changed);
            EXPECT_TRUE(!result || is_the_document(result)) << i << "." << bit;
            refused += result ? 0 : 1;
        }
    }
    EXPECT_GT(refused, good.size() * 4);
}

// Progress -------------------------------------------------------------------------------------------------

struct progress_log {
    std::vector<std::uint64_t> done;
    std::uint64_t total = 0;
    std::size_t cancel_at = static_cast<std::size_t>(-1);

    load_options options() {
        load_options asked;
        asked.progress = [this](std::uint64_t bytes, std::uint64_t all) {
            done.push_back(bytes);
            total = all;
            return done.size() <= cancel_at;
        };
        return asked;
    }
};

TEST(LoadDocument, TellsProgressUpToTheEnd) {
    const std::string text = vrl_test::text_of(vrl_test::document_of(1000));
    const ScratchFolder folder;
    folder.Write("a.vrl", text);
    folder.Write("a.vrlz", packed(text).Build());
    for (const int route : {0, 1, 2, 3}) {
        progress_log log;
        std::istringstream stream(text);
        const load_result result = route == 0   ? load_document(folder / "a.vrl", log.options())
                                   : route == 1 ? load_document(folder / "a.vrlz", log.options())
                                   : route == 2 ? load_document_from_memory(text, log.options())
                                                : load_document(stream, log.options());
        EXPECT_TRUE(result);
        EXPECT_GE(log.done.size(), text.size() / 65536);
        EXPECT_TRUE(std::is_sorted(log.done.begin(), log.done.end()));
        EXPECT_EQ(log.done.back(), text.size());
        EXPECT_EQ(log.total, route == 3 ? 0 : text.size());
    }
}

TEST(LoadDocument, CanBeCancelledAtEveryCall) {
    const std::string text = vrl_test::text_of(vrl_test::document_of(1000));
    for (const std::string& bytes : {text, packed(text).Build()}) {
        progress_log whole;
        ASSERT_TRUE(load_document_from_memory(bytes, whole.options()));
        for (std::size_t at = 0; at < whole.done.size(); ++at) {
            progress_log log;
            log.cancel_at = at;
            const load_result result = load_document_from_memory(bytes, log.options());
            EXPECT_EQ(result.failure, file_failure::cancelled);
            EXPECT_EQ(result.code, qbxV2::EQBX_USER_ERROR_5);
            EXPECT_EQ(result.document, nullptr);
            EXPECT_TRUE(result.reports.empty());
            EXPECT_EQ(log.done.size(), at + 1) << "and then not asked again";
        }
    }
}

TEST(LoadDocument, TakesAnExceptionOfTheCallbackForAWishToCancel) {
    load_options options;
    options.progress = [](std::uint64_t, std::uint64_t) -> bool { throw std::runtime_error("oops"); };
    EXPECT_EQ(load_document_from_memory(k_text, options).failure, file_failure::cancelled);
}

}  // namespace
