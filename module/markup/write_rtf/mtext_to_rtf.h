#pragma once

#include <array>
#include <bit>
#include <memory>
#include <string>
#include <string_view>

#include "module/markup/shared/paragraph_settings.h"
#include "module/markup/shared/rtf_color_table.h"
#include "module/markup/shared/rtf_font_table.h"
#include "module/markup/shared/string_stream.h"
#include "module/markup/shared/text_hash.h"
#include "tz/mte/stack_alignment.h"

class CMTextFontMapDatabase;
class CScaleCorrection;
class StackLookAhead;
struct FontCode;

// What of a markup the rich text could not carry over, as bits of the incident word.
enum ConversionIncident : unsigned int {
    kTrackingLate = 0x1,             // `\T` after the first text
    kTrackingIgnored = 0x2,          // a further `\T`
    kCharWidthLate = 0x4,            // the same of `\W`
    kCharWidthIgnored = 0x8,         //
    kObliqueLate = 0x10,             // the same of `\Q`
    kObliqueIgnored = 0x20,          //
    kFontByProxy = 0x100,            // a font file that only a proxy face stands for
    kFaceWithoutFile = 0x200,        // a face that no file is known of
    kUnknownCode = 0x40000000,       // kept as text
    kStackWithoutSign = 0x80000000,  // `\S` without a sign of a stack, kept as text
};

// How often each incident was met.
class IncidentCounts {
public:
    void note(unsigned int incident) { ++counts_[placeOf(incident)]; }
    [[nodiscard]] int of(ConversionIncident incident) const { return counts_[placeOf(incident)]; }

private:
    static std::size_t placeOf(unsigned int incident) {
        return static_cast<std::size_t>(std::countr_zero(incident));
    }
    std::array<int, 32> counts_{};
};

// Reads MTEXT markup in one pass and writes it as an RTF document: text, fonts, sizes, colours,
// underline, overline, indents and tabs; stacks and a few characters as markers that only the
// reader of the other direction and the dialog editor know.
//
//   CMTextToRichTextContext context(&fonts, &fontScale, &marginScale);
//   context.SetInitialFontName(L"Arial", false, false, kAnsiCharset, 34);
//   context.SetInitialFontSize(0.2, 280);
//   context.SetInitialFontColor(0xFFFFFF);
//   CStdStrW const rtf = context.Parse(L"{\\LA}\\P");
//
// Set up in this order, with the colours of ByLayer and ByBlock last: one context, one conversion.
// Set-up writes process-wide state: the initial font (g_sInitialFont), and the font tables when a
// file is lent a proxy. So contexts are not used side by side. The font map and the scales must
// outlive the context. Sizes of the markup are drawing units, those of the document half-points,
// which are tens of twips. Nothing fails: what cannot be carried over is an incident, and malformed
// codes come out as text.
class CMTextToRichTextContext : public CStringStream,
                                public CRichTextColorTable,
                                public CRichTextFontTable {
public:
    CMTextToRichTextContext(CMTextFontMapDatabase* fontMap,
                            CScaleCorrection* fontScale,
                            CScaleCorrection* marginScale);
    ~CMTextToRichTextContext() override;

    // The font of the text style, by face or by file: font 0 of the document.
    void SetInitialFontName(
        wchar_t const* name, bool bold, bool italic, Charset charset, int pitchAndFamily);
    void SetInitialFontFileName(wchar_t const* file);
    // The same size in both measures; a size of 0.0 counts as 2.0.
    void SetInitialFontSize(double size, int twips);
    // Colour 0 of the document, 0x00BBGGRR.
    void SetInitialFontColor(unsigned int rgb);

    // The whole document. The tables, the text written so far and the whole-text values stay, so
    // that a second document holds the text of the first too.
    [[nodiscard]] CStdStrW Parse(wchar_t const* text);
    // The same for the only text of the context, whose stream gives its memory to the result.
    [[nodiscard]] CStdStrW parseOnce(std::wstring const& text);

    [[nodiscard]] unsigned int GetIncidents() const { return m_nIncidents; }
    // Whether all bits of the mask are set.
    [[nodiscard]] bool IsIncident(unsigned int mask) const { return (m_nIncidents & mask) == mask; }
    // One incident, or 0 for none.
    void ReportIncident(unsigned int incident);
    // How often each was reported.
    [[nodiscard]] IncidentCounts const& incidentCounts() const { return incidentCounts_; }
    [[nodiscard]] bool StacksSeen() const { return m_bStacksSeen; }

    // Whole-text values.
    [[nodiscard]] double GetTracking() const { return m_dTracking; }
    void SetTracking(double tracking) { m_dTracking = tracking == 0.0 ? 1.0 : tracking; }
    [[nodiscard]] double GetCharWidth() const { return m_dCharWidth; }
    void SetCharWidth(double width) { m_dCharWidth = width; }
    [[nodiscard]] double GetOblique() const { return m_dOblique; }
    void SetOblique(double oblique) { m_dOblique = oblique; }
    [[nodiscard]] VerticalAlignment GetBaseAlignment() const { return m_eBaseAlignment; }
    void SetBaseAlignment(VerticalAlignment alignment) { m_eBaseAlignment = alignment; }

    // Sizes met, in half-points; the range always holds 28.
    [[nodiscard]] int GetInitialFontSize() const { return m_nInitialFontSize; }
    [[nodiscard]] int GetCurrentFontSize() const { return m_nCurrentFontSize; }
    [[nodiscard]] int GetMinFontSize() const { return m_nMinFontSize; }
    [[nodiscard]] int GetMaxFontSize() const { return m_nMaxFontSize; }

    // The innermost state.
    [[nodiscard]] CStdStrW const& Font() const { return top().font.text(); }
    void SetFont(FontName const& font);
    [[nodiscard]] Charset CharSet() const { return top().charset; }
    void SetCharSet(Charset charset);
    [[nodiscard]] int PitchAndFamily() const { return top().pitchAndFamily; }
    void SetPitchAndFamily(int pitchAndFamily) { top().pitchAndFamily = pitchAndFamily; }
    [[nodiscard]] double EffectiveSize() const { return top().effectiveSize; }
    void SetEffectiveSize(double size) { top().effectiveSize = size; }
    // How many states there are.
    [[nodiscard]] int States() const { return m_nState + 1; }
    // Makes the size 1.0, whatever the style's is. Only a test calls it.
    void ResetState() { SetEffectiveSize(1.0); }

private:
    friend struct MarkupCodes;
    static constexpr int kMostStates = 32;

    struct State {
        ParagraphSettings paragraph;
        double effectiveSize = 1.0;  // of the text, drawing units
        FontName font;
        int pitchAndFamily = 0;
        Charset charset = kAnsiCharset;
    };
    // What a font code came to.
    struct ResolvedFont {
        int slot = 0;
        bool bold = false;
        bool italic = false;
        unsigned int incidents = 0;
        FontName font;  // what the state takes
        int pitchAndFamily = 0;
        Charset charset = kAnsiCharset;
    };

    // Set-up and results.
    void updateSizes(int halfPoints);
    void run(wchar_t const* text, std::size_t length);
    void startRun(wchar_t const* text);
    [[nodiscard]] CStdStrW documentHead() const;

    // The loop.
    void convert(wchar_t const* cursor);
    [[nodiscard]] wchar_t const* convertRun(wchar_t const* cursor);
    void convertBrace(wchar_t brace);
    void convertCharacter(wchar_t c);
    void convertCode(wchar_t const*& cursor);
    void appendUnicode(wchar_t c);
    void flushSize();
    [[nodiscard]] bool needsFontSwap(wchar_t c);
    void appendFontSwap(Charset charset);
    void AppendToken(wchar_t const* word);
    void AppendToken(wchar_t const* word, long long value);

    // Codes; each begins after its letter.
    void onAlignment(wchar_t const*& cursor);
    void onColorIndex(wchar_t const*& cursor);
    void onColor(wchar_t const*& cursor);
    void onFontFile(wchar_t const*& cursor);
    void onFontFace(wchar_t const*& cursor);
    void onHeight(wchar_t const*& cursor);
    void onUnderline(wchar_t const*& cursor);
    void onUnderlineOff(wchar_t const*& cursor);
    void onOverline(wchar_t const*& cursor);
    void onOverlineOff(wchar_t const*& cursor);
    void onParagraph(wchar_t const*& cursor);
    void onParagraphSettings(wchar_t const*& cursor);
    void onOblique(wchar_t const*& cursor);
    void onStack(wchar_t const*& cursor);
    void onTracking(wchar_t const*& cursor);
    void onCharWidth(wchar_t const*& cursor);
    void onUnicode(wchar_t const*& cursor);
    void onMultibyte(wchar_t const*& cursor);
    void onEscape(wchar_t const*& cursor);
    void onUnknown(wchar_t const*& cursor);

    // Fonts.
    [[nodiscard]] ResolvedFont resolveFile(FontCode const& code);
    [[nodiscard]] ResolvedFont resolveFace(FontCode const& code);
    void takeFont(ResolvedFont const& font);
    void fontChanged() { swapState_ = SwapState::unknown; }

    // Paragraphs, stacks and whole-text values.
    [[nodiscard]] int marginTwips(double value);
    [[nodiscard]] int signedMarginTwips(double value);
    void readTabs(wchar_t const*& cursor, ParagraphSettings& settings);
    void UpdateParagraphSettings(ParagraphSettings const& settings);
    void appendStack(std::wstring_view text);
    // Whether a whole-text value is the first that counts.
    [[nodiscard]] bool takesValue(bool isDefault, unsigned int late, unsigned int ignored);

    void PushState();
    void PopState();
    [[nodiscard]] State& top() { return m_aStates[static_cast<std::size_t>(m_nState)]; }
    [[nodiscard]] State const& top() const { return m_aStates[static_cast<std::size_t>(m_nState)]; }

    double m_dCurrentSize = 0.2;
    int m_nInitialFontSize = 28;
    int m_nCurrentFontSize = 28;
    int m_nMaxFontSize = 28;
    int m_nMinFontSize = 14400;
    bool m_bBold = false;
    bool m_bItalic = false;
    unsigned int m_nIncidents = 0;
    IncidentCounts incidentCounts_;
    double m_dTracking = 1.0;
    double m_dCharWidth = 1.0;
    double m_dOblique = 0.0;
    VerticalAlignment m_eBaseAlignment;
    CMTextFontMapDatabase* m_pFontMap;
    CScaleCorrection* m_pFontScale;
    CScaleCorrection* m_pMarginScale;
    int m_nPendingFontSize = 0;  // 0: none
    bool m_bStacksSeen = false;
    std::array<State, kMostStates> m_aStates;
    int m_nState = 0;

    // The run of the loop; all of it begins anew with each text.
    long long chars_ = 0;      // plain characters so far
    double lastFactor_ = 1.0;  // of the last relative height
    wchar_t const* text_ = nullptr;
    // The font codes for which a second look-up would give the same result. What the font tables
    // say changes during a run only when a code lends a proxy, and one entry may then take
    // another's place, also of another file or face. So a code that was lent a proxy is not kept,
    // and all kept codes are then forgotten. A pair of files is not kept either, as each of its
    // codes may be lent a proxy again. A map file that changes on the disk during a run is not
    // looked at.
    TextTable<ResolvedFont> fontCodes_;
    enum class SwapState { unknown, no, yes } swapState_ = SwapState::unknown;
    std::unique_ptr<StackLookAhead> stacks_;
};
