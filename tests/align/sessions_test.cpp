// TEXTALIGN in the program, session by session.

#include "tests/support/session_cases.h"

namespace {

class Sessions : public testing::TestWithParam<tztest::SessionCase> {};
TEST_P(Sessions, ShowAndDo) {
    tztest::expectSession(GetParam());
}
INSTANTIATE_TEST_SUITE_P(Cases,
                         Sessions,
                         testing::ValuesIn(tztest::readCases("align/textalign.txt")),
                         tztest::nameOfCase);

}  // namespace
