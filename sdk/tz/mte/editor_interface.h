#pragma once

#include "tz/db/field.h"
#include "tz/gi/color.h"
#include "tz/text/array.h"
#include "tz/text/std_str.h"

class TzDbDatabase;

// What one session of the dialog editor works on: the text in either of two forms, the sizes,
// colours and the style that it begins with, the look of the whole entity, and its fields. The
// module fills it from an entity before the dialog and writes the entity from it afterwards.
//
//   CMTextEditorInterface* editor = new_CMTextEditorInterface();
//   editor->SetMTextString(L"{\\LA}\\PB");
//   CStdStrW rtf;
//   editor->GetRTFString(rtf);      // the same text as a rich-text document
//   editor->SetRTFString(rtf);      // what an editor made of it
//   delete_CMTextEditorInterface(editor);
//
// Sizes and widths are drawing units, twips 1/20 point, colours 0x00BBGGRR. Every operation is for
// the host's one thread [any]. Setters take copies; objects that pointers name stay the caller's.
class CMTextEditorInterface {
public:
    // The side on which the editor opens.
    enum EditTab : int { kTextTab = 0, kPropertiesTab = 1 };
    // The attachment of the text: 1 to 9, top left to bottom right, row by row; 0 before it is set.
    enum Alignment : int { kAlignmentUnset = 0 };
    enum LineSpacingStyle : int { kSpacingAtLeast = 1, kSpacingExactly = 2 };

    virtual ~CMTextEditorInterface() = default;

    virtual void SetDialogName(CStdStrW const& name) = 0;
    [[nodiscard]] virtual CStdStrW GetDialogName() const = 0;

    // The text as markup. Reading a text that was last set as rich text converts it, on each call.
    virtual void SetMTextString(CStdStrW const& text) = 0;
    virtual void GetMTextString(CStdStrW& text) = 0;

    // The height of the text, which relative sizes refer to: the same length in units and in twips.
    virtual void SetInitialSize(double size) = 0;
    [[nodiscard]] virtual double GetInitialSize() const = 0;
    virtual void SetInitialTwipSize(int twips) = 0;
    [[nodiscard]] virtual int GetInitialTwipSize() const = 0;

    // What stands for ByLayer and ByBlock; all ones when unset. The two always differ: the later
    // one changes its lowest bit when it would equal the other.
    virtual void SetByLayerColor(unsigned int rgb) = 0;
    [[nodiscard]] virtual unsigned int GetByLayerColor() const = 0;
    virtual void SetByBlockColor(unsigned int rgb) = 0;
    [[nodiscard]] virtual unsigned int GetByBlockColor() const = 0;
    // The colour behind the text in the editor's window, and the colour of the text at its start.
    virtual void SetBkColor(unsigned int rgb) = 0;
    [[nodiscard]] virtual unsigned int GetBkColor() const = 0;
    virtual void SetInitialColor(unsigned int rgb) = 0;
    [[nodiscard]] virtual unsigned int GetInitialColor() const = 0;

    // The name of the text style.
    virtual void SetStyle(CStdStrW const& style) = 0;
    [[nodiscard]] virtual CStdStrW GetStyle() const = 0;

    virtual void SetAlignment(Alignment alignment) = 0;
    [[nodiscard]] virtual Alignment GetAlignment() const = 0;
    // The width to wrap at, 0 for none; the rotation in radians.
    virtual void SetWidth(double width) = 0;
    [[nodiscard]] virtual double GetWidth() const = 0;
    virtual void SetRotation(double radians) = 0;
    [[nodiscard]] virtual double GetRotation() const = 0;

    // The title of the editor's window, and the side on which it opens.
    virtual void SetCaptionString(CStdStrW const& caption) = 0;
    virtual void SetActiveTab(EditTab tab) = 0;
    [[nodiscard]] virtual EditTab GetActiveTab() const = 0;

    // [command] Runs the dialog on this object: 1 accepted, 2 left; any other result is a failure.
    [[nodiscard]] virtual int DoModal() = 0;

    // One conversion with the sizes, colours and style in force; a style that the drawing lacks
    // gives a text about the failure in the place of the result.
    virtual void ConvertMTextToRTF(CStdStrW const& text, CStdStrW& rtf) = 0;
    virtual void ConvertRTFToMText(CStdStrW const& rtf, CStdStrW& text) = 0;
    // What the last conversion to rich text could not carry over: bits of its incident word.
    [[nodiscard]] virtual unsigned int GetConversionResults() const = 0;

    // Bit 0x10000 keeps paragraph marks at the end of a text that comes back.
    virtual void SetEditorOptions(unsigned int options) = 0;

    virtual void SetLineSpacingStyle(LineSpacingStyle style) = 0;
    [[nodiscard]] virtual LineSpacingStyle GetLineSpacingStyle() const = 0;
    virtual void SetLineSpacingFactor(double factor) = 0;
    [[nodiscard]] virtual double GetLineSpacingFactor() const = 0;

    virtual void SetTabsAllowed(bool allowed) = 0;

    // The background of the entity: whether it is filled (0 no), its colour, the height of the box
    // over that of the text, how much shows through, and whether the drawing's own background
    // colour takes the place of the colour.
    virtual void SetBackgroundFill(int fill) = 0;
    [[nodiscard]] virtual int GetBackgroundFill() const = 0;
    virtual void SetBackgroundFillColor(TzCmColor const& color) = 0;
    [[nodiscard]] virtual TzCmColor GetBackgroundFillColor() const = 0;
    virtual void SetBackgroundFillScale(double scale) = 0;
    [[nodiscard]] virtual double GetBackgroundFillScale() const = 0;
    virtual void SetBackgroundFillTransparency(TzCmTransparency const& transparency) = 0;
    [[nodiscard]] virtual TzCmTransparency GetBackgroundFillTransparency() const = 0;
    virtual void SetBackgroundFillUseBackgroundColor(bool use) = 0;
    [[nodiscard]] virtual bool GetBackgroundFillUseBackgroundColor() const = 0;

    // The fields of the text, and the drawing that they are evaluated in. Nothing here is owned.
    virtual void SetMTextFieldArray(TzArray<TzDbField*> const& fields) = 0;
    [[nodiscard]] virtual TzArray<TzDbField*> const& GetMTextFieldArray() const = 0;
    virtual void SetMTextFieldObject(TzDbField* field) = 0;
    [[nodiscard]] virtual TzDbField* GetMTextFieldObject() const = 0;
    virtual void SetMTextDatabase(TzDbDatabase* database) = 0;
    [[nodiscard]] virtual TzDbDatabase* GetMTextDatabase() const = 0;
    virtual void SetAllowFields(bool allow) = 0;
    [[nodiscard]] virtual bool AllowFields() const = 0;

    // The text height as the dialog changes it; GetInitialSize gives the same value.
    virtual void SetNominalTextSize(double size) = 0;
    [[nodiscard]] virtual double GetNominalTextSize() const = 0;

    // The text as a rich-text document. Reading a text that was last set as markup converts it, on
    // each call.
    virtual void SetRTFString(CStdStrW const& rtf) = 0;
    virtual void GetRTFString(CStdStrW& rtf) = 0;
};
