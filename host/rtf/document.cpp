// Groups, and what becomes of each token.

#include "host/rtf/document.h"

#include <algorithm>
#include <utility>

#include "host/rtf/words.h"

namespace tzhost {

using Kind = RtfToken::Kind;

void RtfDocument::take(RtfToken const& token) {
    if (substitutes_ > 0 && skips(token)) return;
    if (token.kind != Kind::byte && token.kind != Kind::text) endBytes();
    switch (token.kind) {
    case Kind::open: onOpen(); break;
    case Kind::close: onClose(); break;
    case Kind::word: onWord(token); break;
    case Kind::symbol: onSymbol(token.text.front()); break;
    case Kind::text: onText(token.text); break;
    case Kind::byte: onByte(static_cast<unsigned char>(token.value)); break;
    case Kind::end: break;
    }
}

// Whether the token as a whole stands for the `\u` before it. Of a run of text, the characters
// that do are stepped over when it is read; a brace or a word that is no character ends them all.
bool RtfDocument::skips(RtfToken const& token) {
    bool const isName = token.kind == Kind::word && RtfWords::isCharacter(token.text);
    bool const isCharacter = token.kind == Kind::byte || token.kind == Kind::symbol || isName;
    if (isCharacter)
        --substitutes_;
    else if (token.kind != Kind::text)
        substitutes_ = 0;
    return isCharacter;
}

void RtfDocument::onOpen() {
    isStarred_ = false;
    state_.open();
    switch (destination()) {
    case kFontTable: beginEntry(kFont); break;
    case kStyleSheet: beginEntry(kStyle); break;
    case kBothForms: state_.set(RtfField::destination, kOneForm); break;
    default: break;
    }
}

// A closing brace too many is stepped over, so that what follows it is read.
void RtfDocument::onClose() {
    isStarred_ = false;
    if (entryDepth_ != 0 && state_.depth() == entryDepth_) endEntry();
    (void)state_.close();
}

void RtfDocument::onWord(RtfToken const& token) {
    bool const isStarred = std::exchange(isStarred_, false);
    RtfWords::Row const* const row = destination() == kText ? RtfWords::find(token.text) : nullptr;
    if (row) {
        (this->*row->handler)(token, row->argument);
    } else if (destination() == kOneForm) {
        if (token.text == "ud") state_.set(RtfField::destination, kText);
    } else if (isStarred && !RtfWords::beginsStyle(token)) {
        state_.set(RtfField::destination, kSkipped);
    } else if (isInFonts()) {
        takeFontWord(token);
    } else if (destination() == kColorTable) {
        colors_.takeWord(token.text, token.value);
    } else if (destination() == kStyle) {
        takeStyleWord(token);
    }
}

bool RtfDocument::isInFonts() const {
    return destination() == kFontTable || destination() == kFont;
}

// The character after a backslash.
void RtfDocument::onSymbol(char symbol) {
    switch (symbol) {
    case '*': isStarred_ = true; break;
    case '~': putCharacters(L"\u00A0"); break;
    case '_': putCharacters(L"\u2011"); break;
    case '\\':
    case '{':
    case '}': putCharacter(symbol); break;
    default:  // others are places to break words, and marks of formulas and indexes
        if (symbol >= 'A' && symbol <= 'Z') putCharacter(symbol);
        break;
    }
}

void RtfDocument::onText(std::string_view text) {
    if (substitutes_ > 0) {
        auto const count = std::min(static_cast<std::size_t>(substitutes_), text.size());
        text.remove_prefix(count);
        substitutes_ -= static_cast<int>(count);
    }
    if (bytes_.isOpen() && !text.empty()) {
        onByte(static_cast<unsigned char>(text.front()));
        text.remove_prefix(1);
    }
    if (text.empty()) return;
    if (destination() == kText)
        putText(text);
    else
        takeTableText(text);
}

void RtfDocument::onByte(unsigned char byte) {
    switch (destination()) {
    case kText: putCharacters(bytes_.add(byte, run().page)); break;
    case kFontTable:
    case kFont: putCharacters(bytes_.add(byte, knownPage(fonts_.namePage()))); break;
    default: break;
    }
}

void RtfDocument::endBytes() {
    if (bytes_.isOpen()) putCharacters(bytes_.end());
}

NormalisedRtf RtfDocument::finish() {
    endBytes();
    putCharacter(0);  // a half that waits for the other
    result_.document = writer_.finish(paragraphOf(last_));
    return std::move(result_);
}

}  // namespace tzhost
