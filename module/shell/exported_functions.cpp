#include <memory>
#include <utility>

#include "module/access/attachment_ids.h"
#include "module/access/style_rules.h"
#include "tz/db/field.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

constexpr int kAccepted = 1;
constexpr int kNoEditorRan = 3;

// The rotation is taken as it is, without the working angle.
void copyOptions(TzDbMText const& text, TzxMtextCommand& command) {
    TzGePoint3d const location = text.location();
    command.location[0] = location.x;
    command.location[1] = location.y;
    command.location[2] = location.z;
    command.boxWidth = text.width();
    command.rotation = text.rotation();
    command.textHeight = text.textHeight();
    command.attachmentId = MapAttachmentToIDS(text.attachment());
    command.styleName = GetTextStyleName(text.textStyle());
}

// Attaches the field that a session left; one that the text does not take is deleted.
void attachField(TzDbMText& text, std::unique_ptr<TzDbField> field) {
    TzDbObjectId dropped;
    if (text.setField(L"TEXT", field.get(), dropped) == Tzad::eOk) field.release()->close();
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
    if (!text) return kNoEditorRan;
    EasyObject<TzDbMText> held(text, EasyFlags::kNone);
    int const result = InvokeEditorOn(held, tab, flags, interactive, view, false, false, false);
    std::unique_ptr<TzDbField> field(std::exchange(held.field, nullptr));
    if (result == kAccepted && field) attachField(*text, std::move(field));
    return result;
}
