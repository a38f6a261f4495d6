// Patterns for names.

#include <gtest/gtest.h>

#include <string>

#include "tz/ed/selection.h"
#include "tz/text/string.h"

namespace {

struct WildcardRow {
    wchar_t const* pattern;
    wchar_t const* matches;  // names apart by blanks
    wchar_t const* misses;
};

constexpr WildcardRow kPatterns[] = {
    {L"*", L"a Standard", L""},
    {L"Std", L"Std", L"Std1 xStd std"},
    {L"S?d", L"Std Sad", L"Sd Staad"},
    {L"*t*d", L"Std td attd", L"tdx d"},
    {L"*a*a*b", L"aab xaxaxb", L"ab aa"},
    {L"a,b*", L"a b bc", L"ab c ,"},
    {L"[abx-z]1", L"a1 y1", L"c1 -1 [1"},
    {L"[~a-c]*", L"d dd", L"a abc"},
    {L"[a,b]", L"a b ,", L"[a"},
    {L"~A*", L"B b", L"A Ab"},
    {L"~A*,Ab", L"B Ab", L"A Ac"},
    {L"[x", L"[x", L"x"},
    {L"ä?", L"äö", L"ä aö"},
};

void expectEach(wchar_t const* names, wchar_t const* pattern, bool isMatch) {
    std::wstring rest(names);
    while (!rest.empty()) {
        std::wstring const name = rest.substr(0, rest.find(L' '));
        rest.erase(0, name.size() + 1);
        EXPECT_EQ(tzutWcMatchEx(name.c_str(), pattern, false), isMatch)
            << TzString(name).toUtf8() << " against " << TzString(pattern).toUtf8();
    }
}

TEST(Wildcards, Match) {
    for (WildcardRow const& row : kPatterns) {
        expectEach(row.matches, row.pattern, true);
        expectEach(row.misses, row.pattern, false);
    }
}

TEST(Wildcards, MayIgnoreCase) {
    EXPECT_TRUE(tzutWcMatchEx(L"GRÖSSE", L"gr[o-ö]*", true));
    EXPECT_FALSE(tzutWcMatchEx(L"GRÖSSE", L"gr*", false));
    EXPECT_FALSE(tzutWcMatchEx(L"Apple", L"~a*", true));
    EXPECT_TRUE(tzutWcMatchEx(L"", L"*", true));
    EXPECT_TRUE(tzutWcMatchEx(nullptr, nullptr, true));
}

TEST(Wildcards, TakeNoLongerThanTheProduct) {
    std::wstring const text(2000, L'a');
    std::wstring pattern;
    for (int i = 0; i < 500; ++i)
        pattern += L"*a";
    EXPECT_FALSE(tzutWcMatchEx(text.c_str(), (pattern + L"b").c_str(), true));
    EXPECT_TRUE(tzutWcMatchEx(text.c_str(), pattern.c_str(), true));
}

}  // namespace
