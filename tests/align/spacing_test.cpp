// Where the spacing options put texts along a line. The gaps are measured on the moved boxes.

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>
#include <memory>
#include <numbers>
#include <random>
#include <string>

#include "module/align/spacing/alignment_pass.h"
#include "module/align/spacing/current_spacing.h"
#include "module/align/spacing/even_spacing.h"
#include "module/align/spacing/options_factory.h"
#include "module/align/spacing/text_planes.h"
#include "tests/align/flat_box.h"
#include "tests/align/given_text.h"
#include "tests/mtext/held_text.h"

namespace {

using tztest::FlatBox;
using tztest::GivenText;
using tztest::placed;

using Texts = std::vector<std::unique_ptr<GivenText>>;

TzMTextAlignOption::Entities entitiesOf(Texts const& texts) {
    TzMTextAlignOption::Entities entities;
    for (auto const& text : texts)
        entities.push_back(text.get());
    return entities;
}

FlatBox boxOf(TzMTextAlignManipulatorEntity const& text) {
    FlatBox box;
    text.boundingBox().getMinMaxPoints(box.low, box.high);
    return box;
}

// Texts of unequal sizes, the last one behind the first point of every line.
Texts unequalTexts(TzGeMatrix3d const& system, tagTextDirection justification) {
    Texts texts;
    texts.push_back(std::make_unique<GivenText>(TzGePoint2d(3, 1), TzGePoint2d(7, 2), system));
    texts.push_back(std::make_unique<GivenText>(TzGePoint2d(-9, 4), TzGePoint2d(-3, 9), system));
    texts.push_back(std::make_unique<GivenText>(TzGePoint2d(11, -8), TzGePoint2d(12, -1), system));
    texts.push_back(
        std::make_unique<GivenText>(TzGePoint2d(-40, -40), TzGePoint2d(-32, -38), system));
    for (auto const& text : texts)
        text->prepareForDragging(justification);
    return texts;
}

struct Line {
    char const* name;
    double x;
    double y;
};
constexpr Line kLines[] = {
    {"Right", 60, 0},       {"Left", -60, 0},         {"Up", 0, 60},
    {"Down", 0, -60},       {"UpRight", 40, 40},      {"UpLeft", -40, 30},
    {"DownLeft", -30, -50}, {"DownRight", 50, -20},   {"Flat", 60, 0.01},
    {"Steep", -0.01, -60},  {"AlmostFlat", 60, 1e-9}, {"Short", 2, 1},
};
TzGeMatrix3d const kSystems[] = {
    TzGeMatrix3d(),
    placed({5, -3, 8}, {0.6, 0, 0.8}, {0, 1, 0}),
};

// What one option does to the unequal texts on one line; coordinates of the working plane.
class Moved {
public:
    Moved(TzMTextAlignOption& option,
          TzGeMatrix3d const& system,
          tagTextDirection justification,
          Line const& line)
        : texts_(unequalTexts(system, justification)), along_(line.x, line.y, 0) {
        TzGeLineSeg3d const baseline(system * kFirst, system * (kFirst + along_));
        auto const entities = entitiesOf(texts_);
        TzMTextAlignManipulatorGut pass(entities, nullptr, &option, baseline, system);
        pass.sortEntities(entities);
        order_ = pass.sortedIndices();
        offsets_ = option.createOffsetFor(entities, order_, baseline, system);
        for (TzGeVector3d& offset : offsets_)
            offset.transformBy(system.inverse());
        along_.normalize();
    }

    [[nodiscard]] std::size_t count() const { return order_.size(); }
    [[nodiscard]] TzGeVector3d offset(std::size_t i) const { return offsets_[i]; }
    [[nodiscard]] TzGePoint3d moved(std::size_t i) const {
        return text(i).referencePoint() + offsets_[i];
    }
    [[nodiscard]] double offLine(std::size_t i) const {
        return (moved(i) - kFirst).crossProduct(along_).length();
    }
    // Between the boxes at i and i + 1, along the line.
    [[nodiscard]] double gap(std::size_t i) const {
        double const distance = along_.dotProduct(moved(i + 1) - moved(i));
        return distance - tztest::touchingDistance(atOrigin(i), atOrigin(i + 1), along_);
    }

    static constexpr TzGePoint3d kFirst{2, 3, 0};

private:
    [[nodiscard]] GivenText const& text(std::size_t i) const { return *texts_[order_[i]]; }
    [[nodiscard]] FlatBox atOrigin(std::size_t i) const {
        return boxOf(text(i)).by(-text(i).referencePoint().asVector());
    }

    Texts texts_;
    TzGeVector3d along_;
    TzMTextAlignOption::Indices order_;
    TzMTextAlignOption::Offsets offsets_;
};

// Calls `check` for each justification, line and system.
template <class Check>
void everywhere(TzMTextAlignOption& option, Check const& check) {
    for (TzGeMatrix3d const& system : kSystems) {
        for (Line const& line : kLines) {
            for (int justification = 0; justification < 12; ++justification) {
                SCOPED_TRACE(line.name + (" " + std::to_string(justification)));
                Moved const run(option, system, static_cast<tagTextDirection>(justification), line);
                for (std::size_t i = 0; i < run.count(); ++i)
                    EXPECT_NEAR(run.offLine(i), 0, 1e-9);
                check(run, line);
            }
        }
    }
}

TEST(Spacing, DistributeEndsOnTheSecondPointWithEqualGaps) {
    TzMTextAlignOptionDistribute option;
    everywhere(option, [](Moved const& run, Line const& line) {
        EXPECT_TRUE(run.moved(0).isEqualTo(Moved::kFirst, TzGeTol(1e-9)));
        EXPECT_TRUE(
            run.moved(3).isEqualTo(Moved::kFirst + TzGeVector3d(line.x, line.y, 0), TzGeTol(1e-7)));
        EXPECT_NEAR(run.gap(1), run.gap(0), 1e-6);
        EXPECT_NEAR(run.gap(2), run.gap(0), 1e-6);
        EXPECT_EQ(run.gap(0) < 0, std::string(line.name) == "Short");
    });
}

TEST(Spacing, SetKeepsItsGapWhateverTheLength) {
    OpenDrawing const drawing;
    (void)tzhost::Variables::instance().set(L"TEXTALIGNSPACINGVALUE", 1.75, tzhost::Writer::module);
    TzMTextAlignOptionSpecificSpace option;
    option.loadDefaultSettings();
    everywhere(option, [](Moved const& run, Line const&) {
        EXPECT_TRUE(run.moved(0).isEqualTo(Moved::kFirst, TzGeTol(1e-9)));
        for (std::size_t i = 0; i < 3; ++i)
            EXPECT_NEAR(run.gap(i), 1.75, 1e-6);
    });
}

// Texts slide along one axis alone; a line within a degree of it moves nothing.
template <class Option>
void expectSlides(double TzGeVector3d::*kept, double TzGeVector3d::*slid) {
    Option option;
    for (Line const& line : kLines) {
        SCOPED_TRACE(line.name);
        TzGeVector3d const along(line.x, line.y, 0);
        bool const tooClose =
            std::abs(along.*kept) < std::abs(along.*slid) * std::tan(std::numbers::pi / 180);
        Moved const run(option, kSystems[1], tagTextDirection::MR, line);
        EXPECT_EQ(option.hasError(), tooClose);
        for (std::size_t i = 0; i < run.count(); ++i) {
            EXPECT_NEAR(run.offset(i).*kept, 0, 1e-9);
            EXPECT_NEAR(run.offset(i).z, 0, 1e-9);
            if (tooClose)
                EXPECT_EQ(run.offset(i).*slid, 0);
            else
                EXPECT_NEAR(run.offLine(i), 0, 1e-9);
        }
    }
    option.initialize();
    EXPECT_FALSE(option.hasError());
}
TEST(Spacing, HorizontalSlidesUpAndDown) {
    expectSlides<TzMTextAlignOptionCurrentSpaceHorizontal>(&TzGeVector3d::x, &TzGeVector3d::y);
}
TEST(Spacing, VerticalSlidesSideways) {
    expectSlides<TzMTextAlignOptionCurrentSpaceVertical>(&TzGeVector3d::y, &TzGeVector3d::x);
}

// Degrees from the axis of sliding.
struct ThresholdRow {
    double degrees;
    bool error;
};
constexpr ThresholdRow kThresholds[] = {{0, true},          {0.99999, true},   {1.00001, false},
                                        {178.99999, false}, {179.00001, true}, {180, true}};
TEST(Spacing, NeedsOneDegree) {
    TzMTextAlignOptionCurrentSpaceHorizontal option;
    for (ThresholdRow const& row : kThresholds) {
        double const angle = row.degrees * std::numbers::pi / 180;
        Moved const run(option, kSystems[0], tagTextDirection::TL,
                        {"", std::sin(angle), std::cos(angle)});
        EXPECT_EQ(option.hasError(), row.error) << row.degrees;
    }
    // Long lines at one degree, whose ends are rounded.
    double const degree = std::numbers::pi / 180;
    for (double const length : {1.0, 10.0, 50.0, 57.29, 100.0, 1000.0}) {
        Moved const run(option, kSystems[0], tagTextDirection::TL,
                        {"", length * std::sin(degree), length * std::cos(degree)});
        EXPECT_FALSE(option.hasError()) << length;
    }
}

// The text that the others follow stands at 4,4; two more with one parameter keep their order.
TEST(Order, IsThatAlongTheLine) {
    Texts texts;
    for (TzGePoint2d const& at :
         {TzGePoint2d(5, 9), TzGePoint2d(-2, 0), TzGePoint2d(5, -9), TzGePoint2d(1, 1)})
        texts.push_back(std::make_unique<GivenText>(at, at + TzGeVector2d(1, 1)));
    for (auto const& text : texts)
        text->prepareForDragging(tagTextDirection::BL);
    auto const entities = entitiesOf(texts);
    auto const orderOn = [&](TzGePoint3d const& second) {
        TzMTextAlignManipulatorGut pass(entities, nullptr, nullptr, {{0, 0, 0}, second}, {});
        pass.sortEntities(entities);
        std::string order;
        for (unsigned long const index : pass.sortedIndices())
            order += std::to_string(index);
        return order;
    };
    EXPECT_EQ(orderOn({1, 0, 0}), "1302");
    EXPECT_EQ(orderOn({-9, 0, 0}), "0231");
    EXPECT_EQ(orderOn({0, 1, 0}), "2130");
    EXPECT_EQ(orderOn({0, 0, 0}), "0123");  // no direction: all feet are the first point
    // Sums that overflow have no order and end last, without harm.
    EXPECT_EQ(
        orderOn({std::numeric_limits<double>::max(), std::numeric_limits<double>::max(), 0}).size(),
        4U);
}

struct Question {
    char const* script;
    bool done;
    double after;
};
TEST(Spacing, SetAsksForItsGap) {
    for (Question const& row : {Question{"2.5\n", true, 2.5},
                                {"\n", true, 1.5},
                                {"^C\n", false, 1.5},
                                {"-1\n", true, -1},
                                {"0,0\n3,4\n", true, 5}}) {
        OpenDrawing const drawing(row.script);
        (void)tzhost::Variables::instance().set(L"TEXTALIGNSPACINGVALUE", 1.5,
                                                tzhost::Writer::module);
        TzMTextAlignOptionSpecificSpace option;
        option.loadDefaultSettings();
        EXPECT_EQ(option.doSomething(), row.done) << row.script;
        option.saveAsDefaultSettings();
        EXPECT_EQ(tzhost::Variables::instance().number(L"TEXTALIGNSPACINGVALUE"), row.after)
            << row.script;
    }
}

// Planes by their height, in units of the tolerance. The third text lies as close to the first
// plane as to the second, and counts for both; the fourth brings the second ahead.
TEST(Planes, CountATextForEachThatIsTheSame) {
    TextPlanes planes;
    EXPECT_TRUE(planes.majority().empty());
    std::uintptr_t number = 0;
    for (double const height : {0.0, 1.6, 0.8, 2.4, 9.0}) {
        TzDbObjectId const id(reinterpret_cast<TzDbObjectRecord*>(++number));
        planes.insert({{0, 0, height * TzGeContext::gTol.equalPoint()}, TzGeVector3d::kZAxis}, id);
    }
    std::string ids;
    for (TzDbObjectId const& id : planes.majority())
        ids += std::to_string(reinterpret_cast<std::uintptr_t>(id.record()));
    EXPECT_EQ(ids, "234");
}

TEST(Factory, FindsTheNewestByItsExactName) {
    TzMTextAlignOptionsFactory factory;
    EXPECT_EQ(factory.getAlignOption(L"Distribute"), nullptr);
    auto* const first = new TzMTextAlignOptionDistribute;
    auto* const second = new TzMTextAlignOptionDistribute;
    factory.registerAlignOption(first);
    factory.registerAlignOption(second);
    EXPECT_EQ(factory.getAlignOption(L"Distribute"), second);
    EXPECT_EQ(factory.getAlignOption(L"distribute"), nullptr);
    factory.unregisterAlignOption(L"Distribute");
    EXPECT_EQ(factory.getAlignOption(L"Distribute"), first);
    factory.unregisterAlignOption(L"SpecificSpace");
    EXPECT_EQ(factory.findOptionIndexWith(L"Distribute"), 1U);
}

}  // namespace
