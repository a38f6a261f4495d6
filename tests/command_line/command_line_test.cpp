// The idle prompt: commands from scripts, from strings that were sent, and from a terminal.

#include <gtest/gtest.h>

#include <deque>

#include "host/runtime/documents.h"
#include "tests/command_line/scripted_session.h"
#include "tz/ed/print.h"
#include "tz/ed/prompts.h"
#include "tz/rx/status.h"

namespace {

using tzhost::commandLine;
using tzhost::test::ScriptedSession;

// Every command up to the end of the input, apart by bars.
std::wstring commands() {
    std::wstring all;
    while (auto const command = commandLine().readCommand())
        all += *command + L"|";
    return all;
}

TEST(IdlePrompt, ReadsCommandsAndStepsOverTheRest) {
    ScriptedSession const session(";; a comment\nMTEXT\n\n^C\n<<<\nx\n>>>\n" +
                                  std::string(40000, 'x') + "\nQUIT");
    EXPECT_EQ(commands(), L"MTEXT||QUIT|");
    EXPECT_EQ(session.errors(), L"script:5: no editor takes this block\n");
    EXPECT_EQ(session.transcript(), L"Command: MTEXT\nCommand: \nCommand: ^C\nCommand: \n"
                                    L"That line is too long.\nCommand: QUIT\nCommand: ");
}

// Names used to reach the terminal with what it obeys in them.
TEST(Screen, ShowsControlCharactersAndKeepsErrorsInALine) {
    ScriptedSession const session("a\rb\n<<<\n>>>\n");
    tzutPrintf(L"\nL\x1B[6n\x9B\t\x7F\n");
    TzString text;
    EXPECT_EQ(tzedGetString(1, L"\nName <\a>: ", text), Tzad::ePromptNormal);
    EXPECT_EQ(text, L"a\rb");
    commandLine().sayFailure(L"a\nb\x1B: no");
    EXPECT_EQ(session.transcript(), L"L\\U+001B[6n\\U+009B\t\\U+007F\nName <\\U+0007>: "
                                    L"a\\U+000Db\na\\U+000Ab\\U+001B: no\n");
    EXPECT_EQ(session.errors(), L"script:1: a\\U+000Ab\\U+001B: no\n");
    EXPECT_TRUE(commandLine().hasFailed());
}

TEST(IdlePrompt, EndsWithoutAFault) {
    ScriptedSession const session("");
    EXPECT_EQ(commands(), L"");
    EXPECT_FALSE(commandLine().hasFailed());
    EXPECT_EQ(session.events(), "");
}

TEST(IdlePrompt, TakesSentStringsAheadOfTheScript) {
    ScriptedSession const session("from the script\n");
    tzhost::documents().open(nullptr);
    auto* const document = tzhost::documents().current();
    ASSERT_EQ(tzDocManagerPtr()->sendStringToExecute(document, L"_TEST 1.5 ", true, false, true),
              0);
    EXPECT_EQ(commandLine().readCommand(), L"_TEST");
    // What is sent while a command runs waits until it has ended.
    ASSERT_EQ(tzDocManagerPtr()->sendStringToExecute(document, L"NEXT\n", true, false, true), 0);
    double value = 0;
    EXPECT_EQ(tzedGetReal(L"? ", &value), Tzad::ePromptNormal);
    EXPECT_EQ(value, 1.5);
    TzString text;
    EXPECT_EQ(tzedGetString(1, L"? ", text), Tzad::ePromptNormal);
    EXPECT_EQ(text, L"from the script");
    EXPECT_EQ(commandLine().readCommand(), L"NEXT");
    tzhost::documents().close();
}

// Shows prompts and answers on the same screen, and an Enter after each.
class Terminal : public tzhost::AnswerSource {
public:
    Terminal(std::wstring& screen, std::deque<std::wstring> lines)
        : screen_(screen), lines_(std::move(lines)) {}
    tzhost::Answer next(tzhost::AnswerRequest const& request) override {
        words += std::to_string(request.offer.choices.size());
        if (lines_.empty()) return {};
        screen_ += std::wstring(request.prompt) + lines_.front() + L"\n";
        tzhost::Answer answer{tzhost::Answer::Kind::line, lines_.front()};
        lines_.pop_front();
        return answer;
    }
    [[nodiscard]] bool isPerson() const override { return true; }
    [[nodiscard]] bool echoes() const override { return true; }
    [[nodiscard]] bool ownsTerminal() const override { return true; }

    std::string words;  // how many words each question offered

private:
    std::wstring& screen_;
    std::deque<std::wstring> lines_;
};

TEST(Terminals, ShowEachLineOnce) {
    ScriptedSession const session("");
    std::wstring screen;
    Terminal terminal(screen, {L"MTEXT", L"b", L"7"});
    commandLine().setSource(&terminal);
    commandLine().setScreen([&](tzhost::Shown, std::wstring_view text) { screen += text; });
    EXPECT_EQ(commandLine().readCommand({L"MTEXT", L"MTEDIT"}), L"MTEXT");
    tzutPrintf(L"\nStarting");
    TzString word;
    ASSERT_EQ(tzedInitGet(0, L"Breite Tief Hoch"), Tzad::ePromptNormal);
    EXPECT_EQ(tzedGetKword(L"Which: ", word), Tzad::ePromptNormal);
    tzutPrintf(L"\n");
    double value = 0;
    EXPECT_EQ(tzedGetReal(L"\nHow much: ", &value), Tzad::ePromptNormal);
    tzutPrintf(L"Done");
    EXPECT_EQ(screen, L"Command: MTEXT\nStarting\nWhich: b\nHow much: 7\nDone");
    EXPECT_EQ(terminal.words, "260");
}

}  // namespace
