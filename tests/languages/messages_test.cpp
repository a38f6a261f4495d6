// What the programs complain about, in German beside English: no word of the one in the other.

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <set>
#include <sstream>
#include <string>

namespace {

struct Row {
    char const* name;
    char const* command;
    char const* input;  // by printf
};
constexpr Row kRows[] = {
    {"NoCommand", "tzconvert", ""},
    {"NearCommand", "tzconvert to-rft", ""},
    {"HelpOnNothing", "tzconvert help x", ""},
    {"OptionAhead", "tzconvert --size 3 to-rtf", ""},
    {"NearOption", "tzconvert to-rtf --szie 2", ""},
    {"TwoUnknown", "tzconvert to-rtf --zzz1 --zzz2", ""},
    {"NoValue", "tzconvert to-rtf --size", ""},
    {"NoNumber", "tzconvert to-rtf --twips x1", ""},
    {"NotAbove", "tzconvert to-rtf --size 0", ""},
    {"NotSayable", "tzconvert to-mtext --oblique 1e9", ""},
    {"NoTracking", "tzconvert to-mtext --tracking 0", ""},
    {"NoColor", "tzconvert to-rtf --color x1", ""},
    {"NoFlagValue", "tzconvert to-rtf --quiet=x1", ""},
    {"Twice", "tzconvert to-rtf -o a1 -o b1", ""},
    {"Needs", "tzconvert to-rtf --bold", ""},
    {"Excludes", "tzconvert to-rtf --font F1 --font-file F2", ""},
    {"EmptyName", "tzconvert to-rtf ''", ""},
    {"NoFolder", "tzconvert to-rtf --output-dir a1", ""},
    {"FileAsFolder", "tzconvert to-rtf --output-dir said1", ""},
    {"SeveralToOne", "tzconvert to-rtf a1 b1", ""},
    {"FolderToOne", "tzconvert to-rtf -r a1", ""},
    {"ReportOnOutput", "tzconvert to-rtf --report -", ""},
    {"ReportOverInput", "tzconvert to-rtf -o o1 --report a1 a1", ""},
    {"ReportOverResult", "tzconvert to-rtf -o o1 --report o1", ""},
    {"OverInput", "tzconvert to-rtf -o a1 a1", ""},
    {"NoPage", "tzconvert to-rtf --code-page 99", ""},
    {"NoMap", "tzconvert to-rtf --font-map a1", ""},
    {"NoFile", "tzconvert to-rtf a1", ""},
    {"FolderAsFile", "tzconvert to-rtf .", ""},
    {"NoOutput", "tzconvert to-rtf -o a1/b1", ""},
    {"LongName", "tzconvert to-rtf $(printf 'x1%0300d' 0)", ""},
    {"FullOutput", "tzconvert to-rtf -o /dev/full", "x"},
    {"FullStandardOutput", "tzconvert to-rtf >/dev/full", "x"},
    {"NotUtf8", "tzconvert to-rtf", "\\377"},
    {"ZeroCharacter", "tzconvert to-rtf", "\\0"},
    {"LostMarkup", "tzconvert to-rtf",
     "\\\\T2;\\\\T3;\\\\W2;\\\\W3;\\\\Q2;\\\\Q3;\\\\x\\\\Sa;{\\\\Fz1;"},
    {"LostRtf", "tzconvert to-mtext", "{\\\\rtf1\\\\z1 a{\\\\z1 b}}c"},
    {"LeftOut", "tzconvert normalise", "{\\\\rtf1{\\\\pict}{\\\\pict}{\\\\footnote}{\\\\header}}"},
    {"LeftOutMore", "tzconvert normalise", "{\\\\rtf1{\\\\pict}{\\\\footnote}{\\\\footnote}}"},
    {"RtfAsMarkup", "tzconvert to-rtf", "{\\\\rtf1 a}"},
    {"MarkupAsRtf", "tzconvert to-mtext", "a\\\\Pb"},
    {"Summary", "tzconvert to-rtf --output-dir . a1 - -", "\\\\x"},

    {"UnknownOption", "tzdraft --zzz1", ""},
    {"EmptyDrawingName", "tzdraft ''", ""},
    {"EmptyFile", "tzdraft --save ''", ""},
    {"NoPaper", "tzdraft --paper x1", ""},
    {"NoScale", "tzdraft --scale x1", ""},
    {"NoUnit", "tzdraft --unit x1", ""},
    {"NoWindow", "tzdraft --window x1", ""},
    {"NoMargin", "tzdraft --margin x1", ""},
    {"NoDots", "tzdraft --dpi x1", ""},
    {"NoSpace", "tzdraft --space x1", ""},
    {"NoRoom", "tzdraft --paper A4 --margin 200", ""},
    {"TwoPlots", "tzdraft --svg - --pdf -", ""},
    {"PicturesOfAll", "tzdraft --space all --svg a1", ""},
    {"NoScript", "tzdraft --script a1", ""},
    {"NoModule", "tzdraft --module a1", ""},
    {"ShortModule", "tzdraft --module said1", "x"},
    {"NoVariable", "tzdraft --var x1=2", ""},
    {"NoFault", "tzdraft --fail x1:x1", ""},
    {"NoDrawing", "tzdraft a1", ""},
    {"EmptyDrawing", "tzdraft said1", ""},
    {"CutDrawing", "tzdraft said1", "{\"a1\""},
    {"WrongMark", "tzdraft said1", "{\"a1\" 1"},
    {"WrongEnd", "tzdraft said1", "{\"a1\": 1]"},
    {"NoName", "tzdraft said1", "{2"},
    {"NoWord", "tzdraft said1", "{\"a1\": tru}"},
    {"TrueForName", "tzdraft said1", "{true"},
    {"FalseForName", "tzdraft said1", "{false"},
    {"NullForMark", "tzdraft said1", "{\"a1\" null"},
    {"TextForMark", "tzdraft said1", "{\"a1\" \"b1\""},
    {"NoDigit", "tzdraft said1", "{\"a1\": -}"},
    {"NoFraction", "tzdraft said1", "{\"a1\": 1.}"},
    {"NoExponent", "tzdraft said1", "{\"a1\": 1e}"},
    {"NoDigitOfExponent", "tzdraft said1", "{\"a1\": 1e+}"},
    {"OpenText", "tzdraft said1", "{\"a1"},
    {"NoEscape", "tzdraft said1", "{\"a1\": \"\\\\q\"}"},
    {"NoCode", "tzdraft said1", "{\"a1\": \"\\\\u12\"}"},
    {"FirstHalf", "tzdraft said1", "{\"a1\": \"\\\\ud800\"}"},
    {"SecondHalf", "tzdraft said1", "{\"a1\": \"\\\\udc00\"}"},
    {"LineInText", "tzdraft said1", "{\"a1\": \"b\\n\"}"},
    {"SettingsOfAnotherKind", "tzdraft --settings said1", "[]"},
    {"CutSettings", "tzdraft --settings said1", "{"},
    {"UnknownSetting", "tzdraft --settings said1", "{\"x1\": 2}"},
};

std::string said(Row const& row, std::string const& locale) {
    std::string const command = std::string("printf '") + row.input +
                                "' >said1; export LC_ALL=" + locale + "; <said1 2>&1 >/dev/null '" +
                                std::getenv("TZ_TEST_BIN") + "'/" + row.command;
    std::unique_ptr<std::FILE, int (*)(std::FILE*)> const pipe(popen(command.c_str(), "r"), pclose);
    std::string text;
    std::array<char, 1000> piece;
    while (std::fgets(piece.data(), piece.size(), pipe.get()))
        text += piece.data();
    return text;
}

bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

// Names of commands, options, files and sizes are the same in both.
std::set<std::string> wordsOf(std::string text) {
    static std::set<std::string> const kNames = {
        "tzconvert", "tzdraft", "normalise", "RRGGBB", "RTF",     "JSON",  "PDF", "LF",
        "model",     "paper",   "letter",    "legal",  "tabloid", "fit",   "mm",  "cm",
        "in",        "ft",      "all",       "or",     "true",    "false", "null"};
    std::replace_if(
        text.begin(), text.end(), [](char c) { return std::strchr(",;:()\"?", c) != nullptr; },
        ' ');
    std::set<std::string> words;
    std::istringstream from(text);
    for (std::string word; from >> word;) {
        bool const isWord = word.size() > 1 && std::all_of(word.begin(), word.end(), isLetter);
        if (isWord && kNames.count(word) == 0) words.insert(word);
    }
    return words;
}

class Messages : public testing::TestWithParam<Row> {};

TEST_P(Messages, HaveNoEnglishPieceInGerman) {
    std::string const english = said(GetParam(), "C");
    std::string const german = said(GetParam(), "de");
    EXPECT_NE(english, german);
    std::set<std::string> const words = wordsOf(english);
    EXPECT_FALSE(words.empty()) << english;
    for (std::string const& word : wordsOf(german))
        EXPECT_EQ(words.count(word), 0U) << word << "\n" << english << german;
}

INSTANTIATE_TEST_SUITE_P(Kinds, Messages, testing::ValuesIn(kRows), [](auto const& row) {
    return row.param.name;
});

}  // namespace
