// Selection sets that a command does not free.

#include <gtest/gtest.h>

#include "host/base/audit.h"
#include "host/runtime/command_stack.h"
#include "tests/support/program_run.h"
#include "tz/ed/selection.h"
#include "tz/rx/resource.h"
#include "tz/rx/status.h"

namespace {

void leaveASet() {
    long long set[2] = {};
    ASSERT_EQ(tzedSSGet(nullptr, nullptr, nullptr, nullptr, set), Tzad::ePromptNormal);
}

// The sets used to live on and to count in every later audit.
TEST(LeftSets, CountForTheirCommandAlone) {
    constexpr wchar_t kGroup[] = L"LEFT";
    ASSERT_EQ(tzhost::commandStack().addCommand(kGroup, L"LEAVE", L"LEAVE", 0, leaveASet, nullptr,
                                                -1, TzRxResourceInstance::empty, nullptr),
              Tzad::eOk);
    auto const script = tztest::scratch("left.scr", "LINE\n0,0\n1,1\n\nLEAVE\nall\n\nQUIT\n");
    auto const file = tztest::scratch("left.jsonl");
    tztest::ProgramRun const run =
        tztest::runProgram({"--script", script.string(), "--events", file.string()});
    EXPECT_EQ(tzhost::commandStack().removeGroup(kGroup), Tzad::eOk);
    EXPECT_EQ(run.status, tzdraft::kLeftOver) << run.errors;
    std::vector<int> counted;
    for (auto const& event : tztest::eventsOf(file)) {
        if (event["event"] == "audit") counted.push_back(event["selectionSets"]);
    }
    EXPECT_EQ(counted, (std::vector<int>{0, 1, 0}));
    EXPECT_EQ(tzhost::audit().selectionSets, 0);
}

}  // namespace
