// What the dragged text box tells when the drag has ended.

#include "module/mtext/rectangle_jig.h"

#include <gtest/gtest.h>

#include "host/faults/fault_plan.h"
#include "module/prompt/jig_input.h"
#include "tests/mtext/held_text.h"

namespace {

TEST(RectangleJig, GivesItsSizeAndLeavesOrthoModeAsItWas) {
    OpenDrawing const drawing("~3,4\n-20,10\n");
    EXPECT_EQ(tzhost::workingDrawing()->setOrthomode(true), Tzad::eOk);
    CTzsMtextJig jig(TzGePoint3d::kOrigin);
    jig.SetAttachment(0);
    CKeywordTable none;
    CTzsJigInput input(TzEdJig::kGovernedByOrthoMode, none, &jig, TzString(L"Corner"));
    EXPECT_EQ(input.Prompt(), statusNormal);
    EXPECT_TRUE(tzhost::workingDrawing()->orthomode());
    EXPECT_DOUBLE_EQ(jig.Width(), 20);
    EXPECT_DOUBLE_EQ(jig.Height(), 10);
    TzGePoint3d corner;
    jig.GetJigAttachPoint(corner);
    EXPECT_TRUE(corner.isEqualTo({-20, 10, 0}));
    // Without an attachment there are sides, but neither top nor bottom.
    EXPECT_EQ(drawing.events().find("\"points\":[[-20.0,10.0,0.0],[0.0,10.0,0.0]]"),
              std::string::npos);
}

// Each sample turns the mode off and on again, so there is a call of either kind to fail. It used
// to stay off when the second one did.
TEST(RectangleJig, LeavesOrthoModeOnWhenAnyOfItsCallsFails) {
    for (char const* call : {"1", "2", "3", "4", "*"}) {
        OpenDrawing const drawing("~3,4\n-20,10\n");
        (void)tzhost::workingDrawing()->setOrthomode(true);
        CTzsMtextJig jig(TzGePoint3d::kOrigin);
        CKeywordTable none;
        CTzsJigInput input(TzEdJig::kGovernedByOrthoMode, none, &jig, TzString(L"Corner"));
        tzhost::FaultPlan plan;
        ASSERT_FALSE(plan.add(std::string("TzDbDatabase::setOrthomode:") + call).has_value());
        plan.install();
        EXPECT_EQ(input.Prompt(), statusNormal) << call;
        EXPECT_TRUE(plan.hasStruck()) << call;
        plan.remove();
        EXPECT_TRUE(tzhost::workingDrawing()->orthomode()) << call;
        EXPECT_DOUBLE_EQ(jig.Width(), 20) << call;
    }
}

}  // namespace
