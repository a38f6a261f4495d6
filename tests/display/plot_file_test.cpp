#include "host/display/plot.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <string>

#include "host/database/drawing.h"
#include "host/files/file_bytes.h"
#include "host/page/page_text.h"
#include "host/settings/variables.h"
#include "tests/display/picture.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"

namespace {

using namespace tzhost;

constexpr int kRed = 0xFF0000;
constexpr int kBlue = 0x0000FF;

// A drawing of a red layer's line in model space, a blue circle on the paper, and something
// invisible in both.
class PlotFiles : public testing::Test {
protected:
    void SetUp() override {
        Variables::instance().resetKept(KeptIn::drawing);
        drawing_ = Drawing::create();
        setWorkingDrawing(drawing_.get());
        auto line = std::make_unique<TzDbLine>();
        ASSERT_EQ(line->setEndPoint({10, 10, 0}), Tzad::eOk);
        ASSERT_EQ(line->setLayer(redLayer()), Tzad::eOk);
        post(std::move(line), kModelSpaceName);
        auto circle = std::make_unique<TzDbCircle>();
        ASSERT_EQ(circle->setRadius(5), Tzad::eOk);
        ASSERT_EQ(circle->setColorIndex(5), Tzad::eOk);
        post(std::move(circle), kPaperSpaceName);
        for (wchar_t const* const space : {kModelSpaceName, kPaperSpaceName}) {
            auto hidden = std::make_unique<TzDbCircle>();
            ASSERT_EQ(hidden->setRadius(1000), Tzad::eOk);
            ASSERT_EQ(hidden->setVisibility(TzDb::kInvisible), Tzad::eOk);
            post(std::move(hidden), space);
        }
    }
    void TearDown() override {
        setWorkingDrawing(nullptr);
        Variables::instance().resetKept(KeptIn::drawing);
    }

    TzDbObjectId redLayer() {
        TzDbLayerTable* table = nullptr;
        EXPECT_EQ(drawing_->getLayerTable(table, TzDb::kForWrite), Tzad::eOk);
        auto* const layer = new TzDbLayerTableRecord;
        EXPECT_EQ(layer->setName(L"Red"), Tzad::eOk);
        EXPECT_EQ(layer->setColor(TzCmEntityColor::fromIndex(1)), Tzad::eOk);
        TzDbObjectId id;
        EXPECT_EQ(table->addRecord(layer, id), Tzad::eOk);
        EXPECT_EQ(layer->close(), Tzad::eOk);
        EXPECT_EQ(table->close(), Tzad::eOk);
        return id;
    }

    TzDbObjectId addBlock(std::wstring const& name) {
        TzDbBlockTable* table = nullptr;
        EXPECT_EQ(drawing_->getBlockTable(table, TzDb::kForWrite), Tzad::eOk);
        auto* const block = new TzDbBlockTableRecord;
        EXPECT_EQ(block->setName(name.c_str()), Tzad::eOk);
        TzDbObjectId id;
        EXPECT_EQ(table->addRecord(block, id), Tzad::eOk);
        EXPECT_EQ(block->close(), Tzad::eOk);
        EXPECT_EQ(table->close(), Tzad::eOk);
        return id;
    }

    void post(std::unique_ptr<TzDbEntity> entity, wchar_t const* space) {
        TzDbBlockTable* table = nullptr;
        ASSERT_EQ(drawing_->getBlockTable(table, TzDb::kForRead), Tzad::eOk);
        TzDbBlockTableRecord* record = nullptr;
        ASSERT_EQ(table->getAt(space, record, TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(table->close(), Tzad::eOk);
        TzDbObjectId id;
        TzDbEntity* const posted = entity.release();
        ASSERT_EQ(record->appendTzDbEntity(id, posted), Tzad::eOk);
        EXPECT_EQ(posted->close(), Tzad::eOk);
        EXPECT_EQ(record->close(), Tzad::eOk);
    }

    [[nodiscard]] Picture plotted() const {
        std::string const file = "plot.png";
        EXPECT_EQ(plotDrawing(*drawing_, {PlotFormat::png, file, {}}).problem, std::nullopt);
        return Picture(readFile(file).value_or(""));
    }

    std::unique_ptr<Drawing> drawing_;
};

TEST_F(PlotFiles, ShowTheActiveSpace) {
    EXPECT_GT(plotted().countShades(kRed), 500);
    EXPECT_EQ(plotted().countShades(kBlue), 0);
    ASSERT_TRUE(Variables::instance().setFromText(L"TILEMODE", L"0", Writer::host).isDone());
    ASSERT_TRUE(Variables::instance().setFromText(L"CVPORT", L"1", Writer::host).isDone());
    EXPECT_EQ(plotted().countShades(kRed), 0);
    EXPECT_GT(plotted().countShades(kBlue), 500);
}

TEST_F(PlotFiles, OpenNothing) {
    // An object that a command holds open for write is plotted all the same.
    TzDbBlockTable* table = nullptr;
    ASSERT_EQ(drawing_->getBlockTable(table, TzDb::kForWrite), Tzad::eOk);
    EXPECT_GT(plotted().countShades(kRed), 500);
    EXPECT_EQ(table->close(), Tzad::eOk);
}

TEST_F(PlotFiles, ShowTextsOnTheirBackground) {
    auto text = std::make_unique<TzDbMText>();
    ASSERT_EQ(text->setContents(L"\\C5;Blue \\C256;text"), Tzad::eOk);
    ASSERT_EQ(text->setTextHeight(3), Tzad::eOk);
    ASSERT_EQ(text->setBackgroundFill(true), Tzad::eOk);
    ASSERT_EQ(text->setBackgroundFillColor(TzCmEntityColor::fromIndex(2)), Tzad::eOk);
    post(std::move(text), kModelSpaceName);
    Picture const picture = plotted();
    EXPECT_GT(picture.count(kBlue), 500);
    EXPECT_GT(picture.count(0x000000), 500);
    EXPECT_GT(picture.count(0xFFFF00), 20000);
}

TEST_F(PlotFiles, RefuseBlocksThatStandForTooMuch) {
    constexpr int kLevels = 22;
    std::wstring inner = L"B0";
    TzDbObjectId block = addBlock(inner);
    for (int level = 1; level <= kLevels; ++level) {
        std::wstring const outer =
            level < kLevels ? L"B" + std::to_wstring(level) : kModelSpaceName;
        TzDbObjectId const next = level < kLevels ? addBlock(outer) : block;
        for (int i = 0; i < 2; ++i) {
            auto reference = std::make_unique<TzDbBlockReference>();
            ASSERT_EQ(reference->setBlockTableRecord(block), Tzad::eOk);
            post(std::move(reference), outer.c_str());
        }
        block = next;
    }
    std::string const file = "doubled.svg";
    EXPECT_EQ(plotDrawing(*drawing_, {PlotFormat::svg, file, {}}).problem,
              "doubled.svg: its blocks stand for too much to plot");
    EXPECT_FALSE(std::filesystem::exists(file));
}

// Ten pixels to a millimetre, a millimetre for each 0.1 unit: the line runs from corner to corner
// of the middle 100 millimetres.
TEST_F(PlotFiles, LieOnTheirPaper) {
    PlotOrder order{PlotFormat::png, "paper.png", {}};
    order.page = {readPaper("120x120"), {}, {}, {}, PageUnit::centimetre, {}, 254.0};
    order.page.scale = makeScale(1, 1);
    PlotReport const whole = plotDrawing(*drawing_, order);
    EXPECT_EQ(whole.problem, std::nullopt);
    EXPECT_EQ(whole.remarks, std::vector<std::string>());
    Picture const picture(readFile("paper.png").value_or(""));
    EXPECT_EQ(picture.width(), 1200);
    EXPECT_EQ(picture.at(101, 1098), 0xFF0000U);
    EXPECT_EQ(picture.at(1098, 101), 0xFF0000U);
    EXPECT_EQ(picture.at(97, 1102), 0xFFFFFFU);
    // A hundred pages wide, the page shows its middle and no more than the margins let through.
    order.page.scale = makeScale(100, 1);
    PlotReport const cut = plotDrawing(*drawing_, order);
    EXPECT_EQ(cut.remarks,
              std::vector<std::string>{"paper.png: what lies outside the page is left out"});
    Picture const part(readFile("paper.png").value_or(""));
    EXPECT_EQ(part.at(600, 599), 0xFF0000U);
    EXPECT_EQ(part.at(110, 1089), 0xFF0000U);
    EXPECT_EQ(part.at(90, 1109), 0xFFFFFFU);
}

TEST_F(PlotFiles, OfAllSpacesHaveAPageForEach) {
    PlotOrder order{PlotFormat::pdf, "all.pdf", {}};
    order.space = PlotSpace::all;
    EXPECT_EQ(plotDrawing(*drawing_, order).problem, std::nullopt);
    EXPECT_NE(readFile("all.pdf").value_or("").find("/Count 2"), std::string::npos);
    order.format = PlotFormat::png;
    EXPECT_EQ(plotDrawing(*drawing_, order).problem,
              "all.pdf: only a PDF has a page for each space");
}

TEST_F(PlotFiles, SayWhatWentWrong) {
    std::string const file = "missing/plan.svg";
    auto const fault = plotDrawing(*drawing_, {PlotFormat::svg, file, {}}).problem;
    EXPECT_EQ(fault, "missing/plan.svg: cannot be written: No such file or directory");
    EXPECT_FALSE(std::filesystem::exists("missing"));
}

}  // namespace
