#include "host/layout/markup_reader.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

#include "host/layout/markup_scan.h"
#include "host/layout/markup_stack.h"

namespace tzhost {
namespace {

constexpr wchar_t kHardSpace = L'\u00A0';
constexpr std::size_t kMostTabs = 32;
constexpr int kCharsetDigits = 16;
constexpr unsigned int kRgbMask = 0xFFFFFF;

// A value of the whole text: the first code that gives one counts. A code that comes when text has
// begun counts too, and shuts the value; one that gives the initial value leaves it open otherwise.
class WholeTextValue {
public:
    explicit WholeTextValue(double initial) : value_(initial), initial_(initial) {}
    [[nodiscard]] double value() const { return value_; }

    void offer(double value, bool textHasBegun) {
        if (shut_ || value_ != initial_) {
            return;
        }
        value_ = value;
        shut_ = textHasBegun;
    }

private:
    double value_;
    double initial_;
    bool shut_ = false;
};

class Reader {
public:
    Reader(std::wstring const& contents, MarkupFormat const& initial);
    MarkupText read();

    void readStackAlignment();
    void readColorIndex();
    void readColorRgb();
    void readFontFile();
    void readFontFace();
    void readHeight();
    void startUnderline() { setDecorations(true, format().overline); }
    void endUnderline() { setDecorations(false, format().overline); }
    void startOverline() { setDecorations(format().underline, true); }
    void endOverline() { setDecorations(format().underline, false); }
    void endParagraph();
    void readParagraphFormat();
    void readOblique();
    void readStack();
    void readTracking();
    void readWidthFactor();
    void readUnicode();
    void readMultibyte();

private:
    [[nodiscard]] MarkupFormat const& format() const { return result_.formats[format_]; }
    void setFormat(MarkupFormat const& wanted);
    void setDecorations(bool underline, bool overline);
    void setFont(MarkupFont const& wanted);
    void readCode();
    void readPlain(wchar_t c);
    void appendText(wchar_t c);
    void appendPiece(MarkupPieceKind kind);
    std::wstring readFontName();
    int readDigits();
    void readTabs(ParagraphFormat& paragraph);

    wchar_t const* begin_;
    wchar_t const* cursor_;
    markup::StackProbe stacks_;
    MarkupText result_;
    std::size_t format_ = 0;
    std::vector<std::size_t> groups_;
    StackAlignment stackAlignment_ = StackAlignment::bottom;
    WholeTextValue tracking_{1.0};
    WholeTextValue widthFactor_{1.0};
    WholeTextValue oblique_{0.0};
    bool textHasBegun_ = false;
};

struct CodeRow {
    wchar_t code;
    void (Reader::*read)();
};

// The codes with arguments or effects; escaped characters and unknown codes are handled apart.
constexpr std::array kCodes{
    CodeRow{L'A', &Reader::readStackAlignment},  CodeRow{L'C', &Reader::readColorIndex},
    CodeRow{L'F', &Reader::readFontFile},        CodeRow{L'H', &Reader::readHeight},
    CodeRow{L'L', &Reader::startUnderline},      CodeRow{L'M', &Reader::readMultibyte},
    CodeRow{L'O', &Reader::startOverline},       CodeRow{L'P', &Reader::endParagraph},
    CodeRow{L'Q', &Reader::readOblique},         CodeRow{L'S', &Reader::readStack},
    CodeRow{L'T', &Reader::readTracking},        CodeRow{L'U', &Reader::readUnicode},
    CodeRow{L'W', &Reader::readWidthFactor},     CodeRow{L'c', &Reader::readColorRgb},
    CodeRow{L'f', &Reader::readFontFace},        CodeRow{L'l', &Reader::endUnderline},
    CodeRow{L'm', &Reader::readMultibyte},       CodeRow{L'o', &Reader::endOverline},
    CodeRow{L'p', &Reader::readParagraphFormat}, CodeRow{L'u', &Reader::readUnicode},
};
static_assert(std::is_sorted(kCodes.begin(), kCodes.end(), [](CodeRow const& a, CodeRow const& b) {
    return a.code < b.code;
}));

struct EscapeRow {
    wchar_t escaped;
    wchar_t character;
};

constexpr std::array<EscapeRow, 4> kEscapes{{
    {L'\\', L'\\'},
    {L'{', L'{'},
    {L'}', L'}'},
    {L'~', kHardSpace},
}};

Reader::Reader(std::wstring const& contents, MarkupFormat const& initial)
    : begin_(contents.c_str()), cursor_(begin_), stacks_(contents) {
    result_.formats.push_back(initial);
    result_.paragraphs.emplace_back();
}

MarkupText Reader::read() {
    while (*cursor_ != 0) {
        wchar_t const c = *cursor_++;
        if (c == L'\\') {
            readCode();
        } else {
            readPlain(c);
        }
    }
    endParagraph();
    result_.tracking = tracking_.value();
    result_.widthFactor = widthFactor_.value();
    result_.oblique = oblique_.value();
    return std::move(result_);
}

void Reader::readPlain(wchar_t c) {
    textHasBegun_ = true;
    if (c == L'{') {
        groups_.push_back(format_);
    } else if (c == L'\n') {
        appendPiece(MarkupPieceKind::lineBreak);
    } else if (c != L'}') {
        appendText(c);
    } else if (!groups_.empty()) {
        format_ = groups_.back();
        groups_.pop_back();
    }
}

void Reader::readCode() {
    wchar_t const code = *cursor_;
    auto const row =
        std::lower_bound(kCodes.begin(), kCodes.end(), code,
                         [](CodeRow const& a, wchar_t wanted) { return a.code < wanted; });
    if (row != kCodes.end() && row->code == code) {
        ++cursor_;
        (this->*row->read)();
        return;
    }
    for (EscapeRow const& escape : kEscapes) {
        if (escape.escaped == code) {
            ++cursor_;
            appendText(escape.character);
            return;
        }
    }
    // An unknown code is text, its backslash included.
    appendText(L'\\');
    if (code != 0) {
        ++cursor_;
        appendText(code);
    }
}

void Reader::appendText(wchar_t c) {
    auto& pieces = result_.pieces;
    if (pieces.empty() || pieces.back().kind != MarkupPieceKind::text ||
        pieces.back().format != format_) {
        appendPiece(MarkupPieceKind::text);
    }
    result_.text += c;
    ++pieces.back().length;
}

void Reader::appendPiece(MarkupPieceKind kind) {
    MarkupPiece piece;
    piece.kind = kind;
    piece.format = format_;
    piece.start = result_.text.size();
    piece.paragraph = result_.paragraphs.size() - 1;
    result_.pieces.push_back(piece);
}

void Reader::setFormat(MarkupFormat const& wanted) {
    if (wanted == format()) {
        return;
    }
    format_ = result_.formats.size();
    result_.formats.push_back(wanted);
}

void Reader::setDecorations(bool underline, bool overline) {
    MarkupFormat wanted = format();
    wanted.underline = underline;
    wanted.overline = overline;
    setFormat(wanted);
}

void Reader::setFont(MarkupFont const& wanted) {
    if (result_.fonts.empty() || !(result_.fonts.back() == wanted)) {
        result_.fonts.push_back(wanted);
    }
    MarkupFormat changed = format();
    changed.font = result_.fonts.size();
    setFormat(changed);
}

void Reader::readStackAlignment() {
    int const alignment = markup::scanNumber(cursor_);
    if (alignment >= 0 && alignment <= 2) {
        stackAlignment_ = static_cast<StackAlignment>(alignment);
    }
}

void Reader::readColorIndex() {
    MarkupFormat wanted = format();
    wanted.color = {TextColorKind::index, markup::scanNumber(cursor_), 0};
    setFormat(wanted);
}

void Reader::readColorRgb() {
    MarkupFormat wanted = format();
    unsigned int const rgb = static_cast<unsigned int>(markup::scanNumber(cursor_)) & kRgbMask;
    wanted.color = {TextColorKind::rgb, TextColor{}.index, rgb};
    setFormat(wanted);
}

std::wstring Reader::readFontName() {
    std::wstring name;
    while (*cursor_ != 0 && *cursor_ != L';' && *cursor_ != L'|') {
        name += *cursor_++;
    }
    return name;
}

int Reader::readDigits() {
    unsigned int value = 0;
    for (int i = 0; i < kCharsetDigits && *cursor_ >= L'0' && *cursor_ <= L'9'; ++i) {
        value = value * 10U + static_cast<unsigned int>(*cursor_++ - L'0');
    }
    return static_cast<int>(value);
}

void Reader::readFontFile() {
    MarkupFont font;
    font.byFile = true;
    font.name = readFontName();
    while (*cursor_ != 0 && *cursor_ != L';') {
        if (*cursor_++ == L'c') {
            font.charset = readDigits();
        }
    }
    markup::skipSemicolon(cursor_);
    setFont(font);
}

void Reader::readFontFace() {
    MarkupFont font;
    font.charset = 1;
    font.name = readFontName();
    // Without fields the semicolon after the name stays and is text.
    if (*cursor_ == L'|') {
        while (*cursor_ != 0 && *cursor_ != L';') {
            wchar_t const field = *cursor_++;
            if (field == L'c') {
                font.charset = readDigits();
            } else if (field == L'p') {
                font.pitchAndFamily = readDigits();
            } else if ((field == L'b' || field == L'i') && *cursor_ != 0) {
                (field == L'b' ? font.bold : font.italic) = *cursor_++ == L'1';
            }
        }
        markup::skipSemicolon(cursor_);
    }
    setFont(font);
}

void Reader::readHeight() {
    markup::ScannedReal const read = markup::scanReal(cursor_);
    markup::skipSemicolon(cursor_);
    MarkupFormat wanted = format();
    wanted.height = read.relative ? wanted.height * read.value : read.value;
    // Letters of no height cannot be shown or selected, so such a code changes nothing.
    if (wanted.height > 0.0 && std::isfinite(wanted.height)) {
        setFormat(wanted);
    }
}

void Reader::endParagraph() {
    appendPiece(MarkupPieceKind::paragraphEnd);
}

void Reader::readParagraphFormat() {
    ParagraphFormat wanted = result_.paragraphs.back();
    for (bool known = true; known;) {
        wchar_t const setting = *cursor_;
        known = setting == L'i' || setting == L'l' || setting == L't';
        if (!known) {
            break;
        }
        ++cursor_;
        if (setting == L't') {
            readTabs(wanted);
            continue;
        }
        (setting == L'i' ? wanted.firstIndent : wanted.leftIndent) =
            markup::scanReal(cursor_).value;
        if (*cursor_ == L',') {
            ++cursor_;
        }
    }
    markup::skipSemicolon(cursor_);
    if (!(wanted == result_.paragraphs.back())) {
        result_.paragraphs.push_back(std::move(wanted));
    }
}

void Reader::readTabs(ParagraphFormat& paragraph) {
    std::vector<double>& tabs = paragraph.tabs;
    tabs.clear();
    if (*cursor_ == L'z') {
        ++cursor_;
        return;
    }
    for (bool more = true; more;) {
        double const stop = markup::scanReal(cursor_).value;
        auto const place = std::lower_bound(tabs.begin(), tabs.end(), stop);
        bool const isNew = place == tabs.end() || *place != stop;
        if (stop > 0.0 && isNew && tabs.size() < kMostTabs) {
            tabs.insert(place, stop);
        }
        more = *cursor_ == L',';
        if (more) {
            ++cursor_;
        }
    }
}

void Reader::readOblique() {
    double const degrees = markup::scanReal(cursor_).value;
    markup::skipSemicolon(cursor_);
    oblique_.offer(degrees, textHasBegun_);
}

void Reader::readTracking() {
    double const factor = markup::scanReal(cursor_).value;
    markup::skipSemicolon(cursor_);
    tracking_.offer(factor == 0.0 ? 1.0 : factor, textHasBegun_);
}

void Reader::readWidthFactor() {
    double const factor = markup::scanReal(cursor_).value;
    markup::skipSemicolon(cursor_);
    widthFactor_.offer(factor, textHasBegun_);
}

void Reader::readUnicode() {
    wchar_t const character = markup::scanUnicode(cursor_);
    if (character != 0) {
        appendText(character);
    }
}

void Reader::readMultibyte() {
    wchar_t const code = cursor_[-1];
    wchar_t character = 0;
    if (markup::scanMultibyte(cursor_, character)) {
        appendText(character);
        return;
    }
    appendText(L'\\');
    appendText(code);
}

void Reader::readStack() {
    if (!stacks_.holdsMark(static_cast<std::size_t>(cursor_ - begin_))) {
        appendText(L'\\');
        appendText(L'S');
        return;
    }
    markup::StackParts const parts = markup::splitStack(markup::scanEscapedText(cursor_));
    if (!parts.split) {
        for (wchar_t const c : parts.upper) {
            appendText(c);
        }
        return;
    }
    appendPiece(MarkupPieceKind::stack);
    MarkupPiece& piece = result_.pieces.back();
    piece.upper = parts.upper.size();
    piece.length = parts.upper.size() + parts.lower.size();
    piece.stackKind = parts.kind;
    piece.stackAlignment = stackAlignment_;
    result_.text += parts.upper;
    result_.text += parts.lower;
}

}  // namespace

MarkupText readMarkup(std::wstring const& contents, MarkupFormat const& initial) {
    return Reader(contents, initial).read();
}

}  // namespace tzhost
