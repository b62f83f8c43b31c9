#include <cerrno>

#include "tests/V2/documents.h"
#include "tests/flat/reported_null.h"
#include "tests/temporary_folder.h"
#include "zip/exception.h"

/// Packed documents through the C functions: what leaves the members behind them leaves them as well.
namespace vrl_flat_driver {
namespace {

std::u16string units(const std::wstring& text) { return {text.begin(), text.end()}; }

template <class Call>
CZipException thrown_by(const Call& call) {
    try {
        ADD_FAILURE() << "ended with " << call();
    } catch (const CZipException& exception) {
        return exception;
    }
    return {0, ""};
}

// Of an absolute path the ZIP engine sees the slash alone, which is a folder.
TEST(FlatPackedDocument, LeavesWithTheEnginesExceptionWhereTheArchiveCannotBeOpened) {
    const vrl_test::temporary_folder folder;
    const std::u16string path = units(folder.wide_path(L"a.vrlz"));
    vrl_v2::Vrl document;
    const CZipException loading = thrown_by([&] { return CSharp_Vrl_loadFile(&document, path.c_str()); });
    EXPECT_EQ(loading.GetCode(), EISDIR);
    EXPECT_EQ(loading.GetPath(), "/");
    EXPECT_TRUE(folder.is_empty());

    vrl_test::complete(document);
    const CZipException saving = thrown_by([&] { return CSharp_Vrl_writeFile(&document, path.c_str()); });
    EXPECT_EQ(saving.GetCode(), EISDIR);
    EXPECT_EQ(saving.GetPath(), "/");
    EXPECT_TRUE(folder.has("a.vrl")) << "the plain file stays";
}

}  // namespace
}  // namespace vrl_flat_driver
