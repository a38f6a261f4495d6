// System variables: types, limits, kinds of writers, overrides, and the three ways to read them.

#include <gtest/gtest.h>

#include <limits>
#include <vector>

#include "host/base/fault_point.h"
#include "host/settings/variables.h"
#include "tz/ed/variables.h"
#include "tz/rx/resbuf.h"
#include "tz/rx/status.h"
#include "tz/rx/variables.h"

namespace {

using tzhost::KeptIn;
using tzhost::Variables;
using tzhost::VariableValue;
using tzhost::Writer;

// Each test begins with the defaults of a fresh process.
class SystemVariables : public testing::Test {
protected:
    SystemVariables() : before_(store_.snapshot()) {}
    ~SystemVariables() override {
        store_.restore(before_);
        for (KeptIn const kind : {KeptIn::drawing, KeptIn::user, KeptIn::session}) {
            store_.resetKept(kind);
        }
    }

    Variables& store_ = Variables::instance();

private:
    Variables::Snapshot before_;
};

struct WriteRow {
    char const* name;
    std::wstring_view variable;
    std::wstring_view text;
    std::wstring_view reason;  // empty: taken
};
constexpr WriteRow kWrites[] = {
    {"ShortAtItsLimit", L"LUNITS", L"5", L""},
    {"ShortAboveItsLimit", L"LUNITS", L"6", L"LUNITS takes a whole number from 1 to 5."},
    {"ShortBelowItsLimit", L"lunits", L"0", L"LUNITS takes a whole number from 1 to 5."},
    {"ShortWithFraction", L"LUNITS", L"2.5", L"LUNITS takes a whole number from 1 to 5."},
    {"ShortBeyondItsType", L"TEXTALIGNMODE", L"32768", L"TEXTALIGNMODE takes a whole number."},
    {"AnyShort", L"TEXTALIGNMODE", L"-32768", L""},
    {"OneOrMore", L"CVPORT", L"0", L"CVPORT takes a whole number, 1 or more."},
    {"RealAtZero", L"TEXTSIZE", L"0", L""},
    {"RealBelowZero", L"TEXTSIZE", L"-1e-300", L"TEXTSIZE takes a number, 0 or more."},
    {"AboveZero", L"VIEWSIZE", L"0", L"VIEWSIZE takes a number above 0."},
    {"NotFinite", L"TEXTSIZE", L"1e999", L"TEXTSIZE takes a number, 0 or more."},
    {"NotANumber", L"TEXTSIZE", L"nan", L"TEXTSIZE takes a number, 0 or more."},
    {"NoNumber", L"TEXTSIZE", L"", L"TEXTSIZE takes a number, 0 or more."},
    {"BetweenReals", L"TSPACEFAC", L"4.0001", L"TSPACEFAC takes a number from 0.25 to 4."},
    {"Point", L"LASTPOINT", L"1,-2.5,3e2", L""},
    {"PlanarPoint", L"LASTPOINT", L"1,2", L""},
    {"PointOfOne", L"LASTPOINT", L"1", L"LASTPOINT takes a point x,y,z."},
    {"PointOfFour", L"LASTPOINT", L"1,2,3,4", L"LASTPOINT takes a point x,y,z."},
    {"ZeroDirection", L"VIEWDIR", L"0,0,0", L"VIEWDIR takes a point x,y,z other than 0,0,0."},
    {"EmptyText", L"TEXTLAYER", L"", L""},
    {"ReadOnly", L"CMDACTIVE", L"1", L"CMDACTIVE is read-only."},
    {"ReadOnlyWithNonsense", L"CMDACTIVE", L"x", L"CMDACTIVE is read-only."},
    {"Unknown", L"NOSUCH", L"1", L"There is no system variable \"NOSUCH\"."},
};
class VariableWrites : public SystemVariables, public testing::WithParamInterface<WriteRow> {};
TEST_P(VariableWrites, AreTakenOrRefused) {
    WriteRow const& row = GetParam();
    VariableValue const* const held = store_.get(row.variable);
    std::wstring const before = held ? tzhost::writeValue(*held) : L"";
    auto const result = store_.setFromText(row.variable, row.text, Writer::user);
    EXPECT_EQ(result.reason, row.reason);
    EXPECT_EQ(result.status, row.reason.empty() ? Tzad::ePromptNormal : Tzad::ePromptError);
    if (!row.reason.empty() && held) {
        EXPECT_EQ(tzhost::writeValue(*store_.get(row.variable)), before);
    }
}
INSTANTIATE_TEST_SUITE_P(Forms, VariableWrites, testing::ValuesIn(kWrites), [](auto const& row) {
    return row.param.name;
});

TEST_F(SystemVariables, ReadAsRecords) {
    struct Row {
        wchar_t const* name;
        int type;
    };
    for (Row const& row :
         {Row{L"lunits", 5003}, {L"TEXTSIZE", 5001}, {L"MTJIGSTRING", 5005}, {L"VIEWDIR", 5009}}) {
        resbuf value{};
        ASSERT_EQ(tzedGetVar(row.name, &value), Tzad::ePromptNormal);
        EXPECT_EQ(value.restype, row.type);
        EXPECT_EQ(tzedSetVar(row.name, &value), Tzad::ePromptNormal);
        if (row.type == Tzad::eResultString) tzutDelString(value.resval.rstring);
    }
    resbuf untouched{};
    untouched.restype = 77;
    EXPECT_EQ(tzedGetVar(L"NOSUCH", &untouched), Tzad::ePromptError);
    EXPECT_EQ(untouched.restype, 77);
}

TEST_F(SystemVariables, RefuseRecordsOfAnotherType) {
    resbuf record{nullptr, Tzad::eResultReal, {}};
    record.resval.rreal = 2;
    EXPECT_EQ(tzedSetVar(L"LUNITS", &record), Tzad::ePromptError);
    record.restype = Tzad::eResultShort;
    record.resval.rint = 2;
    EXPECT_EQ(tzedSetVar(L"TEXTSIZE", &record), Tzad::ePromptError);
    record.restype = Tzad::eResultVoid;
    EXPECT_EQ(tzedSetVar(L"LUNITS", &record), Tzad::ePromptError);
    record.restype = Tzad::eResultReal;
    record.resval.rreal = std::numeric_limits<double>::infinity();
    EXPECT_EQ(tzedSetVar(L"TEXTSIZE", &record), Tzad::ePromptError);
}

TEST_F(SystemVariables, TellObserversWhoWrote) {
    std::vector<std::wstring> seen;
    int const number = store_.addObserver([&seen](tzhost::VariableWrite const& write) {
        seen.push_back(std::wstring(write.definition.name) + L'=' +
                       tzhost::writeValue(write.value) +
                       (write.writer == Writer::module ? L" module" : L""));
    });
    resbuf record{nullptr, Tzad::eResultShort, {}};
    record.resval.rint = 1;
    EXPECT_EQ(tzedSetVar(L"mtextcommandactive", &record), Tzad::ePromptNormal);
    record.resval.rint = 2;
    EXPECT_EQ(tzedSetVar(L"MTEXTCOMMANDACTIVE", &record), Tzad::ePromptError);
    EXPECT_TRUE(store_.set(L"CMDACTIVE", short{1}, Writer::host).isDone());
    store_.removeObserver(number);
    EXPECT_TRUE(store_.set(L"CMDACTIVE", short{0}, Writer::host).isDone());
    EXPECT_EQ(seen, (std::vector<std::wstring>{L"MTEXTCOMMANDACTIVE=1 module", L"CMDACTIVE=1"}));
}

TEST_F(SystemVariables, OfTheDictionaryShowLaterChanges) {
    TzRxVariable const* const cursor = TzRxVariablesDictionary::get()->getVariable(L"CursorType");
    ASSERT_NE(cursor, nullptr);
    EXPECT_EQ(cursor->intValue(), 0);
    EXPECT_TRUE(store_.set(L"CURSORTYPE", short{1}, Writer::user).isDone());
    EXPECT_EQ(cursor->intValue(), 1);
    EXPECT_EQ(TzRxVariablesDictionary::get()->getVariable(L"NOSUCH"), nullptr);
    EXPECT_EQ(TzRxVariablesDictionary::get()->getVariable(L"MTJIGSTRING")->intValue(), 0);
}

std::wstring savedText(Variables const& store, KeptIn kind, std::wstring_view name) {
    for (auto const& [each, value] : store.kept(kind)) {
        if (each == name) return tzhost::writeValue(value);
    }
    return L"(not kept)";
}

TEST_F(SystemVariables, OverriddenAreNeitherSavedNorLost) {
    auto const start = store_.snapshot();
    EXPECT_FALSE(store_.overrideFromText(L"LUNITS", L"9").isDone());
    ASSERT_TRUE(store_.overrideFromText(L"LUNITS", L"4").isDone());
    // A drawing that is opened changes what lies beneath.
    EXPECT_TRUE(store_.setKept(L"LUNITS", short{3}).isDone());
    EXPECT_EQ(store_.number(L"LUNITS"), 4);
    EXPECT_EQ(savedText(store_, KeptIn::drawing, L"LUNITS"), L"3");
    auto const beforeWrite = store_.snapshot();
    EXPECT_TRUE(store_.set(L"LUNITS", short{1}, Writer::module).isDone());
    EXPECT_EQ(store_.number(L"LUNITS"), 1);
    store_.restore(beforeWrite);
    EXPECT_EQ(store_.number(L"LUNITS"), 4);
    store_.restore(start);
}

TEST_F(SystemVariables, OverriddenReadOnlyOnesHoldAgainstTheHost) {
    EXPECT_EQ(savedText(store_, KeptIn::user, L"SYSCODEPAGE"), L"ANSI_1252");
    auto const start = store_.snapshot();
    ASSERT_TRUE(store_.overrideFromText(L"TEXTSTYLE", L"Notes").isDone());
    EXPECT_TRUE(store_.set(L"TEXTSTYLE", std::wstring(L"Standard"), Writer::host).isDone());
    EXPECT_EQ(store_.text(L"TEXTSTYLE"), L"Notes");
    store_.restore(start);
}

TEST_F(SystemVariables, FailAsTheFaultPlanSays) {
    auto* const before = tzhost::setFaultHook([](std::string_view operation, int& status) {
        if (operation == "tzedSetVar") status = -5002;
        return operation == "tzedGetVar" || operation == "tzedSetVar";
    });
    resbuf record{nullptr, Tzad::eResultShort, {}};
    EXPECT_EQ(tzedGetVar(L"LUNITS", &record), Tzad::ePromptError);
    EXPECT_EQ(tzedSetVar(L"LUNITS", &record), Tzad::ePromptCancel);
    tzhost::setFaultHook(before);
}

}  // namespace
