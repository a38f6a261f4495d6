// Characters of stacks, the numbers that name attachments, and the check of format versions.

#include <gtest/gtest.h>

#include "host/platform/output.h"
#include "module/edit/mtext_versioner.h"
#include "module/texts/attachment_ids.h"
#include "module/uncalled/align_direction.h"
#include "module/uncalled/flow_direction.h"
#include "tz/mte/globals.h"

namespace {

// Searched as a terminated text, the stack characters run on into the file's name.
TEST(ExportedVariables, StackCharactersRunOnIntoTheFileName) {
    EXPECT_STREQ(g_pszStackChars, L"/#^TzmtedRes.dll");
}

TEST(AttachmentKeywords, NameEachPointAndNothingElse) {
    for (int point = 1; point <= 9; ++point) {
        auto const attachment = static_cast<TzDbMText::AttachmentPoint>(point);
        EXPECT_EQ(MapAttachmentToIDS(attachment), 1047U + static_cast<unsigned>(point));
        EXPECT_EQ(MapAttachment(MapAttachmentToIDS(attachment)), attachment);
    }
    for (unsigned int id : {0U, 1047U, 1057U, ~0U})
        EXPECT_EQ(MapAttachment(id), TzDbMText::kTopLeft) << id;
    for (int point : {0, 10, -1})
        EXPECT_EQ(MapAttachmentToIDS(static_cast<TzDbMText::AttachmentPoint>(point)), 1048U)
            << point;
    EXPECT_EQ(MapDirection(1058), TzDbMText::kTtoB);
    EXPECT_EQ(MapDirection(1057), TzDbMText::kLtoR);
    TzGeBoundBlock3d const box({1, 2, 3}, {4, 5, 6});
    EXPECT_TRUE(TzMTextAlignDirection::referencePoint(box).isEqualTo({0, 0, 0}));
    EXPECT_EQ(TzMTextAlignDirection::distanceBetweenReferencePoints(), 0.0);
}

struct BoxNotes : tzhost::NotificationSink {
    void notify(tzhost::Notification const& notification) override {
        boxes.push_back(notification);
    }
    std::vector<tzhost::Notification> boxes;
};

TEST(Versioner, RefusesNewerFormatsWithOneMessage) {
    struct Row {
        wchar_t const* contents;
        bool tooNew;
    };
    BoxNotes notes;
    auto* const before = tzhost::setNotificationSink(&notes);
    for (Row const& row : {Row{L"", false},
                           {L"plain", false},
                           {L"\\?3;text", false},
                           {L"\\?4;text", true},
                           {L"\\?12;", true},
                           {L"\\?;text", true},
                           {L"\\?x;text", false},
                           {L"text \\?9;", false}}) {
        notes.boxes.clear();
        EXPECT_EQ(MTextVersioner(nullptr).too_new(row.contents), row.tooNew) << row.contents;
        ASSERT_EQ(notes.boxes.size(), row.tooNew ? 1U : 0U);
        if (!row.tooNew) continue;
        EXPECT_EQ(notes.boxes[0].text, L"too new");
        EXPECT_EQ(notes.boxes[0].style, 16U);
    }
    tzhost::setNotificationSink(before);
}

}  // namespace
