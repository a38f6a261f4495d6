#include "host/display/frame.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>

#include "host/base/entity_drawing.h"
#include "host/display/draw_pass.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"
#include "tz/ge/matrix3d.h"

namespace {

using namespace tzhost;
using Body = std::function<void(TzGiWorldDraw&)>;

// A preview as modules write them: it draws what it was told to.
class Preview : public TzDbEntity {
public:
    explicit Preview(Body body) : body_(std::move(body)) {}

protected:
    unsigned int subSetAttributes(TzGiDrawableTraits* traits) override {
        traits->setColor(3);
        return 0;
    }
    bool subWorldDraw(TzGiWorldDraw* draw) override {
        body_(*draw);
        return true;
    }

private:
    Body body_;
};

// What a frame of the body holds, without the words that are always there.
std::string frameOf(Body const& body) {
    Preview preview(body);
    std::string text;
    EventSink const before = setEventSink([&](Event const& event) {
        EXPECT_EQ(event["event"], "frame");
        for (Event const& op : event["draw"])
            text += op.dump() + '\n';
    });
    reportFrame(&preview, nullptr);
    setEventSink(before);
    return text;
}

TEST(Frames, TellLinesInTheirOrderAndMergeNothing) {
    TzGePoint3d const line[] = {{0, 0, 0}, {1, -0.0, 0}};
    EXPECT_EQ(frameOf([&](TzGiWorldDraw& draw) {
                  draw.geometry().polyline(2, line);
                  draw.subEntityTraits().setColor(253);
                  draw.subEntityTraits().setLineWeight(30);
                  draw.geometry().polyline(2, line);
                  draw.subEntityTraits().setTrueColor(TzCmEntityColor(1, 0xAB, 255));
                  draw.geometry().polygon(2, line);
                  draw.geometry().polyline(0, line);
              }),
              R"({"op":"polyline","points":[[0.0,0.0,0.0],[1.0,0.0,0.0]],"color":3,"lineWeight":0,)"
              R"("linetype":""})"
              "\n"
              R"({"op":"polyline","points":[[0.0,0.0,0.0],[1.0,0.0,0.0]],"color":253,)"
              R"("lineWeight":30,"linetype":""})"
              "\n"
              R"({"op":"polyline","points":[[0.0,0.0,0.0],[1.0,0.0,0.0],[0.0,0.0,0.0]],)"
              R"("color":"#01ABFF","lineWeight":30,"linetype":""})"
              "\n");
}

TEST(Frames, TellTextsAsTheyWereGiven) {
    TzGiTextStyle style;
    style.setTextSize(2.5);
    style.setVertical(true);
    EXPECT_EQ(
        frameOf([&](TzGiWorldDraw& draw) {
            draw.geometry().text({1, 2, 3}, {0, 0, 1}, {0, 2, 0}, L"\u00E4bc", 2, true, style);
        }),
        R"({"op":"text","string":"äb","position":[1.0,2.0,3.0],"normal":[0.0,0.0,1.0],)"
        R"("direction":[0.0,2.0,0.0],"size":2.5,"vertical":true,"color":3})"
        "\n");
}

TEST(Frames, NameEntitiesInsteadOfDrawingThem) {
    TzDbLine line;
    ASSERT_EQ(line.setStartPoint({1, 2, 0}), Tzad::eOk);
    ASSERT_EQ(line.setEndPoint({5, 2, 0}), Tzad::eOk);
    // Both ways in which a preview lets another entity draw, the second through a transform.
    EXPECT_EQ(frameOf([&](TzGiWorldDraw& draw) {
                  line.worldDraw(&draw);
                  draw.geometry().pushModelTransform(TzGeMatrix3d::translation({10, 0, 0}));
                  draw.geometry().draw(&line);
                  draw.geometry().popModelTransform();
              }),
              R"({"op":"entity","type":"LINE","position":[1.0,2.0,0.0]})"
              "\n"
              R"({"op":"entity","type":"LINE","position":[11.0,2.0,0.0]})"
              "\n");
    // The entity that is dragged itself shows its strokes.
    DrawPass pass(nullptr, DrawPass::Entities::whole);
    pass.draw(&line);
    ASSERT_EQ(pass.list().size(), 1U);
    EXPECT_TRUE(std::holds_alternative<DrawnLines>(pass.list()[0].what));
    // So does each entity of a plot.
    DrawPass strokes(nullptr, DrawPass::Entities::strokes);
    Preview preview([&](TzGiWorldDraw& draw) { draw.geometry().draw(&line); });
    strokes.draw(&preview);
    ASSERT_EQ(strokes.list().size(), 1U);
    EXPECT_TRUE(std::holds_alternative<DrawnLines>(strokes.list()[0].what));
}

TEST(Frames, LeaveOutWhatIsInvisible) {
    TzDbLine line;
    ASSERT_EQ(line.setVisibility(TzDb::kInvisible), Tzad::eOk);
    EXPECT_EQ(frameOf([&](TzGiWorldDraw& draw) { draw.geometry().draw(&line); }), "");
}

TEST(Passes, GiveTheTraitsBackAfterEachDrawable) {
    TzGePoint3d const line[] = {{0, 0, 0}, {1, 0, 0}};
    Preview inner([&](TzGiWorldDraw& draw) {
        draw.subEntityTraits().setColor(0);
        draw.geometry().polyline(2, line);
    });
    Preview outer([&](TzGiWorldDraw& draw) {
        draw.subEntityTraits().setColor(5);
        draw.geometry().draw(&inner);
        draw.geometry().polyline(2, line);
    });
    DrawPass pass(nullptr, DrawPass::Entities::strokes);
    pass.draw(&outer);
    ASSERT_EQ(pass.list().size(), 2U);
    // What is coloured as the block takes the colour of the drawable around it.
    EXPECT_EQ(pass.list()[0].pen.color.colorIndex(), 0);
    EXPECT_EQ(pass.list()[0].pen.blockColor.colorIndex(), 5);
    EXPECT_EQ(pass.list()[1].pen.color.colorIndex(), 5);
}

TEST(Passes, EndWhereDrawablesDrawEachOther) {
    TzGePoint3d const line[] = {{0, 0, 0}, {1, 0, 0}};
    TzDbEntity* self = nullptr;
    Preview endless([&](TzGiWorldDraw& draw) {
        draw.geometry().polyline(2, line);
        draw.geometry().draw(self);
    });
    self = &endless;
    DrawPass pass(nullptr, DrawPass::Entities::strokes);
    pass.draw(&endless);
    EXPECT_LE(pass.list().size(), 100U);
}

// Each drawable draws the next one twice, 2^22 in all. With a few levels more the pass would not
// end.
TEST(Passes, EndWhereDrawablesMultiply) {
    int level = 0;
    int drawn = 0;
    TzDbEntity* self = nullptr;
    Preview doubling([&](TzGiWorldDraw& draw) {
        ++drawn;
        if (++level < 22) {
            draw.geometry().draw(self);
            draw.geometry().draw(self);
        }
        --level;
    });
    self = &doubling;
    DrawPass pass(nullptr, DrawPass::Entities::strokes);
    pass.draw(&doubling);
    EXPECT_EQ(drawn, 1 + DrawPass::kMostNested);
    EXPECT_FALSE(pass.isWhole());
}

// Letters that no memory holds used to be laid out all the same.
TEST(Passes, EndWhereLettersAreTooMany) {
    std::wstring const letters(DrawPass::kMostLetters, L'a');
    Preview text([&](TzGiWorldDraw& draw) {
        for (wchar_t const* const each : {L"b", letters.c_str()})
            draw.geometry().text({}, TzGeVector3d::kZAxis, TzGeVector3d::kXAxis, each, -1, true,
                                 {});
    });
    DrawPass pass(nullptr, DrawPass::Entities::strokes);
    pass.draw(&text);
    EXPECT_FALSE(pass.isWhole());
    EXPECT_EQ(pass.takeList().size(), 1U);
}

TEST(Passes, CarryTextsThroughTransforms) {
    TzGiTextStyle style;
    style.setTextSize(2);
    Preview preview([&](TzGiWorldDraw& draw) {
        draw.geometry().pushModelTransform(TzGeMatrix3d::translation({100, 0, 0}));
        draw.geometry().pushModelTransform(
            TzGeMatrix3d().setCoordSystem({10, 0, 0}, {0, 3, 0}, {0, 0, 3}, {3, 0, 0}));
        draw.geometry().text({1, 0, 0}, {0, 0, 1}, {1, 0, 0}, L"a", -1, true, style);
        draw.geometry().popModelTransform();
        draw.geometry().popModelTransform();
        draw.geometry().popModelTransform();  // one too many does nothing
    });
    DrawPass pass(nullptr, DrawPass::Entities::strokes);
    pass.draw(&preview);
    ASSERT_EQ(pass.list().size(), 1U);
    auto const& text = std::get<DrawnText>(pass.list()[0].what);
    EXPECT_TRUE(text.position.isEqualTo({110, 3, 0}));
    EXPECT_TRUE(text.direction.isEqualTo({0, 1, 0}));
    EXPECT_TRUE(text.normal.isEqualTo({1, 0, 0}));
    EXPECT_NEAR(text.style.textSize(), 6.0, 1e-12);
}

}  // namespace
