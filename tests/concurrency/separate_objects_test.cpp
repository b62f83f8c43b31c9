#include <gtest/gtest.h>

#include <cstdio>
#include <functional>
#include <string>
#include <thread>
#include <vector>

#include "V2/Vrl.h"
#include "runtime/values.h"
#include "runtime/xml_reader.h"

// Separate objects are independent: each thread below has documents, readers and values of its own, and has
// to come to the same result as one thread alone.

namespace {

using qbxV2::EQBX_NO_ERROR;

constexpr unsigned k_threads = 4;

/// What `work` gives for 0, 1, 2, ..., each in a thread of its own, all started together.
std::vector<std::string> in_threads(const std::function<std::string(unsigned)>& work) {
    std::vector<std::string> results(k_threads);
    std::vector<std::thread> threads;
    for (unsigned i = 0; i < k_threads; ++i) {
        threads.emplace_back([&results, &work, i] { results[i] = work(i); });
    }
    for (std::thread& thread : threads) thread.join();
    return results;
}

std::vector<std::string> one_by_one(const std::function<std::string(unsigned)>& work) {
    std::vector<std::string> results;
    for (unsigned i = 0; i < k_threads; ++i) results.push_back(work(i));
    return results;
}

qbxV2::c_datetime some_time() {
    qbxV2::c_datetime time;
    time = "2024-01-02T03:04:05Z";
    return time;
}

void fill_color(vrl_v2::ColorType& color, unsigned number) {
    color.set_ColorName(L"color " + std::to_wstring(number));
    color.append_ChangeHistory(some_time());
    color.append_ColorSpace();
    vrl_v2::ColorSpaceCIELabType& lab = color.back_ColorSpace().get_ColorSpaceCIELab();
    lab.append_ChangeHistory(some_time());
    lab.get_ColorSpaceSpecificationSpectrumTristimulus().setnil_ColorSpaceSpecificationSpectrumTristimulus();
    lab.set_L(number % 101 + 0.25);
    lab.set_A(-1.5 * (number % 50));
    lab.set_B(number / 7.0);
}

void fill_document(vrl_v2::Vrl& document, unsigned colors) {
    vrl_v2::Header& header = document.get_Preamble().get_Header();
    header.set_Creator(L"a thread");
    header.set_CreatorVersion(L"1");
    header.append_ChangeHistory(some_time());
    header.set_Purpose(L"trial");
    for (unsigned i = 0; i < colors; ++i) {
        document.append_Color();
        fill_color(document.back_Color(), i);
    }
}

std::string as_text(const vrl_v2::Vrl& document) {
    std::string text;
    const qbxV2::eqbx_error code = document.marshal(&text);
    return code == EQBX_NO_ERROR ? text : "marshal failed with " + std::to_string(code);
}

/// Makes a document, loads what it writes, edits that, and gives the text.
std::string load_edit_write(unsigned i) {
    vrl_v2::Vrl made;
    fill_document(made, 20 + i);
    const vrl_v2::XMLDocumentResult written = made.writeString();
    vrl_v2::Vrl loaded;
    const qbxV2::eqbx_error code = loaded.loadString(written.getXmlDocument());
    if (code != EQBX_NO_ERROR) return "load failed with " + std::to_string(code);
    loaded.delete_Color(i);
    loaded.get_Color(0).set_Comments(L"edited by " + std::to_wstring(i));
    vrl_v2::Vrl copy(loaded);
    copy.append_Color();
    fill_color(copy.back_Color(), 1000 + i);
    return as_text(copy);
}

TEST(Concurrency, SeparateDocumentsAreLoadedEditedAndWritten) {
    const std::vector<std::string> parallel = in_threads(load_edit_write);
    EXPECT_EQ(parallel, one_by_one(load_edit_write));
    EXPECT_NE(parallel[0].find("edited by 0"), std::string::npos);
}

TEST(Concurrency, FilesOfTheirOwnAreWrittenAndLoaded) {
    const auto work = [](unsigned i) {
        const std::string path = testing::TempDir() + "vrl_concurrency_" + std::to_string(i) + ".vrl";
        const std::wstring wide_path(path.begin(), path.end());
        vrl_v2::Vrl made;
        fill_document(made, 10 + i);
        const qbxV2::eqbx_error written = made.writeFile(wide_path);
        vrl_v2::Vrl loaded;
        const qbxV2::eqbx_error read = loaded.loadFile(wide_path);
        std::remove(path.c_str());
        return std::to_string(written) + std::to_string(read) +
               (as_text(loaded) == as_text(made) ? "same" : "differs");
    };
    EXPECT_EQ(in_threads(work), std::vector<std::string>(k_threads, "00same"));
}

TEST(Concurrency, ReadersShareTheBytesThatTheyRead) {
    vrl_v2::Vrl made;
    fill_document(made, 30);
    const std::string text = as_text(made);
    const auto work = [&text](unsigned) {
        qbxV2::c_xml_reader_memory reader(text.data(), text.size());
        vrl_v2::Vrl document;
        const qbxV2::eqbx_error code = document.unmarshal(reader);
        return code == EQBX_NO_ERROR ? as_text(document) : "load failed with " + std::to_string(code);
    };
    EXPECT_EQ(in_threads(work), std::vector<std::string>(k_threads, text));
}

TEST(Concurrency, RefusalsAreReportedToTheReaderThatMetThem) {
    const auto work = [](unsigned i) {
        vrl_v2::Vrl made;
        fill_document(made, 5);
        std::string text = as_text(made);
        // A lightness that is no number, in a line that is another one for each thread.
        const std::string value = "<Vrl:L>" + std::to_string(i) + ".25";
        text.replace(text.find(value), value.size(), "<Vrl:L>dark");
        qbxV2::c_xml_reader_memory reader(text.data(), text.size());
        vrl_v2::Vrl document;
        const qbxV2::eqbx_error code = document.unmarshal(reader);
        std::string message;
        reader.get_error_message(&message);
        return std::to_string(code) + " " + message;
    };
    const std::vector<std::string> parallel = in_threads(work);
    EXPECT_EQ(parallel, one_by_one(work));
    EXPECT_EQ(parallel[0].substr(0, 3), "35 ");
    EXPECT_NE(parallel[0], parallel[1]);
}

TEST(Concurrency, OnePatternServesAllThreads) {
    const qbxV2::c_pattern pattern(".+T.+(Z|[+\\-].+)");
    const auto work = [&pattern](unsigned i) {
        int matches = 0;
        for (unsigned n = 0; n < 100; ++n) {
            const std::string digit = std::to_string((i + n) % 10);
            if (pattern.is_match("2024-01-02T03:04:0" + digit + "Z")) ++matches;
            if (pattern.is_match("2024-01-0" + digit)) ++matches;
        }
        return std::to_string(matches);
    };
    EXPECT_EQ(in_threads(work), std::vector<std::string>(k_threads, "100"));
}

}  // namespace
