#include "module/markup/shared/rtf_font_table.h"

#include <algorithm>
#include <limits>
#include <vector>

#include "module/fonts/table_key.h"
#include "module/markup/shared/font_families.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/shared/rtf_escapes.h"
#include "tz/text/code_page.h"

namespace {

// The key by which a font is found again, without regard to case.
TableKey keyOf(wchar_t const* name, Charset charset, int pitch) {
    return descriptionKey(name ? name : L"", false, false, charset, pitch);
}

void appendFont(CStdStrW& text, int slot, CRichTextFontTable::Record const& font) {
    text += L"{\\f";
    appendDecimal(text, slot);
    text += L'\\';
    text += familyWord(font.pitchAndFamily);
    if (int const pitch = font.pitchAndFamily & 0xF; pitch != 0) {
        text += L"\\fprq";
        appendDecimal(text, pitch);
    }
    text += L"\\fcharset";
    appendDecimal(text, font.charset);
    text += L' ';
    text += HandleEscaped8Bits(font.name.text(), TzCodePage::CharSetToCodePageId(font.charset));
    text += L";}";
}

}  // namespace

int CRichTextFontTable::FindFont(wchar_t const* name, Charset charset, int pitch) {
    if (!isIndexed_) indexSlots();
    auto const at = firstSlots_.find(keyOf(name, charset, pitch).view());
    return at == firstSlots_.end() ? -1 : at->second;
}

int CRichTextFontTable::AddFont(wchar_t const* name, Charset charset, int pitch) {
    if (int const slot = FindFont(name, charset, pitch); slot >= 0) return slot;
    int const slot = static_cast<int>(length_++);
    firstSlots_.try_emplace(std::wstring(keyOf(name, charset, pitch).view()), slot);
    m_aFonts[slot] = {charset, pitch, name};
    return slot;
}

void CRichTextFontTable::AddFont(long long slot, wchar_t const* name, Charset charset, int pitch) {
    if (slot < 0 || slot > std::numeric_limits<int>::max()) return;
    m_aFonts[static_cast<int>(slot)] = {charset, pitch, name};
    length_ = std::max(length_, slot + 1);
    isIndexed_ = false;
}

bool CRichTextFontTable::GetFont(int slot, CStdStrW& name, Charset& charset, int& pitch) const {
    auto const at = m_aFonts.find(slot);
    Record const shown = at == m_aFonts.end() ? Record() : at->second;
    name = shown.name.text();
    charset = shown.charset;
    pitch = shown.pitchAndFamily;
    return at != m_aFonts.end();
}

CStdStrW CRichTextFontTable::EmitFontTable() const {
    std::vector<int> slots;
    slots.reserve(m_aFonts.size());
    for (auto const& font : m_aFonts)
        slots.push_back(font.first);
    std::sort(slots.begin(), slots.end());
    CStdStrW text(L"{\\fonttbl");
    for (int const slot : slots)
        appendFont(text, slot, m_aFonts.at(slot));
    text += L'}';
    return text;
}

CRichTextFontTable::Record const* CRichTextFontTable::fontAt(int slot) {
    auto const at = m_aFonts.find(slot);
    if (at == m_aFonts.end()) return nullptr;
    Record& font = at->second;
    if (!font.isInterned) font.name = names_.intern(font.name.text());
    font.isInterned = true;
    return &font;
}

void CRichTextFontTable::indexSlots() {
    firstSlots_.clear();
    for (auto const& [slot, font] : m_aFonts) {
        TableKey const key = keyOf(font.name.text().c_str(), font.charset, font.pitchAndFamily);
        auto const [at, isNew] = firstSlots_.try_emplace(std::wstring(key.view()), slot);
        if (!isNew) at->second = std::min(at->second, slot);
    }
    isIndexed_ = true;
}
