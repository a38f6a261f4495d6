#include "tests/support/session_cases.h"

namespace {

// The program's own commands: what they leave in the drawing.
class HostCommands : public testing::TestWithParam<tztest::SessionCase> {};

TEST_P(HostCommands, LeaveInTheDrawing) {
    tztest::expectSession(GetParam());
}

INSTANTIATE_TEST_SUITE_P(Entities,
                         HostCommands,
                         testing::ValuesIn(tztest::readCases("host_commands/entities.txt")),
                         tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Undo,
                         HostCommands,
                         testing::ValuesIn(tztest::readCases("host_commands/undo.txt")),
                         tztest::nameOfCase);

}  // namespace
