// MTEXT and -MTEXT in the program, session by session.

#include <string>

#include "tests/support/session_cases.h"

namespace {

class Sessions : public testing::TestWithParam<tztest::SessionCase> {};
TEST_P(Sessions, ShowAndDo) {
    tztest::expectSession(GetParam());
}

auto casesIn(char const* file) {
    return testing::ValuesIn(tztest::readCases(std::string("mtext/") + file));
}

INSTANTIATE_TEST_SUITE_P(FirstCorner, Sessions, casesIn("first_corner.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(SecondCorner, Sessions, casesIn("second_corner.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Options, Sessions, casesIn("option_prompts.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Styles, Sessions, casesIn("style_prompts.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Columns, Sessions, casesIn("columns.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Entities, Sessions, casesIn("create.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Editors, Sessions, casesIn("editors.txt"), tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(FirstPointFrames,
                         Sessions,
                         casesIn("frames/first_point.txt"),
                         tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(RectangleFrames,
                         Sessions,
                         casesIn("frames/rectangle.txt"),
                         tztest::nameOfCase);

}  // namespace
