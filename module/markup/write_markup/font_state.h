#pragma once

#include <unordered_map>

#include "module/markup/write_markup/font_attributes.h"
#include "tz/text/std_str.h"

class CMTextFontMapDatabase;

// Turns what a text is to look like into MTEXT formatting codes: it keeps what the next character
// must look like, what the output was last told, and the look at the outermost level, and writes
// the difference.
//
//   CFontState state(&fonts);
//   state.InitializeFontName(L"Arial", false, false, kAnsiCharset, 34);   // first: sets all
//   state.InitializeFontSize(2.5);
//   state.InitializeColor(256, 0xFFFFFF);
//   state.SetUnderline(true);
//   if (state.IsEmissionPending()) { out += state.EmitStateInMText(); state.Reset(); }   // {\L
//   out += state.EmitTerminatingStateInMText();                                          // }
//
// The font map must outlive the state; one state serves one conversion. InitializeFontName writes
// process-wide state, the name of the text style's face (g_sStyleFontName), so that states are not
// used side by side.
class CFontState {
public:
    explicit CFontState(CMTextFontMapDatabase* fontMap) : m_pFontMap(fontMap) {}
    // Copies the other state's present look, and makes the copy that state's present look again at
    // its own end. Never emits.
    explicit CFontState(CFontState* other);
    virtual ~CFontState();
    CFontState(CFontState const&) = delete;
    CFontState& operator=(CFontState const&) = delete;

    // Takes over the other state's present look.
    void SetValuesFrom(CFontState const* other);

    // These change the present look and leave it pending, even when the value is the same as
    // before.
    void SetFontName(FontName const& name);
    void SetCharSet(Charset charset);
    void SetPitchAndFamily(int pitchAndFamily);
    void SetBold(bool isOn);
    void SetItalic(bool isOn);
    void SetUnderline(bool isOn);
    void SetStrikethrough(bool isOn);
    void SetColor(int index, unsigned int rgb);
    void SetFontSize(double size);
    // `bForce` non-zero: what was emitted counts as another alignment.
    void SetBaseAlignment(VerticalAlignment alignment, signed char bForce);
    // The alignment of the outermost level when `bBase` is non-zero, else that of the present look.
    [[nodiscard]] VerticalAlignment GetBaseAlignment(signed char bBase) const;

    // Set the look with which the text begins, and leave nothing pending. InitializeFontName
    // overwrites what the other two set.
    void InitializeFontName(
        FontName const& name, bool bold, bool italic, Charset charset, int pitchAndFamily);
    void InitializeColor(int index, unsigned int rgb);
    void InitializeFontSize(double size);

    [[nodiscard]] bool IsEmissionPending() const { return m_bPending; }
    // To be called when the codes of EmitStateInMText are written.
    void Reset();
    // The codes from what was emitted to the present look. A return to the outermost look is the
    // closing brace alone.
    [[nodiscard]] CStdStrW EmitStateInMText();
    // Closing braces for all groups that are still open.
    [[nodiscard]] CStdStrW EmitTerminatingStateInMText();

protected:
    // Appends to `codes` what EmitStateInMText gives, but keeps the code of each face for later
    // calls. When the font tables change between two calls, forgetFaceCodes must be called.
    void appendState(CStdStrW& codes);
    void forgetFaceCodes() { faceCodes_.clear(); }
    [[nodiscard]] CFontAttributes const& base() const { return m_base; }
    [[nodiscard]] CFontAttributes const& current() const { return m_current; }
    // Back to a look that was kept.
    void restore(CFontAttributes const& kept);

private:
    struct FaceKey {
        void const* name;
        bool bold;
        bool italic;
        Charset charset;
        int pitch;
        bool operator==(FaceKey const&) const = default;
    };
    struct FaceKeyHash {
        std::size_t operator()(FaceKey const& key) const;
    };
    struct FaceCode {
        FontName name;  // keeps the key's name alive
        CStdStrW code;
    };

    [[nodiscard]] bool appendBrace(CStdStrW& codes);
    [[nodiscard]] CStdStrW const& faceCode();
    [[nodiscard]] CStdStrW newFaceCode() const;
    [[nodiscard]] CStdStrW fileCode(CStdStrW const& file) const;
    void appendSize(CStdStrW& codes) const;
    void appendColor(CStdStrW& codes) const;

    CMTextFontMapDatabase* m_pFontMap;
    CFontAttributes m_current;
    CFontAttributes m_emitted;
    CFontAttributes m_base;
    bool m_bPending = false;
    int m_nBraceDepth = 0;
    CFontState* m_pRestoreTo = nullptr;
    std::unordered_map<FaceKey, FaceCode, FaceKeyHash> faceCodes_;  // as far as written
};
