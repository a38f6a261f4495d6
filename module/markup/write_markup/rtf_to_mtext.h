#pragma once

#include <deque>

#include "module/markup/read_rtf/paragraph_look_ahead.h"
#include "module/markup/shared/rtf_color_table.h"
#include "module/markup/shared/rtf_font_table.h"
#include "module/markup/shared/string_stream.h"
#include "module/markup/write_markup/font_state.h"
#include "module/markup/write_markup/rtf_losses.h"
#include "tz/text/code_page.h"

class CMTextFontMapDatabase;
class CScaleCorrection;
struct RtfStep;

// Reads an RTF document and writes MTEXT markup. It knows a small set of words; a group that opens
// with an unknown word is dropped with all its text, and elsewhere only the word is. Changes of the
// look are written before the next character, so that only what is in force at a character shows.
//
//   CRichTextToMTextContext context(&fonts, &fontScale, &marginScale);
//   context.SetInitialFontName(L"Arial", false, false, kAnsiCharset, 34);
//   context.SetInitialFontSize(0.2, 280);
//   context.SetInitialColor(0xFFFFFF);
//   context.SetBaseAlignment(kAlignBottom, 0);
//   CStdStrW const markup = context.Parse(rtf);
//
// Set up in this order, with the colours of ByLayer and ByBlock before the initial one: one
// context, one conversion. Set-up writes process-wide state: the name of the text style's face
// (g_sStyleFontName), and the font tables when a file is lent a proxy. So contexts are not used
// side by side. The font map and the scales must outlive the context. Nothing fails: malformed text
// is read as far as it goes. Groups nest without limit; each takes a record of its own and no call
// stack.
class CRichTextToMTextContext : public CStringStream,
                                public CRichTextColorTable,
                                public CRichTextFontTable,
                                public CFontState {
public:
    // A bit of the options: paragraph marks at the end stay.
    static constexpr unsigned int kKeepTrailingParagraphs = 0x10000;

    CRichTextToMTextContext(CMTextFontMapDatabase* fontMap,
                            CScaleCorrection* fontScale,
                            CScaleCorrection* marginScale);

    void SetInitialFontName(
        wchar_t const* name, bool bold, bool italic, Charset charset, int pitchAndFamily);
    void SetInitialFontFileName(wchar_t const* file);
    // The twips are not used: the scales know them.
    void SetInitialFontSize(double size, int twips);
    void SetInitialColor(unsigned int rgb);
    // Whole-text values, written at the head of the text where they are not 1, 1 and 0.
    void SetTracking(double tracking) { m_dTracking = tracking; }
    void SetCharWidth(double width) { m_dCharWidth = width; }
    void SetOblique(double oblique) { m_dOblique = oblique; }
    void SetOptions(unsigned int options) { m_nOptions = options; }
    // The page of bytes before any font or `\ansicpg`; the system's without this.
    void SetCodePage(code_page_id_ex page) { m_nCodePage = page; }

    // The whole markup. The tables, the text written so far and the look stay, so that the markup
    // of a second document begins with that of the first.
    [[nodiscard]] CStdStrW Parse(wchar_t const* text);
    // The same for the only document of the context, whose stream gives its memory to the result.
    [[nodiscard]] CStdStrW parseOnce(std::wstring const& text);

    // Whether the text held a `\S`, which stacks begin with.
    [[nodiscard]] bool StackSeen() const { return m_bStackSeen; }
    // What was passed over so far.
    [[nodiscard]] RtfLosses const& losses() const { return losses_; }

    // The control word after a backslash and its number, kNoValue without one; a view of the text.
    // Nothing calls it: the pass takes its words from nextStep.
    [[nodiscard]] static std::wstring_view GetToken(wchar_t const*& cursor, int& value);
    // Does what a word says, with the cursor after it. False for an unknown word.
    bool HandleToken(wchar_t const*& cursor, std::wstring_view word, int value);

private:
    friend struct RtfWords;
    // What a group keeps of the text around it.
    struct Level {
        CFontAttributes look;
        bool skipsDestination;
        bool isAfterFirst;
    };
    struct Replacement;

    void run(wchar_t const* text, std::size_t length);
    // The markup around what was written.
    [[nodiscard]] CStdStrW finished(CStdStrW markup);

    // Groups.
    void Convert(wchar_t const* cursor);
    void onGroup(bool& skipsDestination, bool& isAfterFirst);
    [[nodiscard]] bool onGroupEnd(bool& skipsDestination, bool& isAfterFirst);
    void
    onWord(wchar_t const*& cursor, RtfStep const& step, bool skipsDestination, bool isAfterFirst);
    void onSymbol(wchar_t const*& cursor);
    void onEscapedBackslash(wchar_t const*& cursor);
    void onText(std::wstring_view text);
    void PreEmitChar();
    [[nodiscard]] CStdStrW InitialDefaults() const;
    void appendReplacement(std::size_t which);

    // Words.
    void OnParagraph(wchar_t const*& cursor, int value);
    void OnPlain(wchar_t const*& cursor, int value);
    void OnFont(wchar_t const*& cursor, int value);
    void OnForegroundColor(wchar_t const*& cursor, int value);
    void OnFontSize(wchar_t const*& cursor, int value);
    void OnBold(wchar_t const*& cursor, int value);
    void OnItalic(wchar_t const*& cursor, int value);
    void OnUnderline(wchar_t const*& cursor, int value);
    void OnUnderlineOff(wchar_t const*& cursor, int value);
    void OnTab(wchar_t const*& cursor, int value);
    void OnStrikethrough(wchar_t const*& cursor, int value);
    void OnFontTable(wchar_t const*& cursor, int value);
    void OnColorTable(wchar_t const*& cursor, int value);
    void OnDefaultParagraph(wchar_t const*& cursor, int value);
    void OnLineBreak(wchar_t const*& cursor, int value);
    void OnEmSpace(wchar_t const*& cursor, int value);
    void OnEnSpace(wchar_t const*& cursor, int value);
    void OnEmDash(wchar_t const*& cursor, int value);
    void OnEnDash(wchar_t const*& cursor, int value);
    void OnLeftSingleQuote(wchar_t const*& cursor, int value);
    void OnRightSingleQuote(wchar_t const*& cursor, int value);
    void OnLeftDoubleQuote(wchar_t const*& cursor, int value);
    void OnRightDoubleQuote(wchar_t const*& cursor, int value);
    void OnBaselineUp(wchar_t const*& cursor, int value);
    void OnBaselineDown(wchar_t const*& cursor, int value);
    void OnCodePage(wchar_t const*& cursor, int value);
    void OnPnText(wchar_t const*& cursor, int value);
    void OnUnicode(wchar_t const*& cursor, int value);
    // A word that is known and says nothing.
    void OnNothing(wchar_t const*& cursor, int value);

    void appendParagraphSettings(ParagraphSettings const& settings);
    [[nodiscard]] double marginUnits(int twips) const;

    std::array<TzString, 6> replacements_;  // dashes and quotes, loaded on first use
    double m_dTracking = 1.0;
    double m_dCharWidth = 1.0;
    double m_dOblique = 0.0;
    // Set by the first half of a stack's marker; the end of a group does not undo it.
    bool m_bInStack = false;
    bool m_bSwallowTokens = false;  // words are read but not acted on
    bool m_bStackSeen = false;
    code_page_id_ex m_nCodePage;
    CMTextFontMapDatabase* m_pFontMap;
    CScaleCorrection* m_pFontScale;
    CScaleCorrection* m_pMarginScale;
    unsigned int m_nOptions = 0;
    bool m_bCharEmitted = false;    // in the present group
    ParagraphSettings m_paragraph;  // as last written; not undone by a group's end

    RtfLosses losses_;
    std::deque<Level> levels_;  // the groups around the present one
    ParagraphLookAhead paragraphs_;
    CStdStrW codes_;  // used again for each change
};
