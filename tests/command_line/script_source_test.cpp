// What a script's lines mean, to answers and to editors.

#include <gtest/gtest.h>

#include <fstream>

#include "host/command_line/script_source.h"
#include "host/command_line/sent_strings.h"
#include "host/text/utf8.h"

namespace {

using tzhost::Answer;
using tzhost::QuestionKind;
using tzhost::ScriptSource;

std::string notation(Answer const& answer) {
    switch (answer.kind) {
    case Answer::Kind::line: return "[" + tzhost::toUtf8(answer.text) + "]";
    case Answer::Kind::cancel: return "cancel";
    case Answer::Kind::tooLong: return "long";
    case Answer::Kind::fault: return "fault(" + tzhost::toUtf8(answer.text) + ")";
    default: return "end";
    }
}

// Every answer up to the end, apart by blanks; at "B" in `takes` the editor asks for its block
// first.
std::string answersOf(ScriptSource& source, QuestionKind kind, std::string_view takes) {
    std::string all;
    for (std::size_t i = 0;; ++i) {
        if (i < takes.size() && takes[i] == 'B') {
            auto const block = source.takeBlock();
            all += !block ? "none " : block->accepted ? "block{" : "left{";
            if (block) all += tzhost::toUtf8(block->text) + "} ";
            continue;
        }
        Answer const answer = source.next({kind, L"", {}});
        all += notation(answer);
        if (answer.kind == Answer::Kind::end) return all;
        all += ' ';
    }
}

struct ScriptRow {
    char const* name;
    std::string_view script;
    QuestionKind kind;
    std::string_view takes;
    std::string_view answers;
};

constexpr auto kPoint = QuestionKind::point;
constexpr auto kString = QuestionKind::string;

constexpr ScriptRow kScripts[] = {
    {"Lines", "1,2\n\n3\n", kPoint, "", "[1,2] [] [3] end"},
    {"NoLineEnd", "1,2", kPoint, "", "[1,2] end"},
    {"Nothing", "", kPoint, "", "end"},
    {"CarriageReturns", "a\r\n\r\nb\r\n", kPoint, "", "[a] [] [b] end"},
    {"ByteOrderMark",
     "\xEF\xBB\xBF"
     "a\n",
     kPoint, "", "[a] end"},
    {"Comments", ";; one\na\n;;two\nb;;\n", kPoint, "", "[a] [b;;] end"},
    {"Cancel", "^C\n^C  \n^Cx\n", kPoint, "", "cancel cancel [^Cx] end"},
    {"StringKeepsAll", " ^C\n<<<\n;;c\n~1\n^C\n", kString, "", "[ ^C] [<<<] [~1] cancel end"},
    {"Block", "<<<\na\n\nb\n>>>\nc\n", kPoint, "B", "block{a\n\nb} [c] end"},
    {"EmptyBlock", "<<<\n>>>\n", kPoint, "B", "block{} end"},
    {"BlockLeft", "<<<\na\n>>>cancel\n", kPoint, "B", "left{a} end"},
    {"BlockEscape", "<<<\n>>>>\n>>>>>\n>>>\n", kPoint, "B", "block{>>>\n>>>>>} end"},
    {"BlockKeepsMarks", "<<<\n;;a\n^C\n>>>\n", kPoint, "B", "block{;;a\n^C} end"},
    {"CommentAhead", ";;x\n<<<\na\n>>>\n", kPoint, "B", "block{a} end"},
    {"NoBlockNext", "a\n<<<\nb\n>>>\n", kPoint, "BAB", "none [a] block{b} end"},
    {"TwoBlocks", "<<<\na\n>>>\n<<<\nb\n>>>", kPoint, "BB", "block{a} block{b} end"},
    {"UntakenBlock", "a\n<<<\nb\n>>>\nc\n", kPoint, "",
     "[a] fault(script:2: no editor takes this block) [c] end"},
    {"BlockWithoutEnd", "\n<<<\nb\n", kPoint, "AB",
     "[] left{} fault(script:2: this block has no end, a line >>> or >>>cancel) end"},
    {"BlockNotUtf8", "<<<\n\xFF\n>>>\n", kPoint, "B",
     "left{} fault(script:2: this line is not UTF-8) end"},
    {"NotUtf8AtEditor", "\xFF\n<<<\na\n>>>\n", kPoint, "B",
     "left{} fault(script:1: this line is not UTF-8) end"},
    {"ZeroCharacter",
     {"a\nLI\0NE\nb\n", 10},
     kPoint,
     "",
     "[a] fault(script:2: this line holds a zero character) end"},
    {"NotUtf8", "a\n\xFF\nb\n", kPoint, "", "[a] fault(script:2: this line is not UTF-8) end"},
};

class Script : public testing::TestWithParam<ScriptRow> {};
TEST_P(Script, Gives) {
    ScriptSource source(GetParam().script);
    EXPECT_EQ(answersOf(source, GetParam().kind, GetParam().takes), GetParam().answers);
}
INSTANTIATE_TEST_SUITE_P(Lines, Script, testing::ValuesIn(kScripts), [](auto const& row) {
    return row.param.name;
});

TEST(Scripts, DropLinesThatAreTooLong) {
    std::string const longest(tzhost::kLongestAnswer, 'x');
    ScriptSource source(longest + "\n" + longest + "y\n" + std::string(1 << 20, 'z') + "\n<<<\n" +
                        longest + "yy\n>>>\na\n");
    EXPECT_EQ(notation(source.next({kPoint, L"", {}})), "[" + longest + "]");
    EXPECT_EQ(notation(source.next({kPoint, L"", {}})), "long");
    EXPECT_EQ(notation(source.next({kString, L"", {}})), "long");
    EXPECT_EQ(source.takeBlock()->text.size(), longest.size() + 2);
    EXPECT_EQ(notation(source.next({kPoint, L"", {}})), "[a]");
}

TEST(Scripts, AreCheckedWholeWhenOpened) {
    std::ofstream("bad.txt") << "a\nb\n\xC3(\n";
    std::ofstream("good.txt") << "é\n";
    std::string error;
    EXPECT_EQ(ScriptSource::open("bad.txt", error), nullptr);
    EXPECT_EQ(error, "bad.txt:3: this line is not UTF-8");
    std::ofstream("bad.txt") << "a\n" << '\0' << "\n\xFF\n";
    EXPECT_EQ(ScriptSource::open("bad.txt", error), nullptr);
    EXPECT_EQ(error, "bad.txt:2: this line holds a zero character");
    EXPECT_EQ(ScriptSource::open("missing.txt", error), nullptr);
    EXPECT_EQ(error, "missing.txt: the script cannot be read: No such file or directory");
    auto const source = ScriptSource::open("good.txt", error);
    ASSERT_NE(source, nullptr);
    EXPECT_EQ(notation(source->next({kPoint, L"", {}})), "[é]");
}

struct SentRow {
    char const* name;
    std::wstring_view text;
    std::string_view answers;
};

constexpr SentRow kSent[] = {
    {"Blanks", L"MTEXT 0,0 5,5 ", "[MTEXT] [0,0] [5,5]"},
    {"BehindComma", L"1, 2 3", "[1, 2] [3]"},
    {"LineEnds", L"a\nb\r\nc\rd", "[a] [b] [c] [d]"},
    {"Enter", L"a  \nb", "[a] [] [] [b]"},
    {"Cancels",
     L"\x03\x03"
     L"a\x03",
     "cancel cancel [a] cancel"},
};

class Sent : public testing::TestWithParam<SentRow> {};
TEST_P(Sent, StringsGive) {
    tzhost::SentStrings sent;
    sent.push(GetParam().text);
    std::string all;
    while (!sent.isEmpty())
        all += (all.empty() ? "" : " ") + notation(sent.next());
    EXPECT_EQ(all, GetParam().answers);
    EXPECT_EQ(notation(sent.next()), "end");
}
INSTANTIATE_TEST_SUITE_P(Texts, Sent, testing::ValuesIn(kSent), [](auto const& row) {
    return row.param.name;
});

}  // namespace
