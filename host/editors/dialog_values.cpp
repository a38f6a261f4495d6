#include "host/editors/dialog_values.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "host/files/json_events.h"
#include "host/settings/variable_value.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/db/symbol_table.h"
#include "tz/mte/easy_object.h"

namespace tzhost {
namespace {

using State = CMTextEditorInterface;

constexpr int kByLayer = 256;
constexpr int kByBlock = 0;
constexpr double kLeastSpacing = 0.25;
constexpr double kMostSpacing = 4.0;
// For a scale beyond these the entity would refuse the whole background.
constexpr double kLeastFillScale = 1.0;
constexpr double kMostFillScale = 5.0;
// In the names of styles that an external reference brought along.
constexpr wchar_t kReferenceSign = L'|';

// Nothing unless the whole text is a number from `least` to `most`.
std::optional<double> realWithin(std::wstring_view text, double least, double most) {
    std::optional<double> const value = readReal(text);
    return value && *value >= least && *value <= most ? value : std::nullopt;
}

std::optional<int> wholeWithin(std::wstring_view text, int least, int most) {
    std::optional<double> const value = realWithin(text, least, most);
    if (!value || std::floor(*value) != *value) return {};
    return static_cast<int>(*value);
}

// The components of `#RRGGBB` as 0xRRGGBB.
std::optional<unsigned int> readTrueColor(std::wstring_view text) {
    constexpr std::size_t kLength = 7;
    constexpr std::wstring_view kDigits = L"0123456789abcdef";
    if (text.size() != kLength || text.front() != L'#') return {};
    unsigned int value = 0;
    for (wchar_t const c : text.substr(1)) {
        std::size_t const digit = kDigits.find(c >= L'A' && c <= L'F' ? c - L'A' + L'a' : c);
        if (digit == kDigits.npos) return {};
        value = value * 16 + static_cast<unsigned int>(digit);
    }
    return value;
}

std::optional<TzCmColor> readColor(std::wstring_view text) {
    TzCmColor color;
    if (auto const rgb = readTrueColor(text)) {
        color.setRGB(static_cast<std::uint8_t>(*rgb >> 16), static_cast<std::uint8_t>(*rgb >> 8),
                     static_cast<std::uint8_t>(*rgb));
        return color;
    }
    std::optional<int> const index = wholeWithin(text, kByBlock, kByLayer);
    if (!index) return {};
    (void)color.setColorIndex(*index);  // in range
    return color;
}

std::wstring writeTrueColor(unsigned int colorref) {
    constexpr wchar_t const* kDigits = L"0123456789ABCDEF";
    std::wstring text(L"#");
    for (int shift = 0; shift < 24; shift += 8) {
        text += kDigits[colorref >> (shift + 4) & 0xF];
        text += kDigits[colorref >> shift & 0xF];
    }
    return text;
}

std::wstring writeColor(TzCmColor const& color) {
    return color.isByColor() ? writeTrueColor(color.getCOLORREF())
                             : std::to_wstring(color.colorIndex());
}

// What a drawing file has in quotes may stand so here, too.
std::wstring withoutQuotes(std::wstring_view text) {
    if (!text.starts_with(L'"')) return std::wstring(text);
    JsonDocument const document = readJson(toUtf8(text));
    bool const isText = !document.failed && document.root.kind == JsonKind::text;
    return isText ? fromUtf8(document.root.text) : std::wstring(text);
}

DialogChange readHeight(State const&, std::wstring_view text) {
    auto const height = readReal(text);
    if (!height || *height <= 0) return {};
    return [value = *height](State& state) { state.SetNominalTextSize(value); };
}

DialogChange readAttachment(State const&, std::wstring_view text) {
    auto const attachment = wholeWithin(text, 1, 9);
    if (!attachment) return {};
    return [value = *attachment](State& state) {
        state.SetAlignment(static_cast<State::Alignment>(value));
    };
}

DialogChange readWidth(State const&, std::wstring_view text) {
    auto const width = readReal(text);
    if (!width || *width < 0) return {};
    return [value = *width](State& state) { state.SetWidth(value); };
}

DialogChange readRotation(State const&, std::wstring_view text) {
    auto const radians = readReal(text);
    if (!radians) return {};
    return [value = *radians](State& state) { state.SetRotation(value); };
}

// Whether the session can have the style: styles of external references are left out of its list,
// and a document in a style that it lacks becomes a message in the place of the text.
bool isStyle(std::wstring const& name) {
    EasyObject<TzDbTextStyleTable> styles;
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    return name.find(kReferenceSign) == name.npos && database &&
           database->getTextStyleTable(styles.object, TzDb::kForRead) == Tzad::eOk &&
           styles->has(name.c_str());
}

DialogChange readStyle(State const&, std::wstring_view text) {
    std::wstring const name = withoutQuotes(text);
    if (!isStyle(name)) return {};
    return [name](State& state) { state.SetStyle(name); };
}

DialogChange readSpacingStyle(State const&, std::wstring_view text) {
    auto const style = wholeWithin(text, State::kSpacingAtLeast, State::kSpacingExactly);
    if (!style) return {};
    return [value = *style](State& state) {
        state.SetLineSpacingStyle(static_cast<State::LineSpacingStyle>(value));
    };
}

DialogChange readSpacingFactor(State const&, std::wstring_view text) {
    auto const factor = realWithin(text, kLeastSpacing, kMostSpacing);
    if (!factor) return {};
    return [value = *factor](State& state) { state.SetLineSpacingFactor(value); };
}

// The state has the colours of the layer and the block as they look.
DialogChange readTextColor(State const& state, std::wstring_view text) {
    auto const color = readColor(withoutQuotes(text));
    if (!color) return {};
    unsigned int const rgb = color->isByLayer()   ? state.GetByLayerColor()
                             : color->isByBlock() ? state.GetByBlockColor()
                                                  : color->getCOLORREF();
    return [rgb](State& changed) { changed.SetInitialColor(rgb); };
}

std::wstring showTextColor(State const& state) {
    unsigned int const rgb = state.GetInitialColor();
    if (rgb == state.GetByLayerColor()) return std::to_wstring(kByLayer);
    if (rgb == state.GetByBlockColor()) return std::to_wstring(kByBlock);
    return writeTrueColor(rgb);
}

// The members of a background.
DialogChange readFill(JsonValue const& value) {
    if (value.kind != JsonKind::flag) return {};
    return [on = value.flag](State& state) { state.SetBackgroundFill(on ? 1 : 0); };
}

DialogChange readFillColor(JsonValue const& value) {
    if (value.kind != JsonKind::number && value.kind != JsonKind::text) return {};
    auto const color = readColor(fromUtf8(value.text));
    if (!color) return {};
    return [color = *color](State& state) { state.SetBackgroundFillColor(color); };
}

DialogChange readFillScale(JsonValue const& value) {
    bool const isInRange = value.number >= kLeastFillScale && value.number <= kMostFillScale;
    if (value.kind != JsonKind::number || !isInRange) return {};
    return [scale = value.number](State& state) { state.SetBackgroundFillScale(scale); };
}

DialogChange readFillUse(JsonValue const& value) {
    if (value.kind != JsonKind::flag) return {};
    return [use = value.flag](State& state) { state.SetBackgroundFillUseBackgroundColor(use); };
}

DialogChange readFillTransparency(JsonValue const& value) {
    TzCmTransparency transparency;
    if (value.kind != JsonKind::number) return {};
    auto const percent = wholeWithin(fromUtf8(value.text), 0, 100);
    if (!percent || transparency.setPercent(*percent) != Tzad::eOk) return {};
    return [transparency](State& state) { state.SetBackgroundFillTransparency(transparency); };
}

struct BackgroundRow {
    char const* name;
    DialogChange (*read)(JsonValue const& value);
};
constexpr BackgroundRow kBackground[] = {
    {"fill", readFill},
    {"color", readFillColor},
    {"scale", readFillScale},
    {"useBackgroundColor", readFillUse},
    {"transparency", readFillTransparency},
};

// Members that are left out stay as they are.
DialogChange readBackground(State const&, std::wstring_view text) {
    JsonDocument const document = readJson(toUtf8(text));
    if (document.failed || document.root.kind != JsonKind::object) return {};
    std::vector<DialogChange> changes;
    for (auto const& [name, value] : document.root.members) {
        auto const* const row = std::ranges::find_if(
            kBackground, [key = name](auto const& each) { return key == each.name; });
        DialogChange change = row == std::end(kBackground) ? DialogChange() : row->read(value);
        if (!change) return {};
        changes.push_back(std::move(change));
    }
    return [changes](State& state) {
        for (DialogChange const& change : changes)
            change(state);
    };
}

std::wstring truth(bool value) {
    return value ? L"true" : L"false";
}

std::wstring showBackground(State const& state) {
    TzCmColor const color = state.GetBackgroundFillColor();
    std::wstring const quote(color.isByColor() ? L"\"" : L"");
    return L"{\"fill\": " + truth(state.GetBackgroundFill() != 0) + L", \"color\": " + quote +
           writeColor(color) + quote + L", \"scale\": " +
           writeReal(state.GetBackgroundFillScale()) + L", \"useBackgroundColor\": " +
           truth(state.GetBackgroundFillUseBackgroundColor()) + L", \"transparency\": " +
           std::to_wstring(state.GetBackgroundFillTransparency().percent()) + L"}";
}

constexpr DialogValue kValues[] = {
    {forLocalText(L"textHeight"), forLocalText(L"a number above 0"),
     [](State const& state) { return writeReal(state.GetNominalTextSize()); }, readHeight},
    {forLocalText(L"attachment"), forLocalText(L"1 to 9, from top left to bottom right"),
     [](State const& state) { return std::to_wstring(state.GetAlignment()); }, readAttachment},
    {forLocalText(L"width"), forLocalText(L"a number, 0 or more"),
     [](State const& state) { return writeReal(state.GetWidth()); }, readWidth},
    {forLocalText(L"rotation"), forLocalText(L"a number, in radians"),
     [](State const& state) { return writeReal(state.GetRotation()); }, readRotation},
    {forLocalText(L"style"), forLocalText(L"the name of a text style"),
     [](State const& state) -> std::wstring { return state.GetStyle(); }, readStyle},
    {forLocalText(L"lineSpacingStyle"), forLocalText(L"1 for at least or 2 for exactly"),
     [](State const& state) { return std::to_wstring(state.GetLineSpacingStyle()); },
     readSpacingStyle},
    {forLocalText(L"lineSpacingFactor"), forLocalText(L"a number from 0.25 to 4"),
     [](State const& state) { return writeReal(state.GetLineSpacingFactor()); }, readSpacingFactor},
    {forLocalText(L"color"), forLocalText(L"0 to 256 or #RRGGBB"), showTextColor, readTextColor},
    {forLocalText(L"background"), forLocalText(L"{\"fill\": true} or other members in braces"),
     showBackground, readBackground},
};

}  // namespace

std::span<DialogValue const> dialogValues() {
    return kValues;
}

DialogValue const* findDialogValue(std::wstring_view name) {
    auto const* const row =
        std::ranges::find_if(kValues, [&](DialogValue const& each) { return name == each.name; });
    return row == std::end(kValues) ? nullptr : row;
}

void DialogChanges::store(CMTextEditorInterface& state) const {
    for (DialogChange const& change : changes_)
        change(state);
}

}  // namespace tzhost
