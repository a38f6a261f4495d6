// Documents that other programs wrote keep their text. How they were made stands beside them.

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "tests/markup/conversions.h"
#include "tests/markup/visible_text.h"

namespace {

namespace fs = std::filesystem;
using markuptest::shown;
using markuptest::visibleText;

std::wstring contentsOf(fs::path const& file) {
    std::ostringstream bytes;
    bytes << std::ifstream(file, std::ios::binary).rdbuf();
    return TzString::fromUtf8(bytes.str()).str();
}

TEST(Documents, OfOtherProgramsKeepTheirText) {
    int count = 0;
    for (auto const& entry :
         fs::directory_iterator(std::string(std::getenv("TZ_TEST_SOURCE")) + "/tests/documents")) {
        if (entry.path().extension() != ".rtf") continue;
        ++count;
        markuptest::Session session;
        std::wstring const markup = session.toMtext(contentsOf(entry.path()));
        fs::path const expected = fs::path(entry.path()).replace_extension(".txt");
        EXPECT_EQ(shown(visibleText(markup)), shown(contentsOf(expected))) << entry.path();
        EXPECT_EQ(std::count(markup.begin(), markup.end(), L'{') -
                      std::count(markup.begin(), markup.end(), L'}'),
                  0)
            << entry.path();
    }
    EXPECT_GE(count, 9);
}

struct LookCase {
    char const* document;
    wchar_t const* part;  // of its markup
};
constexpr LookCase kLooks[] = {
    {"note", L"\\fHelvetica|b1|i0|c0|p32;millimetres"},
    {"note", L"\\fHelvetica|b0|i1|c0|p32;not"},
    {"note", L"\\Onoted\\o"},
    {"note", L"\\fCourier|b0|i0|c0|p48;C:"},
    {"note", L"\\H1.286x;General"},
    {"schedule", L"\\pi-0.357143,l0.357143,t0.357143;1.\tFrames: oak.\\P\\pl0.714286;a.\toiled"},
    {"finishes", L"\\H1.2x;Ground floor\\H0.8333x; "},
    {"bolts", L"\\fTimes New Roman|b1|i0|c0|p0;A2"},
    {"holes", L"\\fCourier New|b1|i0|c0|p49;\\C250;\\c0;local function"},
    {"holes", L"\\C44;\\c32432;120"},
    {"memo", L"\\P}Beam B3: {\\fLiberation Sans|b1|i0|c0|p34;HEA 200}, see "},
    {"labels", L"{\\L\u0427\u0435\u0440\u0442\u0451\u0436}; "},
};

TEST(Documents, KeepTheirLooks) {
    std::string const folder = std::string(std::getenv("TZ_TEST_SOURCE")) + "/tests/documents/";
    for (LookCase const& row : kLooks) {
        markuptest::Session session;
        std::wstring const markup = session.toMtext(contentsOf(folder + row.document + ".rtf"));
        EXPECT_NE(markup.find(row.part), std::wstring::npos)
            << row.document << TzString(row.part).toUtf8() << TzString(markup).toUtf8();
    }
}

}  // namespace
