// Drags: when a jig is sampled and drawn, and how a drag ends.

#include <gtest/gtest.h>

#include "host/base/fault_point.h"
#include "host/command_line/point_input.h"
#include "host/database/drawing.h"
#include "host/database/user_system.h"
#include "tests/command_line/scripted_session.h"
#include "tz/db/entity.h"
#include "tz/ed/jig.h"
#include "tz/ed/telemetry.h"
#include "tz/gi/draw.h"

namespace {

using tzhost::test::ScriptedSession;

std::string shown(TzGePoint3d const& point) {
    return TzString::formatted(L"(%.6g,%.6g,%.6g)", point.x + 0.0, point.y + 0.0, point.z + 0.0)
        .toUtf8();
}

// Notes what the host does with the jig: "s" for a sample with its point, "u" for an update, "d"
// for a redraw.
class NotingJig : public TzEdJig {
public:
    class Preview : public TzDbEntity {
    public:
        explicit Preview(std::string& notes) : notes_(notes) {}

    protected:
        bool subWorldDraw(TzGiWorldDraw*) override {
            notes_ += "d ";
            return true;
        }

    private:
        std::string& notes_;
    };

    DragStatus sampler() override {
        setUserInputControls(controls);
        if (keywords != nullptr) setKeywordList(keywords);
        TzGePoint3d point;
        DragStatus const status = base ? acquirePoint(point, *base) : acquirePoint(point);
        notes += "s" + (status == kNormal ? shown(point) : std::to_string(status)) + " ";
        if (status != kNormal) return status;
        if (last && last->isEqualTo(point)) return kNoChange;
        last = point;
        return answer;
    }
    bool update() override {
        notes += "u ";
        return updates;
    }
    [[nodiscard]] TzDbEntity* entity() const override { return &preview; }

    // The notes of one more drag, with its status at the end.
    std::string run() {
        notes.clear();
        DragStatus const status = drag();
        return notes + std::to_string(status);
    }

    std::string notes;
    UserInputControls controls{};
    wchar_t const* keywords = nullptr;
    std::optional<TzGePoint3d> base;
    std::optional<TzGePoint3d> last;
    DragStatus answer = kNormal;
    bool updates = true;
    mutable Preview preview{notes};
};

class Drags : public testing::Test {
protected:
    Drags() : drawing_(tzhost::Drawing::create()) { tzhost::setWorkingDrawing(drawing_.get()); }
    ~Drags() override {
        moveCursorHome();
        tzhost::setWorkingDrawing(nullptr);
    }

    static void moveCursorHome() {
        tzhost::setUserSystem({});
        ScriptedSession const session("~0,0\n");
        (void)NotingJig().drag();
    }

    std::unique_ptr<tzhost::Drawing> drawing_;
};

struct DragRow {
    char const* name;
    std::string_view script;
    int controls;
    std::string_view notes;
};

// The cursor stands at the origin; the keywords are "Width Height" and the last point 10,20,30.
constexpr DragRow kDrags[] = {
    {"PickElsewhere", "5,5", 0, "s(0,0,0) u d s(5,5,0) u d 0"},
    {"PickWhereItIs", "0,0", 0, "s(0,0,0) u d 0"},
    {"Moves", "~1,2\n~3,4\n3,4", 0, "s(0,0,0) u d s(1,2,0) u d s(3,4,0) u d 0"},
    {"MovesNowhere", "~1,2\n~1,2\n", 0, "s(0,0,0) u d s(1,2,0) u d s-6 -1"},
    {"Enter", "", 0x80, "s(0,0,0) u d -1"},
    {"Keyword", "h", 0, "s(0,0,0) u d 2"},
    {"Cancel", "~1,1\n^C", 0, "s(0,0,0) u d s(1,1,0) u d -4"},
    {"Refused", "x\n~y\n~\n", 0, "s(0,0,0) u d -1"},
    {"Relative", "@1,1", 0x80, "s(0,0,0) u d s(11,21,30) u d 0"},
    {"Flat", "1,2,3", 1, "s(0,0,0) u d s(1,2,0) u d 0"},
    {"InSpace", "1,2,3", 0x1080, "s(0,0,0) u d s(1,2,3) u d 0"},
};

class DragTable : public Drags, public testing::WithParamInterface<DragRow> {};
TEST_P(DragTable, SamplesAndDraws) {
    ScriptedSession const session(std::string(GetParam().script) + "\n");
    tzhost::setLastPoint({10, 20, 30});
    NotingJig jig;
    jig.controls = static_cast<TzEdJig::UserInputControls>(GetParam().controls);
    jig.keywords = L"Width Height";
    EXPECT_EQ(jig.run(), GetParam().notes);
}
INSTANTIATE_TEST_SUITE_P(Scripts, DragTable, testing::ValuesIn(kDrags), [](auto const& row) {
    return row.param.name;
});

TEST_F(Drags, GoOnWhereTheCursorStands) {
    ScriptedSession const session("5,5\n\n6,6\n");
    NotingJig jig;
    EXPECT_EQ(jig.run(), "s(0,0,0) u d s(5,5,0) u d 0");
    // The jig sees no change, and the first sample is drawn all the same.
    EXPECT_EQ(jig.run(), "s(5,5,0) d -1");
    ASSERT_TRUE(tzhost::setUserSystem({{0, 0, 7}, TzGeVector3d::kYAxis, -TzGeVector3d::kXAxis}));
    EXPECT_EQ(jig.run(), "s(5,5,0) d s(-6,6,7) u d 0");
    EXPECT_TRUE(tzhost::lastPoint().isEqualTo({6, 6, 0}));
}

// It used to go through world coordinates and back, which rounded it.
TEST_F(Drags, LeaveTheLastPointAsItWasTyped) {
    ScriptedSession const session("62.1,14.3\n");
    ASSERT_TRUE(tzhost::setUserSystem({{100000.3, 7.7, 0}, {0.8, 0.6, 0}, {-0.6, 0.8, 0}}));
    (void)NotingJig().drag();
    EXPECT_EQ(tzhost::lastPoint().x, 62.1);
    EXPECT_EQ(tzhost::lastPoint().y, 14.3);
}

TEST_F(Drags, EndWithWhatTheSamplerSays) {
    ScriptedSession const session("1,1\n2,2\n");
    NotingJig jig;
    jig.answer = TzEdJig::kOther;
    EXPECT_EQ(jig.run(), "s(0,0,0) -5");
    jig.answer = TzEdJig::kCancel;
    jig.last.reset();
    EXPECT_EQ(jig.run(), "s(0,0,0) -4");
    jig.answer = TzEdJig::kNormal;
    jig.updates = false;
    jig.last.reset();
    EXPECT_EQ(jig.run(), "s(0,0,0) u s(1,1,0) u 0");
}

TEST_F(Drags, KeepToTheAxesInOrthoMode) {
    ScriptedSession const session("7,3\n2,9\n2,9\n");
    (void)drawing_->setOrthomode(true);
    NotingJig jig;
    jig.controls = TzEdJig::kGovernedByOrthoMode;
    jig.base = TzGePoint3d(1, 1, 0);
    EXPECT_EQ(jig.run(), "s(0,1,0) u d s(7,1,0) u d 0");
    EXPECT_TRUE(tzhost::lastPoint().isEqualTo({7, 1, 0}));
    EXPECT_EQ(tzedGetJigInputData(jig).point, TzGePoint3d(7, 1, 0));
    jig.controls = {};
    EXPECT_EQ(jig.run(), "s(7,3,0) u d s(2,9,0) u d 0");
}

TEST_F(Drags, EndUnderEndlessFaults) {
    ScriptedSession const session("1,1\n");
    for (char const* const operation : {"TzEdJig::drag", "TzEdJig::acquirePoint"}) {
        static std::string_view failing;
        failing = operation;
        auto const before =
            tzhost::setFaultHook([](std::string_view name, int&) { return name == failing; });
        NotingJig jig;
        int rounds = 1;
        while (jig.drag() == TzEdJig::kOther && rounds < 1000)
            ++rounds;
        tzhost::setFaultHook(before);
        EXPECT_EQ(rounds, 100) << operation;
    }
    TzGePoint3d point;
    EXPECT_EQ(NotingJig().acquirePoint(point), TzEdJig::kOther);
}

TEST_F(Drags, TellEvents) {
    ScriptedSession const session("~1,2\nW\n");
    NotingJig jig;
    jig.keywords = L"Width";
    jig.controls = TzEdJig::kAccept3dCoordinates;
    jig.setDispPrompt(L"Corner: ");
    (void)jig.drag();
    TzTelemetryCmdHelper telemetry(7, L"MText");
    telemetry.set_start_point(tzedGetJigInputData(jig));
    telemetry.set_end_point({});
    telemetry.SendEvent(1, 128);
    EXPECT_EQ(session.events(),
              R"({"event":"prompt","kind":"drag","text":"Corner: ","keywords":"Width","flags":128}
{"event":"frame","draw":[]}
{"event":"frame","draw":[]}
{"event":"answer","line":"~1,2","status":0}
{"event":"answer","line":"W","status":1}
{"event":"telemetryPoint","component":7,"name":"MText","which":"start","point":[1.0,2.0,0.0]}
{"event":"telemetry","component":7,"name":"MText","phase":1,"value":128}
)");
    EXPECT_EQ(session.transcript(), L"Corner: ~1,2\nCorner: W");
}

}  // namespace
