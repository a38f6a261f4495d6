// The line that tells how far a long job has come.

#include <gtest/gtest.h>

#include "apps/tzdraft/progress_line.h"

namespace {

using std::chrono::milliseconds;
using tzhost::Job;

class Progress : public testing::Test {
protected:
    Progress() { tzhost::setJobWatcher(&line_); }
    ~Progress() override { tzhost::setJobWatcher(nullptr); }

    void take(int steps) {
        for (int step = 0; step < steps; ++step) {
            now_ += milliseconds(25);
            Job::step();
        }
    }

    tzdraft::ProgressLine::Clock::time_point now_;
    std::string shown_;
    tzdraft::ProgressLine line_{[this](std::string_view text) { shown_ += text; },
                                [this] { shown_ += '^'; }, [this] { return now_; }};
};

// At every 400th millisecond the line is looked at, from the first second on.
TEST_F(Progress, ShowsFromTheFirstSecondToTheEnd) {
    {
        Job const job(L"Saving", 200);
        take(100);
    }
    EXPECT_EQ(shown_, "^\rSaving: 24 %\rSaving: 32 %\rSaving: 40 %\rSaving: 48 %\r            \r");
}

TEST_F(Progress, ShowsTheInnermostJob) {
    Job const job(L"Plot");
    take(16);
    {
        Job const measuring(L"Measuring", 32);
        Job const part(nullptr, 64);
        take(32);
    }
    take(32);
    EXPECT_EQ(shown_, "^\rMeasuring: 50 %\rPlot: 32       \rPlot: 48");
}

TEST_F(Progress, IsNotSeenOfShortJobs) {
    for (int job = 0; job < 3; ++job) {
        Job const brief(L"Opening");
        take(32);
    }
    take(99);
    EXPECT_EQ(shown_, "");
}

// What is shown meanwhile takes the line's place, and the line goes on below.
TEST_F(Progress, MakesRoom) {
    Job const job(L"Saving", 100);
    take(50);
    line_.clear();
    take(16);
    EXPECT_EQ(shown_, "^\rSaving: 48 %\r            \r^\rSaving: 64 %");
}

}  // namespace
