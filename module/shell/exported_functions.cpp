#include <memory>

#include "module/edit/editor_result.h"
#include "module/edit/session_field.h"
#include "module/geometry/points.h"
#include "module/styles/style_rules.h"
#include "module/texts/attachment_ids.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

// The rotation is taken as it is, without the working angle.
void copyOptions(TzDbMText const& text, TzxMtextCommand& command) {
    setCoordinates(command.location, text.location());
    command.boxWidth = text.width();
    command.rotation = text.rotation();
    command.textHeight = text.textHeight();
    command.attachmentId = MapAttachmentToIDS(text.attachment());
    command.styleName = GetTextStyleName(text.textStyle());
}

}  // namespace

TzxMtextCommand* newTzxMtextCommand() {
    return new TzxMtextCommand;
}

int doMTextCommandForAttributeDlg(TzDbMText* text) {
    if (!text) return 0;
    gdJigBoundBoxHeight = 0;
    std::unique_ptr<TzxMtextCommand> const command(newTzxMtextCommand());
    copyOptions(*text, *command);
    if (text->location().isEqualTo(TzGePoint3d::kOrigin) && !command->DoMainPrompt(true, false))
        return 0;
    return command->CreateObject(text, true);
}

int doMTextCommandForAttDefCmd(TzDbMText* text) {
    if (!text) return 0;
    gdJigBoundBoxHeight = 0;
    std::unique_ptr<TzxMtextCommand> const command(newTzxMtextCommand());
    command->setMTextOptionsFrom(text);
    bool const answered = command->DoMainPrompt(true, true);
    if (answered) command->setMTextOptionsTo(text);
    return answered ? 1 : 0;
}

int TzadEditMTextEntity(
    void*, MTETabType tab, TzDbMText* text, int, unsigned int flags, bool interactive, bool view) {
    if (!text) return kNoEditor;
    EasyObject<TzDbMText> held(text, EasyFlags::kNone);
    SessionField field(held);
    int const result = InvokeEditorOn(held, tab, flags, interactive, view, false, false, false);
    if (result == kEditorAccepted) field.attachTo(*text);
    return result;
}
