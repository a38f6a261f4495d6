#include "module/commands/mtext_height.h"

#include "module/commands/edit_report.h"
#include "tz/ed/selection.h"
#include "tz/mte/easy_object.h"
#include "tz/mte/mtext_command.h"

namespace {

constexpr int kNothingReached = 3;

void setHeight(TzDbObjectId id, double height) {
    EasyObject<TzDbMText> text;
    if (tzdbOpenObject(text.object, id, TzDb::kForWrite) != Tzad::eOk) return;
    (void)text->setTextHeight(height);  // a refused height leaves the text as it is
}

}  // namespace

void setHeightForSelectedMText(long long const* set) {
    TzxMtextCommand command;
    int length = 0;
    if (tzedSSLength(set, &length) != Tzad::ePromptNormal) return;
    EditReport const report(L"MTEdit");
    report.begin();
    if (!command.DoHeightPrompt(false) || length == 0) return;

    // The status of finding the id of the last entity; it alone decides whether a success is
    // reported. It is 0 also when that entity could not be opened.
    int last = kNothingReached;
    for (int index = 0; index < length; ++index) {
        long long name[2] = {};
        if (tzedSSName(set, index, name) != Tzad::ePromptNormal) continue;
        TzDbObjectId id;
        last = tzdbGetObjectId(id, name);
        if (last == Tzad::eOk) setHeight(id, command.getTextHeight());
    }
    if (last == Tzad::eOk) report.success();
}
