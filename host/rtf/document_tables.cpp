// The tables of fonts, colours and styles.

#include <algorithm>

#include "host/rtf/document.h"
#include "host/rtf/words.h"

namespace tzhost {

void RtfDocument::beginEntry(Destination entry) {
    state_.set(RtfField::destination, entry);
    entryDepth_ = state_.depth();
    if (entry == kFont) return;
    styleNumber_ = styleBase_ = kRtfUnset;
    styleKind_ = RtfStyleKind::paragraph;
    for (std::size_t i = 0; i < kRtfStyleFields; ++i)
        state_.set(static_cast<RtfField>(i), kRtfUnset);
}

// Also of an entry that the text cuts off.
void RtfDocument::endEntry() {
    entryDepth_ = 0;
    if (destination() == kFont) fonts_.endFont();
    if (destination() != kStyle) return;
    RtfStyleValues values;
    for (std::size_t i = 0; i < values.size(); ++i)
        values[i] = state_.get(static_cast<RtfField>(i));
    styles_.define(styleKind_, styleNumber_ == kRtfUnset ? 0 : styleNumber_, styleBase_, values);
}

void RtfDocument::takeFontWord(RtfToken const& token) {
    if (token.text == "u") {
        substitutes_ = std::max(0, state_.get(RtfField::substitutes));
        putCharacter(static_cast<wchar_t>(token.value & 0xFFFF));
    } else {
        fonts_.takeWord(token.text, token.value);
    }
}

// The words of looks and paragraphs are those of text.
void RtfDocument::takeStyleWord(RtfToken const& token) {
    if (RtfWords::beginsStyle(token)) {
        styleNumber_ = token.value;
        styleKind_ = token.text == "s" ? RtfStyleKind::paragraph : RtfStyleKind::character;
    } else if (token.text == "sbasedon") {
        styleBase_ = token.value;
    } else if (token.text == "ds" || token.text == "ts") {
        state_.set(RtfField::destination, kSkipped);  // of sections and tables
    } else if (auto const* const row = RtfWords::find(token.text); row && row->isSetting()) {
        (this->*row->handler)(token, row->argument);
    }
}

void RtfDocument::takeTableText(std::string_view text) {
    switch (destination()) {
    case kFontTable:
    case kFont:
        for (char const c : text) {
            if (c == ';')
                fonts_.endFont();
            else
                fonts_.takeLetter(c);
        }
        break;
    case kColorTable:
        for (char const c : text) {
            if (c == ';') colors_.endColor();
        }
        break;
    default: break;
    }
}

}  // namespace tzhost
