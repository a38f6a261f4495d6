// Calls of the window system that modules make.

#include <gtest/gtest.h>

#include <climits>

#include "tz/pal/windows_calls.h"

namespace {

TEST(MulDivRounds, HalvesAwayFromZero) {
    struct Row {
        int number, numerator, denominator, result;
    };
    for (Row const& row : {Row{7, 1, 2, 4},
                           {-7, 1, 2, -4},
                           {7, -1, 2, -4},
                           {7, 1, -2, -4},
                           {-7, -1, -2, -4},
                           {5, 1, 3, 2},
                           {4, 1, 3, 1},
                           {0, 5, 7, 0},
                           {1, 1, 0, -1},
                           {INT_MAX, 2, 1, -1},
                           {INT_MAX, 2, 4, 1073741824},
                           {INT_MIN, 1, 1, INT_MIN},
                           {INT_MIN, -1, 1, -1},
                           {100, 1, INT_MIN, 0}}) {
        EXPECT_EQ(MulDiv(row.number, row.numerator, row.denominator), row.result)
            << row.number << '*' << row.numerator << '/' << row.denominator;
    }
}

TEST(ClassIds, ArePrintedInTheirUsualForm) {
    _GUID const id{0x21401, 0, 0x46AB, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}};
    wchar_t* text = nullptr;
    ASSERT_EQ(StringFromCLSID(id, &text), 0);
    EXPECT_STREQ(text, L"{00021401-0000-46AB-C000-000000000046}");
    CoTaskMemFree(text);
    EXPECT_LT(StringFromCLSID(id, nullptr), 0);
}

}  // namespace
