#include "module/markup/write_markup/font_state.h"

#include "tz/mte/font_map_database.h"

CFontState::CFontState(CFontState* other)
    : m_pFontMap(other->m_pFontMap), m_current(other->m_current), m_bPending(true),
      m_pRestoreTo(other) {}

CFontState::~CFontState() {
    if (!m_pRestoreTo) return;
    m_pRestoreTo->restore(m_current);
    m_pRestoreTo = nullptr;
}

void CFontState::SetValuesFrom(CFontState const* other) {
    restore(other->m_current);
}

void CFontState::restore(CFontAttributes const& kept) {
    m_current = kept;
    m_bPending = true;
}

void CFontState::SetFontName(FontName const& name) {
    m_current.m_sFontName = name;
    m_bPending = true;
}

void CFontState::SetCharSet(Charset charset) {
    m_current.m_nCharset = charset;
    m_bPending = true;
}

void CFontState::SetPitchAndFamily(int pitchAndFamily) {
    m_current.m_nPitchAndFamily = pitchAndFamily;
    m_bPending = true;
}

void CFontState::SetBold(bool isOn) {
    m_current.m_bBold = isOn;
    m_bPending = true;
}

void CFontState::SetItalic(bool isOn) {
    m_current.m_bItalic = isOn;
    m_bPending = true;
}

void CFontState::SetUnderline(bool isOn) {
    m_current.m_bUnderline = isOn;
    m_bPending = true;
}

void CFontState::SetStrikethrough(bool isOn) {
    m_current.m_bStrikethrough = isOn;
    m_bPending = true;
}

void CFontState::SetColor(int index, unsigned int rgb) {
    m_current.m_nColorIndex = index;
    m_current.m_nRGB = rgb;
    m_bPending = true;
}

void CFontState::SetFontSize(double size) {
    m_current.m_dSize = size;
    m_bPending = true;
}

void CFontState::SetBaseAlignment(VerticalAlignment alignment, signed char bForce) {
    m_current.m_eBaseAlignment = alignment;
    m_bPending = true;
    if (bForce) m_emitted.m_eBaseAlignment = static_cast<VerticalAlignment>(-1);
}

VerticalAlignment CFontState::GetBaseAlignment(signed char bBase) const {
    return bBase ? m_base.m_eBaseAlignment : m_current.m_eBaseAlignment;
}

void CFontState::InitializeFontName(
    FontName const& name, bool bold, bool italic, Charset charset, int pitchAndFamily) {
    m_current.m_sFontName = name;
    m_current.m_bBold = bold;
    m_current.m_bItalic = italic;
    m_current.m_nCharset = charset;
    m_current.m_nPitchAndFamily = pitchAndFamily;
    m_emitted = m_current;
    m_base = m_emitted;
    g_sStyleFontName = TzString(static_cast<std::wstring const&>(name.text()));
}

void CFontState::InitializeColor(int index, unsigned int rgb) {
    for (CFontAttributes* look : {&m_current, &m_emitted, &m_base}) {
        look->m_nColorIndex = index;
        look->m_nRGB = rgb;
    }
}

void CFontState::InitializeFontSize(double size) {
    for (CFontAttributes* look : {&m_current, &m_emitted, &m_base})
        look->m_dSize = size;
}

void CFontState::Reset() {
    m_emitted = m_current;
    m_bPending = false;
}
