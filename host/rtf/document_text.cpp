// Text and its look.

#include <algorithm>
#include <utility>

#include "host/code_pages/code_page_table.h"
#include "host/rtf/document.h"
#include "host/text/case_table.h"

namespace tzhost {

namespace {

constexpr wchar_t kReplacement = 0xFFFD;
constexpr wchar_t kFirstHigh = 0xD800;
constexpr wchar_t kFirstLow = 0xDC00;
constexpr wchar_t kLastLow = 0xDFFF;
constexpr wchar_t kFirstPair = 0x10000;
constexpr wchar_t kDelete = 0x7F;
constexpr int kMostSize = 0x7FFF;

bool isOn(int value) {
    return value != kRtfUnset && value != 0;
}

int orZero(int value) {
    return value == kRtfUnset ? 0 : value;
}

}  // namespace

int RtfDocument::knownPage(int page) const {
    if (RtfByteText::isKnown(page)) return page;
    return codePage_ != 0 ? codePage_ : systemCodePage();
}

RtfStyleValues const& RtfDocument::styleOf(RtfStyleKind kind) {
    bool const isOfParagraph = kind == RtfStyleKind::paragraph;
    KeptStyle& kept = isOfParagraph ? paragraphStyle_ : characterStyle_;
    int const number =
        state_.get(isOfParagraph ? RtfField::paragraphStyle : RtfField::characterStyle);
    if (kept.number != number || !kept.isKnown)
        kept = {number, true, styles_.valuesOf(kind, number)};
    return kept.values;
}

// What is set, else what a style says.
int RtfDocument::valueOf(RtfField field) {
    auto const at = static_cast<std::size_t>(field);
    int value = state_.get(field);
    if (value == kRtfUnset && at < kRtfLookFields) value = styleOf(RtfStyleKind::character)[at];
    if (value == kRtfUnset) value = styleOf(RtfStyleKind::paragraph)[at];
    return value;
}

int RtfDocument::addFont(DialectFont const& font) {
    DialectFont const written = replacements_.font(font);
    return written.name.empty() ? -1 : writer_.addFont(written);
}

RtfDocument::KeptFont RtfDocument::keptFont(int number) {
    RtfFont const* const font = fonts_.find(number);
    KeptFont kept{number, true, -1, SymbolFace::none, knownPage(font ? font->codePage : 0)};
    if (!font) return kept;
    auto const [at, isNew] = writtenFonts_.try_emplace(number, 0);
    if (isNew) at->second = addFont(font->face);
    kept.written = at->second;
    if (kept.page == kSymbolPage) kept.symbols = symbolFaceOf(font->face.name);
    return kept;
}

// What is set for text of East Asia, where the text is such, else what holds for any.
int RtfDocument::valueOf(RtfField field, RtfField wide) {
    int const value = isOn(state_.get(RtfField::isWide)) ? state_.get(wide) : kRtfUnset;
    return value == kRtfUnset ? valueOf(field) : value;
}

DialectLook RtfDocument::lookInForce() {
    DialectLook look;
    look.font = font_.written;
    look.size = std::clamp(orZero(valueOf(RtfField::size, RtfField::wideSize)), 0, kMostSize);
    if (look.size == 0) look.size = usualSize_;
    if (auto const color = colors_.find(valueOf(RtfField::color)))
        look.color = writer_.colorNumber(replacements_.color(*color));
    look.isBold = isOn(valueOf(RtfField::bold, RtfField::wideBold));
    look.isItalic = isOn(valueOf(RtfField::italic, RtfField::wideItalic));
    look.isUnderlined = isOn(valueOf(RtfField::underline));
    look.isStruck = isOn(valueOf(RtfField::strike));
    look.isStackMark = isOn(state_.get(RtfField::stackMark));
    return look;
}

// Found again when the state has changed.
RtfDocument::Run const& RtfDocument::run() {
    if (run_.isKnown && run_.changes == state_.changes()) return run_;
    int font = valueOf(RtfField::font);
    if (font == kRtfUnset) font = defaultFont_;
    if (font_.number != font || !font_.isKnown) font_ = keptFont(font);
    run_.changes = state_.changes();
    run_.isKnown = true;
    run_.look = run_.plainLook = lookInForce();
    if (font_.page == kSymbolPage) {
        KeptFont const usual = keptFont(defaultFont_);
        run_.plainLook.font = usual.page == kSymbolPage ? -1 : usual.written;
    }
    run_.symbols = font_.symbols;
    run_.page = font_.page;
    run_.isHidden = isOn(valueOf(RtfField::hidden));
    run_.isCapitals = isOn(valueOf(RtfField::caps));
    run_.settings = {orZero(valueOf(RtfField::firstIndent)), orZero(valueOf(RtfField::leftIndent)),
                     orZero(valueOf(RtfField::tabs))};
    return run_;
}

// What the numbers of tables mean is looked up anew.
void RtfDocument::forgetTables() {
    writtenFonts_.clear();
    run_.isKnown = font_.isKnown = paragraphStyle_.isKnown = characterStyle_.isKnown = false;
}

DialectParagraph RtfDocument::paragraphOf(Settings const& settings) const {
    return {settings.firstIndent, settings.leftIndent, tabs_.stopsOf(settings.tabs)};
}

// Parts what was written from the text that follows: cells by a tab, paragraphs of a cell by a
// blank.
void RtfDocument::beginContent() {
    last_ = run().settings;
    if (isAfterCell_)
        putCellTab();
    else if (isAfterInnerEnd_ && writer_.hasContent())
        writer_.ascii(" ");
    isAfterCell_ = isAfterInnerEnd_ = false;
}

// No line goes from cell to cell.
void RtfDocument::putCellTab() {
    DialectLook look = run().plainLook;
    look.isUnderlined = look.isStruck = false;
    writer_.setLook(look);
    writer_.tab();
}

void RtfDocument::putText(std::string_view text) {
    Run const& now = run();
    if (now.isHidden) return;
    if (now.isCapitals || now.page == kSymbolPage || highSurrogate_ != 0) {
        for (char const c : text)
            putCharacter(now.page == kSymbolPage ? kFirstSymbol + c : c);
        return;
    }
    beginContent();
    writer_.setLook(now.look);
    writer_.ascii(text);
}

void RtfDocument::putCharacters(std::wstring_view text) {
    for (wchar_t const c : text)
        putCharacter(c);
}

// Halves of a character above U+FFFF that come without the other are shown as unknown.
void RtfDocument::putCharacter(wchar_t c) {
    wchar_t const high = std::exchange(highSurrogate_, 0);
    if (c >= kFirstLow && c <= kLastLow) {
        c = high == 0 ? kReplacement : kFirstPair + ((high - kFirstHigh) << 10) + (c - kFirstLow);
    } else if (high != 0) {
        putScalar(kReplacement);
    }
    if (c >= kFirstHigh && c < kFirstLow)
        highSurrogate_ = c;
    else
        putScalar(c);
}

void RtfDocument::putScalar(wchar_t c) {
    if (isInFonts()) {
        if (c >= L' ') fonts_.takeLetter(c);
        return;
    }
    if (destination() != kText || run().isHidden) return;
    if (c == L'\t') putTab({}, 0);
    if (c < L' ' || c == kDelete) return;
    Run const& now = run();
    c = unicodeOf(now.symbols, c);
    if (now.isCapitals) c = upperOf(c);
    bool const isOfFace = now.page != kSymbolPage || (c >= kFirstSymbol && c <= kLastSymbol);
    beginContent();
    writer_.setLook(isOfFace ? now.look : now.plainLook);
    writer_.character(c);
}

}  // namespace tzhost
