#include "module/edit/entity_exchange.h"

#include <memory>

#include "module/edit/attachment.h"
#include "module/edit/field_backslashes.h"
#include "module/edit/session_field.h"
#include "module/markup/shared/rtf_color_table.h"
#include "module/styles/drawing_colors.h"
#include "module/styles/style_rules.h"
#include "tz/db/symbol_table.h"
#include "tz/mte/globals.h"

namespace {

constexpr int kLowestIndex = 1;
constexpr int kHighestIndex = 255;
constexpr int kFieldCodeFlags = 0x100;

unsigned int colorForEditor(CMTextEditorInterface const& editor, TzDbMText const& text) {
    TzCmColor const color = text.color();
    if (color.isByColor()) return color.getCOLORREF();
    return CRichTextColorTable::GetRGB(color.colorIndex(), editor.GetByLayerColor(),
                                       editor.GetByBlockColor());
}

// The index that stands for exactly this colour, the lowest first; -1 when none does.
int indexOf(unsigned int rgb) {
    for (int index = kLowestIndex; index <= kHighestIndex; ++index) {
        if (tzedGetRGB(index) == rgb) return index;
    }
    return -1;
}

void setColor(TzDbMText& text, CMTextEditorInterface const& editor) {
    unsigned int const rgb = editor.GetInitialColor();
    int const index = rgb == editor.GetByLayerColor()   ? kByLayerIndex
                      : rgb == editor.GetByBlockColor() ? kByBlockIndex
                                                        : indexOf(rgb);
    if (index >= 0) {
        (void)text.setColorIndex(index);
        return;
    }
    TzCmColor color;
    color.setRGB(static_cast<std::uint8_t>(rgb), static_cast<std::uint8_t>(rgb >> 8),
                 static_cast<std::uint8_t>(rgb >> 16));
    (void)text.setColor(color);
}

void setBackground(TzDbMText& text, CMTextEditorInterface const& editor) {
    (void)tzdbSetMTextBackground(&text, editor.GetBackgroundFill() != 0,
                                 editor.GetBackgroundFillColor(), editor.GetBackgroundFillScale(),
                                 editor.GetBackgroundFillTransparency());
    (void)text.setUseBackgroundColor(editor.GetBackgroundFillUseBackgroundColor());
}

void setStyle(TzDbMText& text, CMTextEditorInterface const& editor) {
    TzDbObjectId style;
    if (GetIDFromTextStyleName(editor.GetStyle().c_str(), style)) (void)text.setTextStyle(style);
}

void eraseField(TzDbMText& text) {
    TzDbField* field = nullptr;
    if (text.getField(kTextFieldKey, field, TzDb::kForWrite) != Tzad::eOk) return;
    (void)field->erase(true);
    (void)field->close();
}

// A new field with these codes: attached to a text of a drawing, left in the holder of another.
void makeField(EasyObject<TzDbMText>& text, CStdStrW const& codes) {
    auto field = std::make_unique<TzDbField>();
    if (field->setFieldCode(codes.c_str(), kFieldCodeFlags, nullptr) != Tzad::eOk) return;
    tzedTextFieldModified(field.get());
    delete text.field;
    text.field = field.release();
    if (!text->database()) return;
    SessionField left(text);
    left.attachTo(*text.object);
}

}  // namespace

unsigned int GetObjectByLayerColor(EasyObject<TzDbMText>& text) {
    return layerColor(text->layerId());
}

void feedEditor(CMTextEditorInterface& editor, EasyObject<TzDbMText>& text) {
    editor.SetByLayerColor(GetObjectByLayerColor(text));
    editor.SetByBlockColor(GetCurrentDrawingByBlockColor());
    editor.SetInitialColor(colorForEditor(editor, *text.object));
    editor.SetStyle(GetTextStyleName(text->textStyle()));
    EasyObject<TzDbTextStyleTableRecord> style;
    if (tzdbOpenObject(style.object, text->textStyle(), TzDb::kForRead) == Tzad::eOk)
        (void)IsVerticalTTF(style);  // asked, and put to no use
    g_dTextSize = text->textHeight();
    editor.SetInitialSize(text->textHeight());
    editor.SetAlignment(static_cast<CMTextEditorInterface::Alignment>(text->attachment()));
    editor.SetRotation(text->rotation());
    editor.SetWidth(text->width());
    editor.SetLineSpacingStyle(
        static_cast<CMTextEditorInterface::LineSpacingStyle>(text->lineSpacingStyle()));
    editor.SetLineSpacingFactor(text->lineSpacingFactor());
    editor.SetBackgroundFillColor(text->backgroundFillColor());
    editor.SetBackgroundFillTransparency(text->backgroundTransparency());
    editor.SetBackgroundFillScale(text->backgroundScaleFactor());
    editor.SetBackgroundFill(text->backgroundFillOn() ? 1 : 0);
    editor.SetBackgroundFillUseBackgroundColor(text->useBackgroundColorOn());
    editor.SetMTextDatabase(text->database());
}

bool contentsForEditor(TzDbMText const& text, CStdStrW& contents) {
    EasyObject<TzDbField> field;
    Tzad::ErrorStatus const status = text.getField(kTextFieldKey, field.object, TzDb::kForRead);
    if (status != Tzad::eOk && status != Tzad::eKeyNotFound) return false;
    contents = field.object ? field->getFieldCode(0) : text.contents();
    convertBackslashesInFields(contents, kDoubleBackslashes);
    return true;
}

// A value that the text refuses leaves it with the one that it has.
void takeFromEditor(CMTextEditorInterface& editor,
                    EasyObject<TzDbMText>& held,
                    unsigned int fedColor) {
    TzDbMText& text = *held.object;
    auto const attachment = static_cast<TzDbMText::AttachmentPoint>(editor.GetAlignment());
    CStdStrW contents;
    editor.GetMTextString(contents);
    convertBackslashesInFields(contents, kHalveBackslashes);
    bool const hasFields = tzdbHasFields(contents.c_str(), 1);

    UpdateAttachPoint(held, attachment, kMeasureHeight);
    if (!hasFields) eraseField(text);
    (void)text.setContents(contents.c_str());
    (void)text.setTextHeight(editor.GetNominalTextSize());
    (void)text.setAttachment(attachment);
    (void)text.setWidth(editor.GetWidth());
    setStyle(text, editor);
    (void)text.setRotation(editor.GetRotation());
    (void)text.setLineSpacingStyle(
        static_cast<TzDb::LineSpacingStyle>(editor.GetLineSpacingStyle()));
    (void)text.setLineSpacingFactor(editor.GetLineSpacingFactor());
    if (editor.GetInitialColor() != fedColor) setColor(text, editor);
    setBackground(text, editor);
    if (hasFields) makeField(held, contents);
}
