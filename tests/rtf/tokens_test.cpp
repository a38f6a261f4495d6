// Tokens of any bytes, printed as <open> { and <close> }, words as \word or \word=number, symbols
// as !c, bytes as #hh, and text as "text".

#include <cstdio>
#include <string>

#include <gtest/gtest.h>

#include "host/rtf/tokens.h"

namespace {

using Kind = tzhost::RtfToken::Kind;

std::string printed(tzhost::RtfToken const& token) {
    std::string const text(token.text);
    switch (token.kind) {
    case Kind::open: return "{";
    case Kind::close: return "}";
    case Kind::word: return "\\" + text + (token.hasValue ? "=" + std::to_string(token.value) : "");
    case Kind::symbol: return "!" + text;
    case Kind::text: return "\"" + text + "\"";
    case Kind::byte: {
        char digits[4];
        (void)std::snprintf(digits, sizeof digits, "#%02x", token.value);
        return digits;
    }
    case Kind::end: break;
    }
    return "end";
}

struct TokenCase {
    char const* name;
    std::string_view rtf;
    char const* tokens;
};
using std::string_view_literals::operator""sv;
constexpr TokenCase kCases[] = {
    {"Words", "{\\rtf1\\b0 x\\i y}"sv, "{ \\rtf=1 \\b=0 \"x\" \\i \"y\" }"},
    {"WordsOfBothCases", "\\clFitText1"sv, "\\clFitText=1"},
    {"Delimiters", "\\b  x\\b\nx\\b\r\n x"sv, "\\b \" x\" \\b \"x\" \\b \" x\""},
    {"Numbers", "\\a-12\\a99999999999\\a-99999999999"sv, "\\a=-12 \\a=2147483647 \\a=-2147483647"},
    {"Hyphen", "\\par-x"sv, "\\par \"-x\""},
    {"Symbols", "\\*\\~\\{\\\\"sv, "!* !~ !{ !\\"},
    {"LineEnds", "a\r\nb\0c\\\nd\\\te"sv, "\"a\" \"b\" \"c\" \\par \"d\" \\tab \"e\""},
    {"Bytes", "\\'e9\\'E\n9\xE9\t"sv, "#e9 #e9 #e9 #09"},
    {"BadBytes", "\\'x\\'4x\\'"sv, "\"x\" #04 \"x\""},
    {"Binary", "a\\bin3 }{\\b"sv, "\"a\" \\bin=3 \"b\""},
    {"BinaryCutOff", "\\bin0 d\\bin-1 e\\bin4 abc"sv,
     "\\bin=0 \"d\" \\bin=-1 \"e\" \\bin=4 \"abc\""},
    {"LoneBackslash", "a\\"sv, "\"a\""},
    // Runs are looked at in blocks; a sign at any place of a block ends one.
    {"LongRun", "0123456789012345678901234567890123456789{x"sv,
     "\"0123456789012345678901234567890123456789\" { \"x\""},
};

class Tokens : public testing::TestWithParam<TokenCase> {};
TEST_P(Tokens, AreReadAs) {
    tzhost::RtfTokens tokens(GetParam().rtf);
    std::string text;
    for (auto token = tokens.next(); token.kind != Kind::end; token = tokens.next())
        text += (text.empty() ? "" : " ") + printed(token);
    EXPECT_EQ(text, GetParam().tokens);
}
INSTANTIATE_TEST_SUITE_P(Bytes, Tokens, testing::ValuesIn(kCases), [](auto const& row) {
    return row.param.name;
});

}  // namespace
