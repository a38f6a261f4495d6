// Documents that other programs wrote keep their text. How they were made stands beside them.

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "tests/markup/conversions.h"

namespace {

namespace fs = std::filesystem;
using markuptest::shown;

std::wstring contentsOf(fs::path const& file) {
    std::ostringstream bytes;
    bytes << std::ifstream(file, std::ios::binary).rdbuf();
    return TzString::fromUtf8(bytes.str()).str();
}

// The characters of a markup, a line for each paragraph. Knows the codes that the reader writes.
std::wstring visibleText(std::wstring const& markup) {
    std::wstring text;
    for (std::size_t at = 0; at < markup.size(); ++at) {
        wchar_t const c = markup[at];
        if (c == L'{' || c == L'}') continue;
        if (c != L'\\') {
            text += c;
            continue;
        }
        wchar_t const code = markup[++at];
        if (code == L'P') {
            text += L'\n';
        } else if (code == L'U') {
            text += static_cast<wchar_t>(std::stoul(markup.substr(at + 2, 4), nullptr, 16));
            at += 5;
        } else if (std::wstring_view(L"FfHCcpA").find(code) != std::wstring_view::npos) {
            at = markup.find(L';', at);
        } else if (std::wstring_view(L"LlOo").find(code) == std::wstring_view::npos) {
            text += code;
        }
    }
    return text + L'\n';
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
    EXPECT_GE(count, 2);
}

TEST(Documents, KeepTheirLooks) {
    markuptest::Session session;
    std::wstring const markup = session.toMtext(
        contentsOf(std::string(std::getenv("TZ_TEST_SOURCE")) + "/tests/documents/note.rtf"));
    for (wchar_t const* part :
         {L"\\fHelvetica|b1|i0|c0|p32;millimetres", L"\\fHelvetica|b0|i1|c0|p32;not",
          L"\\Onoted\\o", L"\\fCourier|b0|i0|c0|p48;C:", L"\\H1.286x;General"}) {
        EXPECT_NE(markup.find(part), std::wstring::npos) << part;
    }
}

}  // namespace
