#pragma once

#include <gtest/gtest.h>

#include "tests/support/case_file.h"

// Session cases as tests: each runs in the program with the real module, and everything that it
// shows is compared. With TZ_TEST_ACCEPT set what was seen becomes what is expected.
//
//   class OptionPrompts : public testing::TestWithParam<tztest::SessionCase> {};
//   TEST_P(OptionPrompts, ShowAndDo) { tztest::expectSession(GetParam()); }
//   INSTANTIATE_TEST_SUITE_P(Cases, OptionPrompts,
//                            testing::ValuesIn(tztest::readCases("mtext/option_prompts.txt")),
//                            tztest::nameOfCase);
namespace tztest {

// What is to be seen of a session: its events, the entities at the end, and the exit status when it
// is not 0.
[[nodiscard]] std::vector<std::string> runSession(SessionCase const& session);

void expectSession(SessionCase const& session);

[[nodiscard]] inline std::string nameOfCase(testing::TestParamInfo<SessionCase> const& row) {
    return row.param.name;
}

}  // namespace tztest
