// The second half of the dialogue of MTEXT: the opposite corner, with every option as a keyword.

#include <array>

#include "module/geometry/points.h"
#include "module/mtext/column_outcome.h"
#include "module/mtext/rectangle_jig.h"
#include "module/prompt/asking.h"
#include "module/prompt/jig_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/attachment_ids.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

constexpr auto kControls = TzEdJig::kGovernedByOrthoMode;

// What follows an option.
enum class Next { cancelled, askAgain, finished };

// The question in progress.
struct SecondCorner {
    TzxMtextCommand& command;
    CTzsMtextJig& jig;
};

Next askHeight(SecondCorner& at) {
    if (!at.command.DoHeightPrompt(true)) return Next::cancelled;
    at.jig.SetTextSize(at.command.textHeight);
    at.command.ResetLineSpacing();
    return Next::askAgain;
}

Next askAttachment(SecondCorner& at) {
    if (!at.command.DoAttachPrompt()) return Next::cancelled;
    at.jig.SetAttachment(MapAttachment(at.command.attachmentId));
    return Next::askAgain;
}

Next askLineSpacing(SecondCorner& at) {
    if (!at.command.DoLineSpacingPrompts()) return Next::cancelled;
    return Next::askAgain;
}

Next askRotation(SecondCorner& at) {
    if (!at.command.DoRotatePrompt()) return Next::cancelled;
    at.jig.SetRotation(at.command.rotation);
    return Next::askAgain;
}

// The preview keeps the height that it has.
Next askStyle(SecondCorner& at) {
    if (!at.command.DoStylePrompt()) return Next::cancelled;
    at.command.ComputeTextSize();
    at.command.ResetLineSpacing();
    return Next::askAgain;
}

Next askWidth(SecondCorner& at) {
    if (!at.command.DoWidth()) return Next::cancelled;
    at.command.columns.columnType = TzDbMText::kNoColumns;
    return Next::finished;
}

Next askColumns(SecondCorner& at) {
    switch (at.command.DoColumnPrompt()) {
    case kColumnsCancelled: return Next::cancelled;
    case kColumnsNone: return Next::askAgain;
    default: return Next::finished;
    }
}

// The keywords in the order of the prompt. Columns, the last, are not offered for an attribute.
struct Option {
    unsigned keyword;
    Next (*ask)(SecondCorner&);
};
constexpr std::array<Option, 7> kOptions{{
    {kText.height, askHeight},
    {kText.justify, askAttachment},
    {kText.lineSpacing, askLineSpacing},
    {kText.rotation, askRotation},
    {kText.style, askStyle},
    {kText.width, askWidth},
    {kText.columns, askColumns},
}};

Next askOption(unsigned keyword, SecondCorner& at) {
    for (Option const& option : kOptions) {
        if (option.keyword == keyword) return option.ask(at);
    }
    return Next::askAgain;
}

void takeBox(SecondCorner& at) {
    at.command.boxWidth = at.jig.Width();
    at.command.boxHeight = gdJigBoundBoxHeight = at.jig.Height();
    at.command.boxDragged = true;
    TzGePoint3d corner;
    at.jig.GetJigAttachPoint(corner);
    setCoordinates(at.command.location, corner);
}

}  // namespace

bool TzxMtextCommand::DoSecondPointPrompt(bool forAttribute) {
    CTzsMtextJig jig(pointOf(location));
    jig.SetAttachment(MapAttachment(attachmentId));
    if (!IsVerticalTTF()) jig.SetRotation(rotation);

    std::array<unsigned int, kOptions.size()> ids{};
    for (std::size_t i = 0; i < ids.size(); ++i)
        ids[i] = kOptions[i].keyword;
    int const count = static_cast<int>(ids.size());
    CKeywordTable keywords(ids.data(), forAttribute ? count - 1 : count);
    CTzsJigInput input(kControls, keywords, &jig, gStringTable[kText.oppositeCorner]);

    SecondCorner at{*this, jig};
    for (;;) {
        int const status = input.Prompt();
        if (status == statusCancel) return false;
        if (isAnswered(status)) {
            // An empty answer takes the box where it stands.
            takeBox(at);
            telemetry.set_end_point(input.getInputData());
            return true;
        }
        if (status != statusKeyword) continue;
        Next const next = askOption(input.GetKeyword(), at);
        if (next != Next::askAgain) return next == Next::finished;
    }
}
