// The dialog editor in the program, session by session.

#include "tests/support/session_cases.h"

namespace {

class Dialog : public testing::TestWithParam<tztest::SessionCase> {};
TEST_P(Dialog, ShowsAndDoes) {
    tztest::expectSession(GetParam());
}
INSTANTIATE_TEST_SUITE_P(Cases,
                         Dialog,
                         testing::ValuesIn(tztest::readCases("edit/dialog.txt")),
                         tztest::nameOfCase);

}  // namespace
