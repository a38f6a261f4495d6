#include "module/markup/shared/rtf_color_table.h"

#include "module/markup/shared/number_text.h"
#include "tz/gi/color.h"

namespace {

int nearestIndex(unsigned int rgb) {
    TzCmEntityColor color;
    color.setColorMethod(TzCmEntityColor::kByColor);
    color.setRed(static_cast<std::uint8_t>(rgb));
    color.setGreen(static_cast<std::uint8_t>(rgb >> 8));
    color.setBlue(static_cast<std::uint8_t>(rgb >> 16));
    return color.colorIndex();
}

void appendComponent(CStdStrW& text, wchar_t const* word, unsigned int value) {
    text += word;
    appendDecimal(text, value & 0xFF);
}

}  // namespace

int CRichTextColorTable::FindColor(unsigned int rgb) const {
    auto const at = firstPlaces_.find(rgb);
    return at == firstPlaces_.end() ? -1 : at->second;
}

int CRichTextColorTable::AddColor(unsigned int rgb, bool bForce) {
    int const place = static_cast<int>(m_aColors.size());
    auto const [at, isNew] = firstPlaces_.try_emplace(rgb, place);
    if (!isNew && !bForce) return at->second;
    m_aColors.push_back(rgb);
    return place;
}

int CRichTextColorTable::AddColor(int index, bool bForce) {
    return AddColor(GetRGB(index, m_nByLayerColor, m_nByBlockColor), bForce);
}

unsigned int CRichTextColorTable::GetRGB(int index, unsigned int byLayer, unsigned int byBlock) {
    if (index == kByLayerIndex) return byLayer;
    return index == kByBlockIndex ? byBlock : tzedGetRGB(index);
}

bool CRichTextColorTable::GetColor(int number, unsigned int& rgb) const {
    rgb = 0;
    if (number < 0 || static_cast<std::size_t>(number) >= m_aColors.size()) return false;
    rgb = m_aColors[static_cast<std::size_t>(number)];
    return true;
}

bool CRichTextColorTable::GetColor(int number, int* index) const {
    unsigned int rgb = 0;
    bool const isThere = GetColor(number, rgb);
    *index = isThere ? GetTzadIndex(rgb) : 0;
    return isThere;
}

int CRichTextColorTable::GetTzadIndex(unsigned int rgb) const {
    if (rgb == m_nByLayerColor) return kByLayerIndex;
    if (rgb == m_nByBlockColor) return kByBlockIndex;
    auto const [at, isNew] = nearestIndices_.try_emplace(rgb, 0);
    if (isNew) at->second = nearestIndex(rgb);
    return at->second;
}

CStdStrW CRichTextColorTable::EmitColorTable() const {
    CStdStrW text(L"{\\colortbl");
    for (unsigned int const rgb : m_aColors) {
        appendComponent(text, L"\\red", rgb);
        appendComponent(text, L"\\green", rgb >> 8);
        appendComponent(text, L"\\blue", rgb >> 16);
        text += L';';
    }
    text += L'}';
    return text;
}
