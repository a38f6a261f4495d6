#include "host/display/screen.h"

#include <gtest/gtest.h>

#include <limits>
#include <string>
#include <string_view>

#include "host/settings/variables.h"
#include "tz/ed/view.h"

namespace {

using namespace tzhost;

class Screens : public testing::Test {
protected:
    void SetUp() override { Variables::instance().resetKept(KeptIn::drawing); }
    void TearDown() override { Variables::instance().resetKept(KeptIn::drawing); }

    static void set(std::wstring_view name, std::wstring_view value) {
        ASSERT_TRUE(Variables::instance().setFromText(name, value, Writer::host).isDone());
    }
};

struct PixelCase {
    char const* name;
    wchar_t const* centre;
    wchar_t const* size;
    wchar_t const* direction;
    wchar_t const* tileMode;
    int viewport;
    TzGePoint3d world;
    char const* pixel;
};
// name, VIEWCTR, VIEWSIZE, VIEWDIR, TILEMODE, viewport, world point, pixel
constexpr PixelCase kPixels[] = {
    {"Middle", L"0,0,0", L"9", L"0,0,1", L"1", 2, {0, 0, 0}, "800 450"},
    {"UpIsLess", L"0,0,0", L"9", L"0,0,1", L"1", 2, {1, 2, 0}, "900 250"},
    {"DepthIsNothing", L"0,0,0", L"9", L"0,0,1", L"1", 2, {1, 2, 77}, "900 250"},
    {"CornerOfTheArea", L"10,5,0", L"10", L"0,0,1", L"1", 2, {1.1111, 10, 0}, "0 0"},
    {"OutsideTheArea", L"0,0,0", L"9", L"0,0,1", L"1", 2, {-20, 0, 0}, "-1200 450"},
    {"Rounded", L"0,0,0", L"900", L"0,0,1", L"1", 2, {0.6, 0.4, 0}, "801 450"},
    {"FromTheFront", L"0,0,0", L"9", L"0,-1,0", L"1", 2, {1, 5, 2}, "900 250"},
    {"FromTheRight", L"0,0,0", L"9", L"1,0,0", L"1", 2, {5, 1, 2}, "900 250"},
    {"OneIsTiledToo", L"0,0,0", L"9", L"0,-1,0", L"1", 1, {1, 5, 2}, "900 250"},
    {"PaperFromAbove", L"0,0,0", L"9", L"0,-1,0", L"0", 1, {1, 2, 0}, "900 250"},
    {"ModelOnPaper", L"0,0,0", L"9", L"0,-1,0", L"0", 2, {1, 5, 2}, "900 250"},
    {"NoViewport", L"0,0,0", L"9", L"0,0,1", L"1", 0, {0, 0, 0}, "none"},
    {"TooFar", L"0,0,0", L"9", L"0,0,1", L"1", 2, {1e8, 0, 0}, "none"},
    {"Far", L"0,0,0", L"9", L"0,0,1", L"1", 2, {1e7, 0, 0}, "1000000800 450"},
};
class Pixels : public Screens, public testing::WithParamInterface<PixelCase> {};
TEST_P(Pixels, FollowTheView) {
    auto const& row = GetParam();
    set(L"VIEWCTR", row.centre);
    set(L"VIEWSIZE", row.size);
    set(L"VIEWDIR", row.direction);
    set(L"TILEMODE", row.tileMode);
    POINT pixel{-7, -7};
    bool const found = tzedCoordFromWorldToPixel(row.viewport, row.world, pixel);
    std::string const text = std::to_string(pixel.x) + ' ' + std::to_string(pixel.y);
    EXPECT_EQ(found ? text : "none", row.pixel);
    if (!found) {
        EXPECT_EQ(text, "-7 -7");
        return;
    }
    // And back: the point that the pixel shows is shown by that pixel.
    TzGePoint3d world;
    POINT again{};
    ASSERT_TRUE(tzedCoordFromPixelToWorld(row.viewport, pixel, world));
    ASSERT_TRUE(tzedCoordFromWorldToPixel(row.viewport, world, again));
    EXPECT_EQ(again.x, pixel.x);
    EXPECT_EQ(again.y, pixel.y);
}
INSTANTIATE_TEST_SUITE_P(Views, Pixels, testing::ValuesIn(kPixels), [](auto const& row) {
    return row.param.name;
});

TEST_F(Screens, RefusePlacesThatAreNoNumbers) {
    double const nan = std::numeric_limits<double>::quiet_NaN();
    POINT pixel{};
    EXPECT_FALSE(tzedCoordFromWorldToPixel(2, {nan, 0, 0}, pixel));
    EXPECT_FALSE(
        tzedCoordFromWorldToPixel(2, {0, -std::numeric_limits<double>::infinity(), 0}, pixel));
}

}  // namespace
