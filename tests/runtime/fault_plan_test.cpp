#include <gtest/gtest.h>

#include <new>

#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "host/faults/fault_plan.h"

namespace {

using namespace tzhost;

struct RuleCase {
    char const* name;
    char const* rule;
    char const*
        outcome;  // of five calls of "TzEdJig::drag": . goes on, a digit is the status, - is -1
};
constexpr RuleCase kRules[] = {
    {"FirstByDefault", "TzEdJig::drag", "x...."},
    {"Third", "TzEdJig::drag:3", "..x.."},
    {"Every", "TzEdJig::drag:*", "xxxxx"},
    {"Status", "TzEdJig::drag:2=7", ".7..."},
    {"NegativeStatus", "TzEdJig::drag=-1", "-...."},
    {"OtherOperation", "TzEdJig::acquirePoint", "....."},
    {"EveryStatus", "TzEdJig::drag:*=4", "44444"},
};
class FaultRules : public testing::TestWithParam<RuleCase> {};

TEST_P(FaultRules, StrikeTheCallsThatTheyName) {
    FaultPlan plan;
    ASSERT_FALSE(plan.add(GetParam().rule));
    plan.install();
    std::string outcome;
    for (int call = 0; call < 5; ++call) {
        auto const fault = faultAt("TzEdJig::drag");
        if (!fault) {
            outcome += '.';
        } else if (*fault == kUsualFailure) {
            outcome += 'x';
        } else {
            outcome += *fault == -1 ? "-" : std::to_string(*fault);
        }
    }
    EXPECT_EQ(outcome, GetParam().outcome);
    EXPECT_EQ(plan.calls().at("TzEdJig::drag"), 5);
    EXPECT_EQ(plan.hasStruck(), outcome != ".....");
    plan.remove();
    EXPECT_FALSE(faultAt("TzEdJig::drag"));
}
INSTANTIATE_TEST_SUITE_P(Forms, FaultRules, testing::ValuesIn(kRules), [](auto const& row) {
    return row.param.name;
});

TEST(FaultRules, RefuseWhatIsNoRule) {
    FaultPlan plan;
    for (char const* const wrong :
         {"", ":2", "=4", "name:0", "name:-1", "name:x", "name:", "name=", "name=x", "name:2=1x"}) {
        EXPECT_TRUE(plan.add(wrong)) << wrong;
    }
}

// A call, since an optimising compiler leaves out a new whose object is deleted at once.
void allocate() {
    ::operator delete(::operator new(1));
}

TEST(MemoryFaults, StrikeWithinACommandAlone) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer's own operator new serves in this build";
#endif
    FaultPlan plan;
    ASSERT_FALSE(plan.add("operator new:2"));
    plan.install();
    allocate();  // outside: neither counted nor refused
    MemoryFaultScope const command;
    allocate();
    {
        MemoryFaultPause const pause;
        allocate();
    }
    EXPECT_THROW(allocate(), std::bad_alloc);
    allocate();
}

}  // namespace
