// System variables by type, and the code page that one of them names.

#include <gtest/gtest.h>

#include "host/base/fault_point.h"
#include "module/host_calls/sys_code_page.h"
#include "module/host_calls/sys_var.h"
#include "module/host_calls/truncate.h"
#include "tests/module_ground/variables_fixture.h"
#include "tz/ge/point3d.h"

namespace {

class SysVar : public WithVariables {};

struct ReadRow {
    wchar_t const* variable;
    wchar_t const* given;
    wchar_t const* text;
    int whole;
    double real;
};
constexpr ReadRow kReads[] = {
    {L"LUNITS", L"4", L"4", 4, 4},
    {L"TEXTSIZE", L"2.9", L"2.9", 2, 2.9},
    {L"textsize", L"1234567.5", L"1.23457e+06", 1234567, 1234567.5},
    {L"TSPACEFAC", L"0.25", L"0.25", 0, 0.25},
    {L"MTJIGSTRING", L"abc {1}", L"abc {1}", 0, 0},
    {L"LASTPOINT", L"1,2,3", L"", 0, 0},
};
TEST_F(SysVar, ReadsEachTypeAsText_WholeAndReal) {
    for (ReadRow const& row : kReads) {
        SCOPED_TRACE(row.given);
        give(row.variable, row.given);
        EXPECT_EQ(CTzadSysVar::GetString(row.variable).str(), row.text);
        EXPECT_EQ(CTzadSysVar::GetInt(row.variable), row.whole);
        EXPECT_EQ(CTzadSysVar::GetDouble(row.variable), row.real);
    }
}

TEST_F(SysVar, GivesTheNeutralValueWhenNothingCanBeRead) {
    auto* const before = tzhost::setFaultHook(
        [](std::string_view operation, int&) { return operation == "tzedGetVar"; });
    for (wchar_t const* name : {L"LUNITS", L"TEXTSIZE", L"MTJIGSTRING", L"NOSUCH"}) {
        EXPECT_TRUE(CTzadSysVar::GetString(name).isEmpty());
        EXPECT_EQ(CTzadSysVar::GetInt(name), 0);
        EXPECT_EQ(CTzadSysVar::GetDouble(name), 0);
    }
    tzhost::setFaultHook(before);
    EXPECT_EQ(CTzadSysVar::GetInt(L"NOSUCH"), 0);
}

TEST_F(SysVar, WritesOnlyItsOwnTypeWithinTheLimits) {
    EXPECT_TRUE(CTzadSysVar::SetInt(L"TSPACETYPE", 2));
    EXPECT_EQ(store_.number(L"TSPACETYPE"), 2);
    EXPECT_FALSE(CTzadSysVar::SetInt(L"TSPACETYPE", 3));
    EXPECT_FALSE(CTzadSysVar::SetInt(L"TEXTSIZE", 1));
    EXPECT_TRUE(CTzadSysVar::SetDouble(L"TEXTSIZE", 2.5));
    EXPECT_EQ(store_.number(L"TEXTSIZE"), 2.5);
    EXPECT_FALSE(CTzadSysVar::SetDouble(L"LUNITS", 2));
    EXPECT_FALSE(CTzadSysVar::SetInt(L"CMDACTIVE", 1));
    EXPECT_TRUE(CTzadSysVar::SetPoint(L"LASTPOINT", TzGePoint3d(1, -2, 3)));
    EXPECT_EQ(tzhost::writeValue(*store_.get(L"LASTPOINT")), L"1,-2,3");
}

TEST(TruncatedToInt, TakesTheNearestIntOfWhatDoesNotFit) {
    EXPECT_EQ(truncatedToInt(-2.9), -2);
    EXPECT_EQ(truncatedToInt(2147483647.5), 2147483647);
    EXPECT_EQ(truncatedToInt(1e300), 2147483647);
    EXPECT_EQ(truncatedToInt(-1e300), -2147483647 - 1);
    EXPECT_EQ(truncatedToInt(0.0 / 0.0 * 1), 0);
}

TEST_F(SysVar, NamesTheCodePageBehindItsLastUnderscore) {
    struct Row {
        wchar_t const* given;
        int page;
    };
    for (Row const& row : {Row{L"ANSI_1252", 1252},
                           {L"A_B_932", 932},
                           {L"1250", 1250},
                           {L"ANSI_", 0},
                           {L"dos437", 0},
                           {L"ANSI_437x", 437},
                           {L"ANSI_99999999999999999999", 2147483647}}) {
        give(L"SYSCODEPAGE", row.given);
        EXPECT_EQ(SysCodePage(), row.page) << row.given;
    }
}

}  // namespace
