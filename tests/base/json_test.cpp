// The JSON reader against its library's plain verdict and values: the fast parser in front of it
// must never show.

#include <gtest/gtest.h>

#include <random>
#include <string>

#include <nlohmann/json.hpp>

#include "host/files/json_events.h"

namespace {

// Pieces that a broken document is made of: tokens, half characters, numbers at the edges.
std::string const kPieces[] = {
    "{",
    "}",
    "[",
    "]",
    ",",
    ":",
    "\"",
    "\"a\"",
    "\"b\"",
    "-0",
    "0e400",
    "1e400",
    "-1.5e-400",
    "01",
    "1.",
    "true",
    "nul",
    "\\ud800",
    "\\udc00",
    "\"\\udc00\"",
    "\"\\ud83d\\ude00\"",
    "\xC3",
    "\xA9",
    "\"\xE4\xB8\xAD\"",
    "\xED\xA0\x80",
    "\xEF\xBB\xBF",
    "\xEF\xBB\x80",
    "\x1F",
    "\n",
    " ",
    "\"\\u0000\"",
    "18446744073709551616",
    "\xF4\x90\x80\x80",
    std::string(1, '\0'),
    "1797693134862315" + std::string(293, '9'),
};
constexpr char const* kWhole = R"({"a":[1,-2.50,"\u00e9\n",{"b":null,"c":[]}],)"
                               "\n\"\xE4\xB8\xAD\":\"\xF0\x9F\x98\x80\",\"d\":[true,1e5,-0.0]}\n";

// Names that stand twice are refused by us alone.
bool isAccepted(std::string const& text) {
    tzhost::JsonDocument const document = tzhost::readJson(text);
    return !document.failed || document.problem.what.find("twice") != std::string::npos;
}

TEST(JsonReader, JudgesAsTheCarefulParserDoes) {
    std::mt19937 random(7);
    auto const below = [&](std::size_t end) { return random() % end; };
    constexpr int kDocuments = 5000;
    constexpr int kAtBlockEdge = 50;  // every one of so many
    constexpr std::size_t kBlock = std::size_t{1} << 16;
    for (int i = 0; i < kDocuments; ++i) {
        std::string text = kWhole;
        for (std::size_t left = below(4); left > 0; --left) {
            std::string const& piece = kPieces[below(std::size(kPieces))];
            text.replace(below(text.size() + 1), below(3), piece);
        }
        if (i % kAtBlockEdge == 0) text.insert(0, kBlock - below(text.size() + 1), ' ');
        ASSERT_EQ(isAccepted(text), nlohmann::json::accept(text)) << text;
        tzhost::JsonDocument const document = tzhost::readJson(text);
        if (document.failed) continue;
        std::string written;
        tzhost::writeValue(written, document.root);
        EXPECT_EQ(nlohmann::json::parse(written), nlohmann::json::parse(text)) << text;
    }
}

}  // namespace
