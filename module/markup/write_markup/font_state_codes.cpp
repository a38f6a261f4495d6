// What the difference between two looks is in MTEXT codes.

#include "module/fonts/font_entry.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/shared/rtf_color_table.h"
#include "module/markup/write_markup/font_state.h"
#include "tz/gi/color.h"
#include "tz/mte/font_map_database.h"
#include "tz/text/code_page.h"
#include "tz/text/font_info.h"

namespace {

void appendNumberCode(CStdStrW& codes, wchar_t const* code, long long value) {
    codes += code;
    appendDecimal(codes, value);
    codes += L';';
}

void appendSwitch(CStdStrW& codes, bool isOn, bool wasOn, wchar_t const* on, wchar_t const* off) {
    if (isOn != wasOn) codes += isOn ? on : off;
}

}  // namespace

CStdStrW CFontState::EmitStateInMText() {
    forgetFaceCodes();  // the caller may have lent a proxy since the last call
    CStdStrW codes;
    appendState(codes);
    return codes;
}

void CFontState::appendState(CStdStrW& codes) {
    if (appendBrace(codes)) return;
    if (!m_current.IsSameTypeface(m_emitted)) codes += faceCode();
    appendSize(codes);
    appendSwitch(codes, m_current.m_bUnderline, m_emitted.m_bUnderline, L"\\L", L"\\l");
    appendSwitch(codes, m_current.m_bStrikethrough, m_emitted.m_bStrikethrough, L"\\O", L"\\o");
    appendColor(codes);
}

// True when closing the group restores this look, so that no code is needed. Looks are not compared
// symmetrically, so a look may return to the outermost one while no brace is open; none is closed
// then.
bool CFontState::appendBrace(CStdStrW& codes) {
    if (m_current == m_emitted) return false;
    if (m_nBraceDepth > 0 && m_current == m_base) {
        codes += L'}';
        --m_nBraceDepth;
        return true;
    }
    if (m_emitted == m_base) {
        codes += L'{';
        ++m_nBraceDepth;
    }
    return false;
}

std::size_t CFontState::FaceKeyHash::operator()(FaceKey const& key) const {
    std::size_t const styles = (key.bold ? 1U : 0U) + (key.italic ? 2U : 0U);
    std::size_t const numbers = static_cast<unsigned int>(key.charset) * 0x9E3779B1U +
                                static_cast<unsigned int>(key.pitch) * 4U + styles;
    return std::hash<void const*>()(key.name) + numbers * 0x9E3779B97F4A7C15U;
}

CStdStrW const& CFontState::faceCode() {
    FaceKey const key{m_current.m_sFontName.identity(), m_current.m_bBold, m_current.m_bItalic,
                      m_current.m_nCharset, m_current.m_nPitchAndFamily};
    auto const [at, isNew] = faceCodes_.try_emplace(key);
    if (isNew) at->second = {m_current.m_sFontName, newFaceCode()};
    return at->second.code;
}

CStdStrW CFontState::fileCode(CStdStrW const& file) const {
    CStdStrW code = L"\\F" + file;
    appendNumberCode(code, L"|c", m_current.m_nCharset);
    return code;
}

// Written as a file when the font map has one for the face, else as a face. The file form keeps
// charset 1; the face form writes the system's charset in its place. Only for the face of the pairs
// may the file also be one of the machine's; for others the table decides.
CStdStrW CFontState::newFaceCode() const {
    CStdStrW const& name = m_current.m_sFontName.text();
    bool const bold = m_current.m_bBold;
    bool const italic = m_current.m_bItalic;
    int const pitch = m_current.m_nPitchAndFamily;
    Charset const system = TzCodePage::SysCharset();
    if (m_pFontMap->IsBigfontProxyFont(name)) {
        auto type = CMTextFontMapDatabase::MapTypeSystem;
        return fileCode(m_pFontMap->MapFontToFile(type, name, bold, italic, system, pitch));
    }
    auto const* const entry =
        fontEntry(*m_pFontMap, name, bold, italic, m_current.m_nCharset, pitch);
    bool const isMapped = entry && entry->m_eMapType != CMTextFontMapDatabase::MapTypeSystem;
    if (isMapped && !entry->m_sFileName.empty()) return fileCode(entry->m_sFileName);
    CStdStrW code = L"\\f" + (isMapped ? name : tzFontInfo().TypefaceNativeToEnglish(name));
    code += bold ? L"|b1" : L"|b0";
    code += italic ? L"|i1" : L"|i0";
    code += L"|c";
    appendDecimal(code, m_current.m_nCharset == kDefaultCharset ? system : m_current.m_nCharset);
    appendNumberCode(code, L"|p", pitch);
    return code;
}

// Written as a factor of the last size, to four digits. The rounding adds up over a text; this is
// kept.
void CFontState::appendSize(CStdStrW& codes) const {
    double const emitted = m_emitted.m_dSize;
    if (m_current.m_dSize == emitted || emitted == 0.0) return;
    codes += L"\\H";
    appendReal(codes, m_current.m_dSize / emitted, 4);
    codes += L"x;";
}

void CFontState::appendColor(CStdStrW& codes) const {
    int const index = m_current.m_nColorIndex;
    unsigned int const rgb = m_current.m_nRGB;
    if (index == m_emitted.m_nColorIndex && rgb == m_emitted.m_nRGB) return;
    appendNumberCode(codes, L"\\C", index);
    if (index != kByBlockIndex && index != kByLayerIndex && tzedGetRGB(index) != rgb)
        appendNumberCode(codes, L"\\c", static_cast<int>(rgb));
}

CStdStrW CFontState::EmitTerminatingStateInMText() {
    CStdStrW const braces(std::wstring(static_cast<std::size_t>(m_nBraceDepth), L'}'));
    m_nBraceDepth = 0;
    return braces;
}
