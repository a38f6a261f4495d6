// Dragged questions: what a drag's end becomes, and what the preview gets to do.

#include <gtest/gtest.h>

#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "module/prompt/jig_input.h"
#include "tests/command_line/scripted_session.h"
#include "tests/prompt/texts.h"
#include "tz/gi/draw.h"

namespace {

using tzhost::test::ScriptedSession;

// Follows the cursor and notes what the host does with it.
class Preview : public CTzsJigEntity {
public:
    TzEdJig::DragStatus OnSample(TzEdJig& jig) override {
        controls = jig.userInputControls();
        keywords = jig.keywordList() ? jig.keywordList() : L"";
        return jig.acquirePoint(cursor);
    }
    bool OnUpdate(TzEdJig& jig) override {
        ++updates;
        return CTzsJigEntity::OnUpdate(jig);
    }
    TzEdJig::DragStatus baseSample(TzEdJig& jig) { return CTzsJigEntity::OnSample(jig); }

    TzGePoint3d cursor;
    int updates = 0;
    int controls = 0;
    TzString keywords;

protected:
    bool subWorldDraw(TzGiWorldDraw*) override { return true; }
};

constexpr unsigned int kIds[] = {kManyWords, kWithComma, kTranslated};
constexpr auto kControls = static_cast<TzEdJig::UserInputControls>(TzEdJig::kGovernedByUCSDetect |
                                                                   TzEdJig::kAccept3dCoordinates);

class Drags : public testing::Test {
protected:
    Drags() { tzhost::setWorkingDrawing(drawing_.get()); }
    ~Drags() override {
        tzhost::setFaultHook(nullptr);
        tzhost::setWorkingDrawing(nullptr);
    }
    std::unique_ptr<tzhost::Drawing> drawing_ = tzhost::Drawing::create();
};

int dragResult = 0;
bool endDrag(std::string_view operation, int& status) {
    status = dragResult;
    return operation == "TzEdJig::drag";
}

struct EndRow {
    int dragged;
    int status;
    unsigned int keyword;
};
constexpr EndRow kEnds[] = {
    {0, statusNormal, 0},  {1, statusKeyword, kManyWords}, {3, statusKeyword, kTranslated},
    {4, statusKeyword, 0}, {30, statusKeyword, 0},         {31, statusError, 0},
    {-1, statusNone, 0},   {-4, statusCancel, 0},          {-5, statusError, 0},
    {-6, statusError, 0},
};
TEST_F(Drags, EndInAStatus) {
    ScriptedSession const session("");
    Preview preview;
    CKeywordTable table(kIds, 3);
    CTzsJigInput input(kControls, table, &preview, L"Drag");
    tzhost::setFaultHook(endDrag);
    for (EndRow const& row : kEnds) {
        dragResult = row.dragged;
        EXPECT_EQ(input.Prompt(), row.status) << row.dragged;
        EXPECT_EQ(input.GetKeyword(), row.keyword) << row.dragged;
    }
}

TEST_F(Drags, LetThePreviewFollowTheCursor) {
    ScriptedSession const session("~1,2\n~1,2\nhöhe\n3,4\n");
    Preview preview;
    CKeywordTable table(kIds, 3);
    CTzsJigInput input(kControls, table, &preview, L"Drag");
    EXPECT_EQ(input.Prompt(), statusKeyword);
    EXPECT_EQ(input.GetKeyword(), kTranslated);
    EXPECT_EQ(preview.cursor, TzGePoint3d(1, 2, 0));
    EXPECT_EQ(preview.controls, kControls);
    EXPECT_EQ(preview.keywords, L"Abc Twowords,Alias Höhe _Gh Twowords Height");
    EXPECT_EQ(input.Prompt(), statusNormal);
    EXPECT_EQ(input.GetKeyword(), 0U);
    EXPECT_EQ(preview.cursor, TzGePoint3d(3, 4, 0));
    EXPECT_GT(preview.updates, 1);
    EXPECT_TRUE(input.getInputData().hasPoint);
    EXPECT_EQ(session.transcript().substr(0, 40), L"Drag [A = (b c)/Two words/Höhe]: ~1,2\nDr");
}

TEST_F(Drags, WithoutKeywordsAndOnThePaperOfTheirOwn) {
    ScriptedSession const session("\n");
    Preview preview;
    CKeywordTable none;
    CTzsJigInput input(kControls, none, &preview, L"Drag");
    EXPECT_EQ(preview.layerId(), drawing_->clayer());
    CTzsJigHandler handler(&preview, kControls);
    EXPECT_EQ(preview.baseSample(handler), TzEdJig::kNoChange);
    EXPECT_EQ(input.Prompt(), statusNone);
    EXPECT_EQ(preview.keywords, L"");
}

}  // namespace
