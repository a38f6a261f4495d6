// The questions for attachment, rotation, height and width, and the typed text.

#include <iterator>

#include "module/host_calls/sys_var.h"
#include "module/prompt/angle_input.h"
#include "module/prompt/asking.h"
#include "module/prompt/distance_input.h"
#include "module/prompt/keyword_input.h"
#include "module/prompt/string_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/string_table.h"
#include "tz/mte/mtext_command.h"

namespace {

// Prompts.
constexpr unsigned kRotationPrompt = 1066;
constexpr unsigned kHeightPrompt = 1070;
constexpr unsigned kWidthPrompt = 1071;
constexpr unsigned kAttachmentPrompt = 1072;
constexpr unsigned kTextPrompt = 1074;
constexpr unsigned kPaperHeightPrompt = 1103;

// Flags of a question.
constexpr unsigned kRefusesEmpty = 1;
constexpr unsigned kRefusesZeroAndNegative = 6;
constexpr unsigned kRefusesNegative = 4;

constexpr unsigned kTopLeft = 1048;

}  // namespace

bool TzxMtextCommandBase::DoAttachPrompt() {
    unsigned int ids[] = {kTopLeft, 1049, 1050, 1051, 1052, 1053, 1054, 1055, 1056};
    CKeywordTable keywords(ids, static_cast<int>(std::size(ids)));
    CTzsKeywordInput input(0, keywords, gStringTable[kAttachmentPrompt]);
    // An empty answer means the top left, whatever the attachment is now.
    input.SetDefault(kTopLeft);
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
    CTzsAngleInput input(kRefusesEmpty, none, gStringTable[kRotationPrompt], firstCornerUcs);
    input.SetDefault(rotation);
    return askUntilAnswered(input, [&] { rotation = input.GetAngle(); });
}

bool TzxMtextCommandBase::DoHeightPrompt(bool useBase) {
    // The height of an annotative text is asked for as it shows in the drawing.
    bool const annotative = StyleIsAnnotative(GetTextStyleID(styleName));
    double const scale = annotative ? CTzadSysVar::GetDouble(L"CANNOSCALEVALUE") : 1.0;
    CKeywordTable none;
    CTzsDistanceInput input(kRefusesZeroAndNegative, none,
                            gStringTable[annotative ? kPaperHeightPrompt : kHeightPrompt],
                            useBase ? firstCornerUcs : nullptr);
    input.SetDefault(textHeight * scale);
    return askOnce(input, [&] { textHeight = input.GetDistance() / scale; });
}

bool TzxMtextCommandBase::DoWidth() {
    CKeywordTable none;
    CTzsDistanceInput input(kRefusesNegative, none, gStringTable[kWidthPrompt], firstCornerUcs);
    // Without a default an empty answer gives 0, a text that does not wrap.
    return askOnce(input, [&] { boxWidth = input.GetDistance(); });
}

bool TzxMtextCommandBase::DoTextString() {
    CKeywordTable none;
    CTzsStringInput input(0, none, gStringTable[kTextPrompt], true);
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
