// Which way MTEXT and -MTEXT take their text, and what is left when they end.

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <memory>
#include <new>
#include <vector>

#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "host/runtime/module_linker.h"
#include "tests/command_line/scripted_session.h"
#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"

namespace {

using tzhost::AnswersFrom;
using tzhost::test::ScriptedSession;

class Commands : public testing::Test {
protected:
    Commands() {
        tzhost::setWorkingDrawing(drawing_.get());
        tzhost::documents().open(drawing_.get());
        EXPECT_TRUE(tzhost::dynamicLinker().load(
            std::filesystem::path(std::getenv("TZ_TEST_LIB")) / "tzmted.tzx", error_))
            << error_;
    }
    ~Commands() override {
        tzhost::dynamicLinker().unloadAll();
        tzhost::documents().close();
        tzhost::setWorkingDrawing(nullptr);
        for (auto const kind : {tzhost::KeptIn::user, tzhost::KeptIn::session})
            tzhost::Variables::instance().resetKept(kind);
    }

    // Contents of the texts in model space, one a line.
    [[nodiscard]] std::string texts() const {
        TzArray<TzDbObjectId> ids;
        {
            EasyObject<TzDbBlockTableRecord> space;
            if (tzdbOpenObject(space.object, drawing_->modelSpace(), TzDb::kForRead) == Tzad::eOk)
                space->entities(ids);
        }
        std::string all;
        for (TzDbObjectId const& id : ids) {
            EasyObject<TzDbMText> text;
            if (tzdbOpenObject(text.object, id, TzDb::kForRead) == Tzad::eOk)
                all += text->contents().toUtf8() + "\n";
        }
        return all;
    }

    std::unique_ptr<tzhost::Drawing> drawing_ = tzhost::Drawing::create();
    std::string error_;
};

struct WayRow {
    char const* name;
    wchar_t const* command;
    short dialogs;
    short macroPlayback;
    AnswersFrom answers;
    bool editor;
};
constexpr WayRow kWays[] = {
    {"DialogsAllowed", L"MTEXT", 1, 0, AnswersFrom::script, true},
    {"ScriptWithoutDialogs", L"MTEXT", 0, 0, AnswersFrom::script, false},
    {"MacroWithoutDialogs", L"MTEXT", 0, 1, AnswersFrom::script, true},
    {"UserWithoutDialogs", L"MTEXT", 0, 0, AnswersFrom::user, true},
    {"CommandLineForm", L"-MTEXT", 1, 0, AnswersFrom::user, false},
    {"CommandLineFormInAMacro", L"-MTEXT", 1, 1, AnswersFrom::script, false},
};
class WaysOfText : public Commands, public testing::WithParamInterface<WayRow> {};
TEST_P(WaysOfText, AreChosenByDialogsScriptAndMacro) {
    WayRow const& row = GetParam();
    auto& variables = tzhost::Variables::instance();
    ScriptedSession const session(row.editor ? "0,0\n5,5\n<<<\ntyped\n>>>\n"
                                             : "0,0\n5,5\ntyped\n\n");
    ASSERT_TRUE(variables.set(L"DIALOGS", row.dialogs, tzhost::Writer::user).isDone());
    ASSERT_TRUE(variables.set(L"MACROPLAYBACK", row.macroPlayback, tzhost::Writer::user).isDone());
    tzhost::Command const* const command = tzhost::commandStack().find(row.command);
    ASSERT_NE(command, nullptr);
    EXPECT_TRUE(tzhost::runCommand(*command, row.answers).clean());
    EXPECT_EQ(texts(), "typed\n") << session.events();
    EXPECT_EQ(session.events().find("\"kind\":\"inPlace\"") != std::string::npos, row.editor);
    EXPECT_EQ(variables.number(L"MTEXTCOMMANDACTIVE"), 0);
    EXPECT_LT(session.events().find("\"MTEXTCOMMANDACTIVE\",\"value\":1"),
              session.events().find("\"prompt\""));
}
INSTANTIATE_TEST_SUITE_P(Rows, WaysOfText, testing::ValuesIn(kWays), [](auto const& row) {
    return row.param.name;
});

// Memory fails from the first drag on.
bool dragged = false;
bool failMemoryAfterDrag(std::string_view operation, int&) {
    dragged = dragged || operation == "TzEdJig::drag";
    return dragged && operation == "operator new";
}

// The last step of a command alone clears MTEXTCOMMANDACTIVE. The next run reaches that step.
TEST_F(Commands, LeaveTheirMarkWhenAnExceptionPasses) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer's own operator new serves in this build";
#endif
    auto const& variables = tzhost::Variables::instance();
    tzhost::Command const& command = *tzhost::commandStack().find(L"-MTEXT");
    ScriptedSession const session("0,0\n^C\n");
    dragged = false;
    tzhost::setFaultHook(failMemoryAfterDrag);
    EXPECT_THROW((void)tzhost::runCommand(command, AnswersFrom::script), std::bad_alloc);
    tzhost::setFaultHook(nullptr);
    EXPECT_EQ(variables.number(L"MTEXTCOMMANDACTIVE"), 1);
    EXPECT_EQ(texts(), "");
    EXPECT_TRUE(tzhost::runCommand(command, AnswersFrom::script).clean());
    EXPECT_EQ(variables.number(L"MTEXTCOMMANDACTIVE"), 0);
}

TEST_F(Commands, LeaveNothingWhenCancelled) {
    for (char const* script : {"^C\n", "0,0\n^C\n", "0,0\n5,5\n^C\n", "0,0\n5,5\ntyped\n^C\n"}) {
        ScriptedSession const session(script);
        EXPECT_TRUE(tzhost::runCommand(*tzhost::commandStack().find(L"-MTEXT"), AnswersFrom::script)
                        .clean());
        EXPECT_EQ(texts(), "");
        EXPECT_EQ(tzhost::Variables::instance().number(L"MTEXTCOMMANDACTIVE"), 0) << script;
    }
}

}  // namespace
