// The questions for attachment, rotation, height and width, and the typed text.

#include "module/prompt/angle_input.h"
#include "module/prompt/asking.h"
#include "module/prompt/distance_input.h"
#include "module/prompt/keyword_input.h"
#include "module/prompt/string_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/attachment_ids.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/mte/mtext_command.h"

bool TzxMtextCommandBase::DoAttachPrompt() {
    CKeywordTable keywords(kAttachmentKeywords.data(),
                           static_cast<int>(kAttachmentKeywords.size()));
    CTzsKeywordInput input(0, keywords, gStringTable[kText.justificationPrompt]);
    // An empty answer means the top left, whatever the attachment is now.
    input.SetDefault(kText.topLeft);
    for (;;) {
        switch (input.Prompt()) {
        case statusCancel: return false;
        case statusNone: attachmentId = input.GetDefault(); return true;
        case statusNormal:
        case statusKeyword: attachmentId = input.GetKeyword(); return true;
        default: break;
        }
    }
}

bool TzxMtextCommandBase::DoRotatePrompt() {
    CKeywordTable none;
    CTzsAngleInput input(kRefusesEmpty, none, gStringTable[kText.rotationPrompt], firstCornerUcs);
    input.SetDefault(rotation);
    return askUntilAnswered(input, [&] { rotation = input.GetAngle(); });
}

bool TzxMtextCommandBase::DoHeightPrompt(bool useBase) {
    // The height of an annotative text is asked for as it shows in the drawing.
    bool const annotative = StyleIsAnnotative(GetTextStyleID(styleName));
    double const scale = annotative ? annotationScale() : 1.0;
    CKeywordTable none;
    CTzsDistanceInput input(kRefusesZero | kRefusesNegative, none,
                            gStringTable[annotative ? kText.paperHeightPrompt : kText.heightPrompt],
                            useBase ? firstCornerUcs : nullptr);
    input.SetDefault(textHeight * scale);
    return askOnce(input, [&] { textHeight = input.GetDistance() / scale; });
}

bool TzxMtextCommandBase::DoWidth() {
    CKeywordTable none;
    CTzsDistanceInput input(kRefusesNegative, none, gStringTable[kText.widthPrompt],
                            firstCornerUcs);
    // Without a default an empty answer gives 0, a text that does not wrap.
    return askOnce(input, [&] { boxWidth = input.GetDistance(); });
}

bool TzxMtextCommandBase::DoTextString() {
    CKeywordTable none;
    CTzsStringInput input(0, none, gStringTable[kText.textPrompt], true);
    TzString typed;
    for (;;) {
        switch (input.Prompt()) {
        case statusCancel: return false;
        case statusNone: contents = typed; return true;
        case statusNormal:
            if (!typed.isEmpty()) typed += TzDbMText::paragraphBreak();
            typed += input.GetInput();
            break;
        default: break;
        }
    }
}
