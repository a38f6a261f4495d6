// Normalised documents as the module reads them.

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "host/rtf/normaliser.h"
#include "host/text/utf8.h"
#include "tests/markup/conversions.h"
#include "tests/markup/visible_text.h"

namespace {

namespace fs = std::filesystem;

fs::path folder() {
    return fs::path(std::getenv("TZ_TEST_SOURCE")) / "tests";
}

std::string contentsOf(fs::path const& file) {
    std::ostringstream bytes;
    bytes << std::ifstream(file, std::ios::binary).rdbuf();
    return bytes.str();
}

std::wstring readThroughNormaliser(std::string const& rtf) {
    markuptest::Session session;
    return session.toMtext(tzhost::fromUtf8(tzhost::normaliseRtf(rtf).document));
}

// Blanks and ends of lines apart: a table is lines of cells here and a cell a line in an export.
std::vector<std::string> wordsOf(std::string const& text) {
    std::istringstream words(text);
    return {std::istream_iterator<std::string>(words), {}};
}

// How the documents were made stands beside them.
TEST(OfficeDocuments, KeepTheWordsOfTheirWritersTextExport) {
    int count = 0;
    for (auto const& entry : fs::directory_iterator(folder() / "documents/office")) {
        if (entry.path().extension() != ".rtf") continue;
        ++count;
        std::wstring const markup = readThroughNormaliser(contentsOf(entry.path()));
        std::string const expected = contentsOf(fs::path(entry.path()).replace_extension(".txt"));
        EXPECT_EQ(wordsOf(tzhost::toUtf8(markuptest::visibleText(markup))), wordsOf(expected))
            << entry.path();
    }
    EXPECT_EQ(count, 4);
}

struct LookCase {
    char const* document;
    char const* part;  // of its markup
};
constexpr LookCase kLooks[] = {
    {"site-notes-writer", "\\fLiberation Sans|b1|i0|c0|p0;all drains"},
    {"site-notes-writer",
     "; \\Ogravel\\o sand bed, \\fLiberation Mono|b0|i0|c0|p0;\\H0.85x;\\C242;\\c2097344;150 mm"},
    {"site-notes-writer", "; 1.\tSet out\\P"},
    {"site-notes-abiword",
     "before\\fLiberation Sans|b0|i0|c0|p0; the slab, \\Las sheet 12 shows\\l"},
    {"door-list-writer", "\\U+2022\tHinges: three each\\P"},
    {"door-list-writer", "Door\tWidth\\P"},
    {"door-list-abiword", "{\\fLiberation Serif|b1|i0|c0|p0;"},
};

TEST(OfficeDocuments, KeepTheirLooks) {
    for (LookCase const& row : kLooks) {
        fs::path const file = folder() / "documents/office" / (std::string(row.document) + ".rtf");
        std::string const markup = tzhost::toUtf8(readThroughNormaliser(contentsOf(file)));
        EXPECT_NE(markup.find(row.part), std::string::npos) << row.document << " " << markup;
    }
}

// What the module itself writes is read as without the normaliser.
TEST(Dialect, PassesAsItIs) {
    std::ifstream texts(folder() / "markup/office.txt");
    int count = 0;
    for (std::string line; std::getline(texts, line);) {
        if (line.empty() || line[0] == ';' || line == "=") continue;
        ++count;
        std::wstring const rtf = markuptest::Session().toRtf(tzhost::fromUtf8(line));
        EXPECT_EQ(tzhost::toUtf8(readThroughNormaliser(tzhost::toUtf8(rtf))),
                  tzhost::toUtf8(markuptest::Session().toMtext(rtf)));
    }
    EXPECT_GE(count, 30);
}

}  // namespace
