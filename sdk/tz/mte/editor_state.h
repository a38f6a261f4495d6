#pragma once

#include "tz/mte/editor_interface.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/scale_correction.h"
#include "tz/mte/stack_alignment.h"
#include "tz/mte/style_info.h"

// The one implementation of CMTextEditorInterface: what an editing session holds, with the font map
// and the two scale tables that both conversions share, so that sizes and fonts that went to the
// editor come back as they were.
//
// A dialog receives it in its parameters and calls only what is virtual or inline here; the rest is
// the module's own. One session at a time: conversions share process-wide tables of fonts.

// The mark of a session that is at work.
struct CWaitCursor {
    char unused = 0;
};

class CMTextEditorState : public CMTextEditorInterface {
public:
    // Reads the sizes of points from the registry and the background from the palette.
    CMTextEditorState();
    CMTextEditorState(CMTextEditorState const&) = delete;
    CMTextEditorState& operator=(CMTextEditorState const&) = delete;
    ~CMTextEditorState() override;

    void SetDialogName(CStdStrW const& name) override;
    [[nodiscard]] CStdStrW GetDialogName() const override;
    void SetMTextString(CStdStrW const& text) override;
    void GetMTextString(CStdStrW& text) override;
    void SetInitialSize(double size) override;
    [[nodiscard]] double GetInitialSize() const override;
    void SetInitialTwipSize(int twips) override;
    [[nodiscard]] int GetInitialTwipSize() const override;
    void SetByLayerColor(unsigned int rgb) override;
    [[nodiscard]] unsigned int GetByLayerColor() const override;
    void SetByBlockColor(unsigned int rgb) override;
    [[nodiscard]] unsigned int GetByBlockColor() const override;
    void SetBkColor(unsigned int rgb) override;
    [[nodiscard]] unsigned int GetBkColor() const override;
    void SetInitialColor(unsigned int rgb) override;
    [[nodiscard]] unsigned int GetInitialColor() const override;
    void SetStyle(CStdStrW const& style) override;
    [[nodiscard]] CStdStrW GetStyle() const override;
    void SetAlignment(Alignment alignment) override;
    [[nodiscard]] Alignment GetAlignment() const override;
    void SetWidth(double width) override;
    [[nodiscard]] double GetWidth() const override;
    void SetRotation(double radians) override;
    [[nodiscard]] double GetRotation() const override;
    void SetCaptionString(CStdStrW const& caption) override;
    void SetActiveTab(EditTab tab) override;
    [[nodiscard]] EditTab GetActiveTab() const override;
    [[nodiscard]] int DoModal() override;
    void ConvertMTextToRTF(CStdStrW const& text, CStdStrW& rtf) override;
    void ConvertRTFToMText(CStdStrW const& rtf, CStdStrW& text) override;
    [[nodiscard]] unsigned int GetConversionResults() const override;
    void SetEditorOptions(unsigned int options) override;
    void SetLineSpacingStyle(LineSpacingStyle style) override;
    [[nodiscard]] LineSpacingStyle GetLineSpacingStyle() const override;
    void SetLineSpacingFactor(double factor) override;
    [[nodiscard]] double GetLineSpacingFactor() const override;
    void SetTabsAllowed(bool allowed) override;
    void SetBackgroundFill(int fill) override;
    [[nodiscard]] int GetBackgroundFill() const override;
    void SetBackgroundFillColor(TzCmColor const& color) override;
    [[nodiscard]] TzCmColor GetBackgroundFillColor() const override;
    void SetBackgroundFillScale(double scale) override;
    [[nodiscard]] double GetBackgroundFillScale() const override;
    void SetBackgroundFillTransparency(TzCmTransparency const& transparency) override;
    [[nodiscard]] TzCmTransparency GetBackgroundFillTransparency() const override;
    void SetBackgroundFillUseBackgroundColor(bool use) override;
    [[nodiscard]] bool GetBackgroundFillUseBackgroundColor() const override;
    void SetMTextFieldArray(TzArray<TzDbField*> const& fields) override;
    [[nodiscard]] TzArray<TzDbField*> const& GetMTextFieldArray() const override;
    void SetMTextFieldObject(TzDbField* field) override;
    [[nodiscard]] TzDbField* GetMTextFieldObject() const override;
    void SetMTextDatabase(TzDbDatabase* database) override;
    [[nodiscard]] TzDbDatabase* GetMTextDatabase() const override;
    void SetAllowFields(bool allow) override;
    [[nodiscard]] bool AllowFields() const override;
    void SetNominalTextSize(double size) override;
    [[nodiscard]] double GetNominalTextSize() const override;
    void SetRTFString(CStdStrW const& rtf) override;
    void GetRTFString(CStdStrW& rtf) override;

    // Where stacks stand against their line; a value above 2 changes nothing.
    void SetVerticalAlignment(VerticalAlignment alignment) {
        if (static_cast<unsigned int>(alignment) <= kAlignTop) m_eVerticalAlignment = alignment;
    }
    [[nodiscard]] VerticalAlignment GetVerticalAlignment() const { return m_eVerticalAlignment; }
    // Values of the whole text, as the last conversion to rich text met them: the spacing of
    // characters and their width as factors, the slant in degrees.
    void SetTracking(double tracking) { m_dTracking = tracking; }
    [[nodiscard]] double GetTracking() const { return m_dTracking; }
    void SetCharWidth(double width) { m_dCharWidth = width; }
    [[nodiscard]] double GetCharWidth() const { return m_dCharWidth; }
    void SetOblique(double degrees) { m_dOblique = degrees; }
    [[nodiscard]] double GetOblique() const { return m_dOblique; }
    void SetStackRescaleSize(double size) { m_dStackRescaleSize = size; }
    [[nodiscard]] double GetStackRescaleSize() const { return m_dStackRescaleSize; }

    // The limits of sizes in the editor, in twips and in drawing units.
    void SetMaximumTwipSize(int twips) { m_nMaximumTwipSize = twips; }
    [[nodiscard]] int GetMaximumTwipSize() const { return m_nMaximumTwipSize; }
    void SetMinimumTwipSize(int twips) { m_nMinimumTwipSize = twips; }
    [[nodiscard]] int GetMinimumTwipSize() const { return m_nMinimumTwipSize; }
    [[nodiscard]] double GetMaximumSize() const;
    [[nodiscard]] double GetMinimumSize() const;

    // One length in the other measure, by the scale table of font sizes when `bFont` is not 0, else
    // by that of indents and tabs.
    [[nodiscard]] double TwipsToUnits(int twips, signed char bFont) const;
    [[nodiscard]] int UnitsToTwips(double units, signed char bFont);
    // The twips of the nearest length that the drawing's linear units can show.
    [[nodiscard]] int TwipsAdjustedForLinearUnits(int twips);
    // The editor's margin in twips for a width of the text in drawing units, truncated, and back.
    [[nodiscard]] int CalcMarginFromWidth(double width);
    [[nodiscard]] double CalcWidthFromMargin(int margin);

    // Reads the styles of the working drawing, once for each session; those of external references
    // are left out.
    void LoadStyles();
    // The place of a style among those loaded; false and -1 when it is not there.
    [[nodiscard]] bool FindStyle(CStdStrW const& name, int& index) const;
    // False, with `entry` as it was, for a place out of range.
    [[nodiscard]] bool GetStyleInfo(int index, CStyleInfoEntry& entry) const;
    // The font file of a style, of the session's own for null; empty when the style is not there.
    [[nodiscard]] CStdStrW GetStyleFontFileName(CStdStrW const* style);

    [[nodiscard]] unsigned int GetEditorOptions() const { return m_nEditorOptions; }
    [[nodiscard]] bool GetTabsAllowed() const { return m_bTabsAllowed; }

    void CreateWaitCursor();
    void DestroyWaitCursor();

private:
    EditTab m_eActiveTab = kTextTab;
    unsigned int m_nBkColor = 0;
    unsigned int m_nByLayerColor = 0xFFFFFFFF;  // unset
    unsigned int m_nByBlockColor = 0xFFFFFFFF;
    unsigned int m_nInitialColor = 0;
    CStdStrW m_sCaption;
    CStdStrW m_sStyle;
    CStdStrW m_sText;  // in one of the two forms
    bool m_bTextIsRTF = false;
    Alignment m_eAlignment = kAlignmentUnset;
    double m_dRotation = 0.0;
    double m_dWidth = 0.0;
    double m_dNominalTextSize = 0.0;
    unsigned int m_nIncidents = 0;  // of the last conversion to rich text
    CWaitCursor* m_pWaitCursor = nullptr;
    TzArray<CStyleInfoEntry> m_aStyles;
    double m_dStackRescaleSize = 0.0;
    int m_nMaximumTwipSize = 0;
    int m_nMinimumTwipSize = 0;
    CMTextFontMapDatabase m_fontMap{0};
    unsigned int m_nEditorOptions = 0;
    bool m_bTabsAllowed = false;
    double m_dTracking = 1.0;
    double m_dCharWidth = 1.0;
    double m_dOblique = 0.0;
    CScaleCorrection m_fontScale{1};    // rounded up to tens of twips
    CScaleCorrection m_marginScale{0};  // indents and tabs
    LineSpacingStyle m_eLineSpacingStyle = kSpacingAtLeast;
    double m_dLineSpacingFactor = 1.0;
    VerticalAlignment m_eVerticalAlignment;
    CStdStrW m_sDialogName;
    int m_nMinSizeFound = 0;  // twips, of the last conversion to rich text
    int m_nMaxSizeFound = 0;
    bool m_bStacksSeen = false;
    int m_nBackgroundFill = 0;
    TzCmColor m_backgroundFillColor;
    double m_dBackgroundFillScale = 0.0;
    TzCmTransparency m_backgroundFillTransparency;
    bool m_bBackgroundFillUseBackgroundColor = false;
    TzArray<TzDbField*> m_aFields;        // not owned
    TzDbField* m_pFieldObject = nullptr;  // not owned
    TzDbDatabase* m_pDatabase = nullptr;
    bool m_bAllowFields = true;
};

extern "C" {
// [command] A session primed from the drawing: the text size TEXTSIZE, the colour of the layer in
// force, the style TEXTSTYLE. The caller gives it back to the second function, which ignores null.
[[nodiscard]] TZ_API CMTextEditorInterface* new_CMTextEditorInterface();
TZ_API void delete_CMTextEditorInterface(CMTextEditorInterface* editor);
}
