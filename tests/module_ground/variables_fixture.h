#pragma once

#include <gtest/gtest.h>

#include <string_view>

#include "host/settings/variables.h"

// Each test begins with the defaults of a fresh process and restores them at its end.
class WithVariables : public testing::Test {
protected:
    WithVariables() : before_(store_.snapshot()) {}
    ~WithVariables() override {
        store_.restore(before_);
        for (auto const kind :
             {tzhost::KeptIn::drawing, tzhost::KeptIn::user, tzhost::KeptIn::session})
            store_.resetKept(kind);
    }

    // Sets a variable of any kind, as --var does.
    void give(std::wstring_view name, std::wstring_view value) {
        EXPECT_TRUE(store_.overrideFromText(name, value).isDone());
    }

    tzhost::Variables& store_ = tzhost::Variables::instance();

private:
    tzhost::Variables::Snapshot before_;
};
