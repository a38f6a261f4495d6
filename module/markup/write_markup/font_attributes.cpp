#include "module/markup/write_markup/font_attributes.h"

#include "tz/text/code_page.h"

TzString g_sStyleFontName;

bool CFontAttributes::IsSameTypeface(CFontAttributes const& other) const {
    if (m_nPitchAndFamily != other.m_nPitchAndFamily || m_bBold != other.m_bBold ||
        m_bItalic != other.m_bItalic || !m_sFontName.isSameAs(other.m_sFontName)) {
        return false;
    }
    if (m_nCharset == other.m_nCharset) return true;
    Charset const system = TzCodePage::SysCharset();
    if (other.m_nCharset == kAnsiCharset && m_nCharset == system) return true;
    if (m_nCharset != kAnsiCharset || other.m_nCharset != system) return false;
    return other.m_sFontName.text() == g_sStyleFontName.str();
}

bool CFontAttributes::operator==(CFontAttributes const& other) const {
    return m_bUnderline == other.m_bUnderline && m_bStrikethrough == other.m_bStrikethrough &&
           m_nColorIndex == other.m_nColorIndex && m_dSize == other.m_dSize &&
           IsSameTypeface(other);
}
