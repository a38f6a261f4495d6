// The commands that edit and change texts in the program, session by session.

#include <string>

#include "tests/support/session_cases.h"

namespace {

class Sessions : public testing::TestWithParam<tztest::SessionCase> {};
TEST_P(Sessions, ShowAndDo) {
    tztest::expectSession(GetParam());
}

auto casesIn(char const* file) {
    return testing::ValuesIn(tztest::readCases(std::string("commands/") + file));
}

INSTANTIATE_TEST_SUITE_P(Edit, Sessions, casesIn("edit.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Height, Sessions, casesIn("height.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Properties, Sessions, casesIn("properties.txt"), tztest::nameOfCase);

}  // namespace
