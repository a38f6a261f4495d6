#include "module/align/setting_texts.h"

#include <array>

#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"

namespace {

struct Justification {
    tagTextDirection direction;
    wchar_t const* keyword;
    unsigned int description;
};
constexpr std::array<Justification, 12> kJustifications{{
    {tagTextDirection::TL, L"TL", kText.alignTopLeft},
    {tagTextDirection::TC, L"TC", kText.alignTopCentre},
    {tagTextDirection::TR, L"TR", kText.alignTopRight},
    {tagTextDirection::ML, L"ML", kText.alignMiddleLeft},
    {tagTextDirection::MC, L"MC", kText.alignMiddleCentre},
    {tagTextDirection::MR, L"MR", kText.alignMiddleRight},
    {tagTextDirection::BL, L"BL", kText.alignBottomLeft},
    {tagTextDirection::BC, L"BC", kText.alignBottomCentre},
    {tagTextDirection::BR, L"BR", kText.alignBottomRight},
    {tagTextDirection::Left, L"Left", kText.alignLeft},
    {tagTextDirection::Center, L"Center", kText.alignCentre},
    {tagTextDirection::Right, L"Right", kText.alignRight},
}};

struct OptionTexts {
    wchar_t const* name;
    wchar_t const* keyword;
    unsigned int description;
};
constexpr std::array<OptionTexts, 4> kOptions{{
    {L"Distribute", L"Distribute", kText.spacingDistribute},
    {L"CurrentSpaceHorizontal", L"Horizontal", kText.spacingHorizontal},
    {L"CurrentSpaceVertical", L"Vertical", kText.spacingVertical},
    {L"SpecificSpace", L"Set", kText.spacingSet},
}};

// The descriptions of a table, in its order.
template <class Row, std::size_t N>
std::array<TzString, N> descriptionsOf(std::array<Row, N> const& rows) {
    std::array<TzString, N> texts;
    for (std::size_t i = 0; i < N; ++i)
        texts[i] = gStringTable[rows[i].description];
    return texts;
}

std::array<TzString, kJustifications.size()> const& justificationTexts() {
    static auto const texts = descriptionsOf(kJustifications);
    return texts;
}

std::array<TzString, kOptions.size()> const& optionTexts() {
    static auto const texts = descriptionsOf(kOptions);
    return texts;
}

}  // namespace

TzString descriptionOf(tagTextDirection direction) {
    for (std::size_t i = 0; i < kJustifications.size(); ++i)
        if (kJustifications[i].direction == direction) return justificationTexts()[i];
    return TzString();
}

tagTextDirection directionOf(TzString const& answer) {
    for (std::size_t i = 0; i < kJustifications.size(); ++i)
        if (answer == kJustifications[i].keyword || answer == justificationTexts()[i])
            return kJustifications[i].direction;
    return tagTextDirection::TL;
}

TzString descriptionOfOption(TzString const& name) {
    for (std::size_t i = 0; i < kOptions.size(); ++i)
        if (name == kOptions[i].name) return optionTexts()[i];
    return TzString();
}

TzString optionNameOf(TzString const& keyword) {
    for (OptionTexts const& option : kOptions)
        if (keyword == option.keyword) return option.name;
    return TzString();
}
