// The making of the entity from the options.

#include <memory>
#include <new>

#include "module/edit/attachment.h"
#include "module/edit/editor_result.h"
#include "module/edit/session_field.h"
#include "module/geometry/points.h"
#include "module/geometry/user_axes.h"
#include "module/host_calls/space_posting.h"
#include "module/host_calls/sys_var.h"
#include "module/mtext/entity_fields.h"
#include "module/styles/line_spacing.h"
#include "module/styles/style_rules.h"
#include "module/texts/attachment_ids.h"
#include "tz/db/database.h"
#include "tz/db/extensions.h"
#include "tz/db/host_services.h"
#include "tz/mte/edit_mtext.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

// Columns that come from MTEXTCOLUMN alone get a gutter of this many text heights.
constexpr double kGutterHeights = 5.0;
// The telemetry of a text that was made.
constexpr int kSuccessPhase = 1;
constexpr int kMadeText = 0x98;

// What a text is made for.
enum class Purpose { drawing, attribute };

// Here and below: when the text refuses a value it keeps its own, and it is made all the same.
void fillEntity(TzxMtextCommand const& command,
                TzDbMText& text,
                TzDbObjectId style,
                Purpose purpose) {
    UserAxes const axes = activeUserAxes();
    text.setDatabaseDefaults(tzdbHostApplicationServices()->workingDatabase());
    (void)text.setNormal(axes.normal);
    (void)text.setLocation(pointOf(command.location));
    (void)text.setTextStyle(style);
    (void)text.setLineSpacingStyle(static_cast<TzDb::LineSpacingStyle>(command.lineSpacingStyle));
    (void)text.setLineSpacingFactor(command.lineSpacingFactor);
    if (purpose == Purpose::drawing) TzTextSetLayer::setTextLayer(&text);
    (void)text.setDirection(axes.turned(command.rotation).x.normalize());
    (void)text.setTextHeight(command.textHeight);
    (void)text.setAttachment(MapAttachment(command.attachmentId));
    (void)text.setWidth(command.boxWidth);
}

// The columns share the box's width; gutters that would take all of it are dropped.
void setStaticColumns(TzxMtextCommand& command, TzDbMText& text) {
    TextEditorColumns& columns = command.columns;
    int const gutters = columns.columnCount - 1;
    if (gutters * columns.columnGutter > command.boxWidth) columns.columnGutter = 0;
    columns.columnWidth = (command.boxWidth - gutters * columns.columnGutter) / columns.columnCount;
    (void)text.setHeight(command.boxHeight);
    (void)text.setStaticColumns(columns.columnWidth, columns.columnGutter, columns.columnCount);
}

// Columns that were not asked for are as wide as the box.
void setDynamicColumns(TzxMtextCommand& command, TzDbMText& text) {
    TextEditorColumns& columns = command.columns;
    if (command.columnsConfirmed)
        (void)text.setWidth(columns.columnWidth);
    else
        columns.columnWidth = command.boxWidth;
    if (columns.autoHeight) (void)text.setHeight(command.boxHeight);
    (void)text.setDynamicColumns(columns.columnWidth, columns.columnGutter, columns.autoHeight);
    if (!command.columnsConfirmed)
        (void)text.setColumnGutterWidth(command.textHeight * kGutterHeights);
}

void setColumns(TzxMtextCommand& command, TzDbMText& text) {
    switch (command.columns.columnType) {
    case TzDbMText::kStaticColumns: setStaticColumns(command, text); break;
    case TzDbMText::kDynamicColumns: setDynamicColumns(command, text); break;
    default: break;
    }
}

// Makes the text annotative as its style is, unless the host refuses. Gives the text's extension,
// null without one or when the style cannot be opened.
TzDbAnnotativeObjectPE* followStyle(TzDbMText& text, TzDbObjectId styleId) {
    EasyObject<TzDbTextStyleTableRecord> style;
    if (tzdbOpenObject(style.object, styleId, TzDb::kForRead) != Tzad::eOk) return nullptr;
    auto* const ofStyle = tzrxQuery<TzDbAnnotativeObjectPE>(style.object);
    auto* const ofText = tzrxQuery<TzDbAnnotativeObjectPE>(&text);
    bool const annotative = ofStyle && ofStyle->annotative(style.object);
    if (!annotative || !ofText) return ofText;
    (void)ofText->setAnnotative(&text, true);
    auto* const orientation = tzrxQuery<TzDbPaperOrientationPE>(style.object);
    if (orientation && orientation->paperOrientation(style.object))
        (void)orientation->setPaperOrientation(&text, true);
    return ofText;
}

bool typeText(TzxMtextCommand& command, TzDbMText& text) {
    if (!command.DoTextString()) return false;
    if (!g_bEnableFieldUI) command.contents = withFieldsEvaluated(command.contents);
    (void)text.setContents(command.contents);
    return true;
}

// A box that was dragged stays where it is although the editor may have changed the attachment.
bool editText(TzxMtextCommand const& command, EasyObject<TzDbMText>& text, Purpose purpose) {
    int const result = InvokeEditorOn(text, kMTETabText, 0, true, true,
                                      purpose == Purpose::attribute, false, false);
    if (result != kEditorAccepted) return false;
    TzDbMText::AttachmentPoint const attachment = text->attachment();
    (void)text->setLocation(pointOf(command.location));
    if (!command.boxDragged) return true;
    (void)text->setAttachment(MapAttachment(command.attachmentId));
    UpdateAttachPoint(text, attachment, command.boxHeight);
    (void)text->setAttachment(attachment);
    return true;
}

// Stores the options as the drawing's defaults for its next text. A default for which the drawing
// refuses the value stays as it is.
void storeDefaults(TzxMtextCommand& command, TzDbObjectId style) {
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    if (StyleIsAnnotative(database->textstyle())) command.textHeight *= annotationScale();
    (void)CTzadSysVar::SetDouble(L"TEXTSIZE", command.textHeight);
    (void)database->setTextstyle(style);
    (void)SetLineSpacingStyle(static_cast<TzDb::LineSpacingStyle>(command.lineSpacingStyle));
    (void)SetLineSpacingFactor(command.lineSpacingFactor);
}

}  // namespace

int TzxMtextCommand::CreateObject(TzDbMText* existing, bool forAttribute) {
    std::unique_ptr<TzDbMText> created(existing ? nullptr : new (std::nothrow) TzDbMText);
    EasyObject<TzDbMText> text(existing ? existing : created.get(), EasyFlags::kNone);
    if (!text.object) return false;

    SessionField field(text);
    Purpose const purpose = forAttribute ? Purpose::attribute : Purpose::drawing;
    TzDbObjectId const style = GetTextStyleID(styleName);
    fillEntity(*this, *text.object, style, purpose);
    setColumns(*this, *text.object);
    TzDbAnnotativeObjectPE* const annotation = followStyle(*text.object, style);
    gbUsedIPE = 0;
    bool const accepted =
        useCommandLineEditor ? typeText(*this, *text.object) : editText(*this, text, purpose);
    if (!accepted) return false;
    if (!gbUsedIPE && annotation) {
        bool changed = false;
        (void)annotation->updateScale(text.object, changed);
    }

    TzDbObjectId id;
    if (created) {
        text.object = nullptr;
        // A text that cannot be posted is gone; the options still become the defaults.
        (void)postToDb(created.release(), id, worksOnPaper());
    }
    if (field.isLeft())
        attachField(id, field);
    else if (useCommandLineEditor)
        evaluateField(id);
    storeDefaults(*this, style);
    telemetry.SendEvent(kSuccessPhase, kMadeText);
    return true;
}
