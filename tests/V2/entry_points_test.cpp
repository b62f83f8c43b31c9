#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <string>
#include <type_traits>

#include "tests/V2/documents.h"
#include "tests/temporary_folder.h"

/// Whole documents by path and by text.
namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::k_declaration;
using vrl_test::temporary_folder;

std::wstring widened(const std::string& ascii) { return {ascii.begin(), ascii.end()}; }

std::string with_crlf(const std::string& text) {
    std::string out;
    for (const char c : text) {
        if (c == '\n') out += '\r';
        out += c;
    }
    return out;
}

/// Makes a folder the current one, for names without a folder.
class current_folder {
public:
    explicit current_folder(const std::string& path) : m_before(std::filesystem::current_path()) {
        std::filesystem::current_path(path);
    }
    ~current_folder() {
        std::error_code ignored;
        std::filesystem::current_path(m_before, ignored);
    }
    current_folder(const current_folder&) = delete;
    current_folder& operator=(const current_folder&) = delete;

private:
    std::filesystem::path m_before;
};

Vrl complete_document() {
    Vrl document;
    complete(document);
    complete(document.get_Color(0));
    return document;
}

TEST(WriteFile, HasCrLfInTheFileAndTheStamp) {
    const temporary_folder folder;
    const Vrl document = complete_document();
    EXPECT_EQ(document.writeFile(folder.wide_path(L"a.vrl")), 0);
    std::string text;
    EXPECT_EQ(document.marshal(&text), 0);
    EXPECT_EQ(folder.bytes("a.vrl"), with_crlf(text));
    EXPECT_EQ(text.substr(0, k_declaration.size()), k_declaration);
    EXPECT_NE(text.find("<Vrl:WriteSDKInformation>\n\t\t\t\t<Vrl:SDKName>Vrl2-QBX-3.7.6</Vrl:SDKName>\n"
                        "\t\t\t\t<Vrl:SDKVersion>1.0</Vrl:SDKVersion>\n\t\t\t</Vrl:WriteSDKInformation>\n"),
              std::string::npos);
}

// Intended: writing changes the document although it is const.
TEST(WriteFile, StampsADocumentThatIsConst) {
    const temporary_folder folder;
    Vrl document = complete_document();
    Header& header = document.get_Preamble().get_Header();
    header.get_WriteSDKInformation().set_SDKName(L"other");
    header.get_WriteSDKInformation().get_SDKVersion().set_SDKVersion(L"9");
    const Vrl& unchanging = document;
    EXPECT_EQ(unchanging.writeFile(folder.wide_path(L"a.vrl")), 0);
    EXPECT_EQ(header.get_WriteSDKInformation().get_SDKName(), L"Vrl2-QBX-3.7.6");
    EXPECT_EQ(header.get_WriteSDKInformation().get_SDKVersion().get_SDKVersion(), L"1.0");
    EXPECT_FALSE(header.get_WriteSDKInformation().get_SDKVersion().isnil_SDKVersion());
}

TEST(WriteFile, StampsBeforeItKnowsWhetherTheRestIsComplete) {
    const temporary_folder folder;
    const Vrl document;
    EXPECT_EQ(document.writeFile(folder.wide_path(L"a.vrl")), 46);
    EXPECT_TRUE(document.get_Preamble().get_Header().isset_WriteSDKInformation());
}

TEST(WriteFile, TakesTwoSuffixesOnly) {
    const temporary_folder folder;
    const Vrl document = complete_document();
    for (const wchar_t* name : {L"a.VRL", L"a.xml", L"a", L"a.vrl ", L"a.vrlx", L"a.Vrl", L"a.VRLZ", L"avrl",
                                L"a.vrl.xml", L"b.vrl/a"}) {
        EXPECT_EQ(document.writeFile(folder.wide_path(name)), 1001);
    }
    EXPECT_EQ(document.writeFile(L""), 1001);
    EXPECT_EQ(document.writeFile(L"vrl"), 1001);
    EXPECT_TRUE(folder.is_empty());
    EXPECT_FALSE(document.get_Preamble().get_Header().isset_WriteSDKInformation()) << "nothing was touched";
}

TEST(WriteFile, TakesTheSuffixForAName) {
    const temporary_folder folder;
    const current_folder inside(folder.path(""));
    EXPECT_EQ(complete_document().writeFile(L".vrl"), 0);
    EXPECT_TRUE(folder.has(".vrl"));
}

// Intended: a file that cannot be opened goes unnoticed.
TEST(WriteFile, DoesNotNoticeThatTheFileCannotBeOpened) {
    const temporary_folder folder;
    EXPECT_EQ(complete_document().writeFile(folder.wide_path(L"nowhere/a.vrl")), 0);
    EXPECT_FALSE(folder.has("nowhere"));
    EXPECT_EQ(Vrl().writeFile(folder.wide_path(L"nowhere/a.vrl")), 46);
    EXPECT_TRUE(folder.is_empty());
}

TEST(WriteFile, LeavesNoHalfDocumentBehind) {
    const temporary_folder folder;
    folder.write("a.vrl", "an earlier document");
    Vrl document = complete_document();
    document.get_Color(0).append_ColorSpace();
    EXPECT_EQ(document.writeFile(folder.wide_path(L"a.vrl")), 46);
    EXPECT_TRUE(folder.is_empty()) << "the earlier one is gone, too";
}

TEST(WriteFile, ReplacesAnEarlierDocument) {
    const temporary_folder folder;
    folder.write("a.vrl", std::string(100000, 'x'));
    const Vrl document = complete_document();
    EXPECT_EQ(document.writeFile(folder.wide_path(L"a.vrl")), 0);
    Vrl loaded;
    EXPECT_EQ(loaded.loadFile(folder.wide_path(L"a.vrl")), 0);
    EXPECT_EQ(loaded.size_Color(), 1u);
}

TEST(WriteFile, TakesANameOfAnyCharacters) {
    const temporary_folder folder;
    const std::wstring path = folder.wide_path(L"f\x00E4rg \x20AC.vrl");
    const Vrl document = complete_document();
    EXPECT_EQ(document.writeFile(path), 0);
    EXPECT_TRUE(folder.has("f\xC3\xA4rg \xE2\x82\xAC.vrl"));
    Vrl loaded;
    EXPECT_EQ(loaded.loadFile(path), 0);
    EXPECT_EQ(Vrl().writeFile(path), 46);
    EXPECT_TRUE(folder.is_empty());
}

TEST(LoadFile, TakesEveryOtherNameForAPlainDocument) {
    const temporary_folder folder;
    for (const char* name : {"a.txt", "a", "a.vrl", "a.VRLZ", "a.vrlz.xml", "vrlz", ".vrl", "a.b.c"}) {
        folder.write(name, vrl_test::document(vrl_test::color()));
        Vrl document;
        EXPECT_EQ(document.loadFile(folder.wide_path(widened(name))), 0) << name;
        EXPECT_EQ(document.size_Color(), 1u) << name;
    }
}

TEST(LoadFile, LooksAtNothingOfThePathButItsEnd) {
    const temporary_folder folder;
    std::filesystem::create_directory(folder.path("d.vrlz"));
    folder.write("d.vrlz/a", vrl_test::document());
    Vrl document;
    EXPECT_EQ(document.loadFile(folder.wide_path(L"d.vrlz/a")), 0);
    EXPECT_EQ(document.writeFile(folder.wide_path(L"d.vrlz/a")), 1001);
    EXPECT_EQ(document.writeFile(folder.wide_path(L"d.vrlz/a.b.vrl")), 0);
    EXPECT_TRUE(folder.has("d.vrlz/a.b.vrl"));
}

TEST(LoadFile, NeedsTheFile) {
    const temporary_folder folder;
    Vrl document;
    EXPECT_EQ(document.loadFile(folder.wide_path(L"missing.vrl")), 1);
    EXPECT_EQ(document.loadFile(folder.wide_path(L"missing")), 1);
    EXPECT_EQ(document.loadFile(folder.wide_path(L"missing.VRLZ")), 1);
    EXPECT_EQ(document.loadFile(L""), 1);
    EXPECT_EQ(document.loadFile(folder.wide_path(L"")), 1) << "a folder is no file";
}

TEST(LoadFile, FindsThatAnArchiveUnderAPlainNameIsNoDocument) {
    const temporary_folder folder;
    folder.write("a.VRLZ", std::string("PK\x03\x04\x14\x00\x00\x00\x08\x00", 10) + std::string(50, '\xA7'));
    Vrl document;
    const int code = document.loadFile(folder.wide_path(L"a.VRLZ"));
    EXPECT_NE(code, 0);
    EXPECT_LT(code, 1000) << "the reader's own";
}

TEST(LoadFile, ReadsBothLineEnds) {
    const temporary_folder folder;
    const std::string text = vrl_test::rich_document();
    folder.write("lf.vrl", text);
    folder.write("crlf.vrl", with_crlf(text));
    Vrl lf;
    Vrl crlf;
    EXPECT_EQ(lf.loadFile(folder.wide_path(L"lf.vrl")), 0);
    EXPECT_EQ(crlf.loadFile(folder.wide_path(L"crlf.vrl")), 0);
    std::string first;
    std::string second;
    EXPECT_EQ(lf.marshal(&first), 0);
    EXPECT_EQ(crlf.marshal(&second), 0);
    EXPECT_EQ(first, second);
}

TEST(LoadFile, DoesNotResetTheDocument) {
    const temporary_folder folder;
    folder.write("a.vrl", vrl_test::document(vrl_test::color("a")));
    Vrl document;
    EXPECT_EQ(document.loadFile(folder.wide_path(L"a.vrl")), 0);
    EXPECT_EQ(document.loadFile(folder.wide_path(L"a.vrl")), 0);
    EXPECT_EQ(document.size_Color(), 2u);
    EXPECT_EQ(document.loadString(widened(vrl_test::document(vrl_test::color("b")))), 0);
    EXPECT_EQ(document.size_Color(), 3u);
}

TEST(LoadFile, ReturnsTheReadersCode) {
    const temporary_folder folder;
    folder.write("a.vrl", vrl_test::document("<Vrl:Stranger/>"));
    Vrl document;
    EXPECT_EQ(document.loadFile(folder.wide_path(L"a.vrl")), 10);
    folder.write("empty.vrl", "");
    EXPECT_EQ(document.loadFile(folder.wide_path(L"empty.vrl")), 34);
}

TEST(LoadString, TakesTextForUtf8) {
    const std::wstring name = L"caf\x00E9 \x20AC";
    const std::wstring xml = widened(vrl_test::document(vrl_test::color("@")));
    std::wstring named = xml;
    named.replace(named.find(L'@'), 1, name);
    Vrl document;
    EXPECT_EQ(document.loadString(named), 0);
    EXPECT_EQ(document.get_Color(0).get_ColorName(), name);
    Vrl declared;
    EXPECT_EQ(declared.loadString(L"<?xml version=\"1.0\" encoding=\"UTF-8\"?>" + named), 0);
    EXPECT_EQ(declared.get_Color(0).get_ColorName(), name);
}

// Intended: the text is handed on as UTF-8, and the reader judges what its declaration says of that.
TEST(LoadString, LeavesTheDeclaredEncodingToTheReader) {
    const auto declared = [](const wchar_t* encoding) {
        std::wstring xml = widened(vrl_test::document(vrl_test::color("@")));
        xml.replace(xml.find(L'@'), 1, L"\x00E9");
        return std::wstring(L"<?xml version=\"1.0\" encoding=\"")
            .append(encoding)
            .append(L"\"?>")
            .append(xml);
    };
    EXPECT_EQ(Vrl().loadString(declared(L"UTF-16")), 15) << "the bytes contradict it";
    EXPECT_EQ(Vrl().loadString(declared(L"EBCDIC")), 6);
    Vrl document;
    EXPECT_EQ(document.loadString(declared(L"ISO-8859-1")), 0);
    EXPECT_EQ(document.get_Color(0).get_ColorName(), L"\x00C3\x00A9") << "each byte is a character then";
}

TEST(LoadString, ReturnsTheReadersCode) {
    Vrl document;
    EXPECT_EQ(document.loadString(L""), 34);
    EXPECT_EQ(document.loadString(L"text"), 34) << "no encoding begins like this, so the input ends";
    EXPECT_EQ(document.loadString(L" text"), 16);
    EXPECT_EQ(document.loadString(L"<other/>"), 16);
}

TEST(WriteString, GivesTheDocumentWithBareLineFeeds) {
    const Vrl document = complete_document();
    const XMLDocumentResult result = document.writeString();
    EXPECT_EQ(result.getEqbxError(), 0);
    const std::wstring text = result.getXmlDocument();
    EXPECT_EQ(text.find(L'\r'), std::wstring::npos);
    std::string narrow;
    EXPECT_EQ(document.marshal(&narrow), 0);
    EXPECT_EQ(text, widened(narrow));
    EXPECT_EQ(text.substr(0, k_declaration.size()), widened(k_declaration))
        << "which names UTF-8 although the text is wide";
    EXPECT_TRUE(document.get_Preamble().get_Header().isset_WriteSDKInformation());
}

TEST(WriteString, IsWideText) {
    Vrl document = complete_document();
    const std::wstring pair{static_cast<wchar_t>(0xD83C), static_cast<wchar_t>(0xDFA8)};
    const std::wstring name = L"caf\x00E9 \x20AC " + pair;
    document.get_Color(0).set_ColorName(name);
    const std::wstring text = document.writeString().getXmlDocument();
    EXPECT_NE(text.find(L"ColorName=\"" + name + L"\""), std::wstring::npos);
    Vrl loaded;
    EXPECT_EQ(loaded.loadString(text), 0);
    EXPECT_EQ(loaded.get_Color(0).get_ColorName(), name);
    EXPECT_EQ(loaded.writeString().getXmlDocument(), text);
}

TEST(WriteString, IsEmptyWhereTheDocumentIsRefused) {
    Vrl document = complete_document();
    document.append_Color();
    const XMLDocumentResult result = document.writeString();
    EXPECT_EQ(result.getEqbxError(), 46);
    EXPECT_EQ(result.getXmlDocument(), L"");
}

TEST(DocumentResult, IsAPlainValue) {
    const XMLDocumentResult result(L"text", qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
    const XMLDocumentResult copy(result);
    EXPECT_EQ(copy.getXmlDocument(), L"text");
    EXPECT_EQ(copy.getEqbxError(), 46);
    XMLDocumentResult assigned(L"", qbxV2::EQBX_NO_ERROR);
    assigned = copy;
    EXPECT_EQ(assigned.getXmlDocument(), L"text");
    static_assert(std::is_same<decltype(copy.getXmlDocument()), std::wstring>::value);
}

TEST(RoundTrip, ThroughAFileGivesTheSameDocument) {
    const temporary_folder folder;
    Vrl document;
    ASSERT_EQ(document.loadString(widened(vrl_test::rich_document())), 0);
    const std::wstring text = document.writeString().getXmlDocument();
    EXPECT_EQ(document.writeFile(folder.wide_path(L"a.vrl")), 0);
    Vrl loaded;
    EXPECT_EQ(loaded.loadFile(folder.wide_path(L"a.vrl")), 0);
    EXPECT_EQ(loaded.writeString().getXmlDocument(), text);
}

}  // namespace
