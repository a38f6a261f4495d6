#include "tests/markup/rtf_runs.h"

#include <algorithm>
#include <cmath>
#include <cwctype>
#include <map>
#include <utility>
#include <vector>

#include "host/layout/line_layout.h"

namespace markuptest {
namespace {

using namespace tzhost;

constexpr int kStackMark = 1234;
constexpr wchar_t kStackSigns[] = L"/#^";

// What a group keeps for its end.
struct State {
    int font = 0;
    bool bold = false;
    bool italic = false;
    int halfPoints = 0;
    int color = 0;
    bool underline = false;
    bool overline = false;
    ParagraphFormat paragraph;
};

class Reader {
public:
    Reader(std::wstring const& document, DocumentScale scale)
        : text_(document), scale_(scale), body_(document.find(L"\\pard\\plain")) {}

    MarkupText read();

private:
    void readTables();
    void readWord();
    void readSymbol(wchar_t symbol);
    void readStack();
    void apply(std::wstring const& word, int value);
    bool applyLook(std::wstring const& word, int value);
    bool applyParagraph(std::wstring const& word, int value);
    [[nodiscard]] int number();
    [[nodiscard]] double units(int twips) const;
    [[nodiscard]] std::wstring until(wchar_t end);
    [[nodiscard]] MarkupFormat look() const;
    std::size_t fontOf(State const& state);
    void addText(wchar_t c);
    void addPiece(MarkupPieceKind kind);

    std::wstring const& text_;
    DocumentScale scale_;
    std::size_t body_;
    std::size_t at_ = 0;
    std::map<int, std::wstring> faces_;
    std::vector<unsigned int> colors_;
    std::vector<State> groups_;
    State now_;
    MarkupText out_;
};

int Reader::number() {
    bool const negative = at_ < text_.size() && text_[at_] == L'-';
    if (negative) ++at_;
    long value = 0;
    while (at_ < text_.size() && std::iswdigit(static_cast<wint_t>(text_[at_])))
        value = value * 10 + (text_[at_++] - L'0');
    return static_cast<int>(negative ? -value : value);
}

std::wstring Reader::until(wchar_t end) {
    std::size_t const from = at_;
    at_ = std::min(text_.find(end, at_), text_.size());
    return text_.substr(from, at_++ - from);
}

// {\f1\fnil\fcharset1 Arial;} and \red255\green0\blue0;
void Reader::readTables() {
    while ((at_ = text_.find(L"{\\f", at_)) < body_) {
        at_ += 3;
        if (!std::iswdigit(static_cast<wint_t>(text_[at_]))) continue;
        int const font = number();
        (void)until(L' ');
        faces_[font] = until(L';');
    }
    at_ = 0;
    while ((at_ = text_.find(L"\\red", at_)) < body_) {
        unsigned int parts[3];
        for (unsigned int& part : parts) {
            at_ = text_.find_first_of(L"0123456789", at_);
            part = static_cast<unsigned int>(number());
        }
        colors_.push_back(parts[0] | parts[1] << 8 | parts[2] << 16);
    }
    at_ = body_;
}

std::size_t Reader::fontOf(State const& state) {
    if (state.font == 0 && !state.bold && !state.italic) return 0;
    MarkupFont font;
    font.name = faces_[state.font];
    font.bold = state.bold;
    font.italic = state.italic;
    for (std::size_t i = 0; i < out_.fonts.size(); ++i)
        if (out_.fonts[i] == font) return i + 1;
    out_.fonts.push_back(font);
    return out_.fonts.size();
}

MarkupFormat Reader::look() const {
    MarkupFormat format;
    format.height = now_.halfPoints / scale_.halfPoints;
    if (now_.color != 0)
        format.color = {TextColorKind::rgb, 256, colors_.at(static_cast<std::size_t>(now_.color))};
    format.underline = now_.underline;
    format.overline = now_.overline;
    return format;
}

void Reader::addPiece(MarkupPieceKind kind) {
    MarkupPiece piece;
    piece.kind = kind;
    piece.start = out_.text.size();
    MarkupFormat format = look();
    format.font = fontOf(now_);
    if (out_.formats.empty() || !(out_.formats.back() == format)) out_.formats.push_back(format);
    piece.format = out_.formats.size() - 1;
    out_.pieces.push_back(piece);
}

void Reader::addText(wchar_t c) {
    if (c == 0) return;
    addPiece(MarkupPieceKind::text);
    std::size_t const count = out_.pieces.size();
    if (count > 1 && out_.pieces[count - 2].kind == MarkupPieceKind::text &&
        out_.pieces[count - 2].format == out_.pieces.back().format)
        out_.pieces.pop_back();
    ++out_.pieces.back().length;
    out_.text += c;
}

// After "\dn1234 \\S": "<alignment,per cent>}", the text, and "{\dn1234 \\s}". A backslash makes
// the next character no sign.
void Reader::readStack() {
    at_ = text_.find(L'<', at_) + 1;
    int const alignment = number();
    ++at_;
    int const percent = number();
    at_ += 2;
    now_ = groups_.back();
    groups_.pop_back();
    std::size_t const end = std::min(text_.find(L"{\\dn1234 \\\\s}", at_), text_.size());
    std::wstring shown;
    std::size_t sign = std::wstring::npos;
    while (at_ < end) {
        bool const escaped = text_[at_] == L'\\';
        wchar_t c = text_[at_++];
        if (escaped && text_[at_] == L'u' && std::iswdigit(static_cast<wint_t>(text_[at_ + 1]))) {
            ++at_;
            c = static_cast<wchar_t>(number());
            ++at_;
        } else if (escaped) {
            c = text_[at_++];
        } else if (sign == std::wstring::npos && std::wstring(kStackSigns).find(c) < 3) {
            sign = shown.size();
        }
        shown += c;
    }
    at_ = text_.find(L'}', end) + 1;
    if (sign == std::wstring::npos) {
        for (wchar_t const c : shown)
            addText(c);
        return;
    }
    int const before = std::exchange(now_.halfPoints, now_.halfPoints * percent / 100);
    addPiece(MarkupPieceKind::stack);
    now_.halfPoints = before;
    MarkupPiece& piece = out_.pieces.back();
    piece.stackKind = static_cast<StackKind>(std::wstring(kStackSigns).find(shown[sign]));
    piece.stackAlignment = static_cast<StackAlignment>(alignment);
    piece.upper = sign;
    shown.erase(sign, 1);
    piece.length = shown.size();
    out_.text += shown;
}

bool Reader::applyLook(std::wstring const& word, int value) {
    struct Row {
        wchar_t const* word;
        int State::*number;
        bool State::*flag;
    };
    static constexpr Row kRows[] = {
        {L"f", &State::font, nullptr},          {L"fs", &State::halfPoints, nullptr},
        {L"cf", &State::color, nullptr},        {L"b", nullptr, &State::bold},
        {L"i", nullptr, &State::italic},        {L"ul", nullptr, &State::underline},
        {L"strike", nullptr, &State::overline},
    };
    for (Row const& row : kRows) {
        if (word != row.word) continue;
        if (row.number) now_.*row.number = value;
        if (row.flag) now_.*row.flag = value != 0;
        return true;
    }
    return false;
}

// Twips are whole, so the last digits are lost.
double Reader::units(int twips) const {
    return std::round(twips / scale_.twips * 1000.0) / 1000.0;
}

bool Reader::applyParagraph(std::wstring const& word, int value) {
    if (word == L"fi")
        now_.paragraph.firstIndent = units(value);
    else if (word == L"li")
        now_.paragraph.leftIndent = units(value);
    else if (word == L"tx")
        now_.paragraph.tabs.push_back(units(value));
    else
        return false;
    return true;
}

void Reader::apply(std::wstring const& word, int value) {
    if (applyLook(word, value) || applyParagraph(word, value)) return;
    if (word == L"pard") now_.paragraph = {};
    if (word == L"line") addPiece(MarkupPieceKind::lineBreak);
    if (word == L"dn" && value == kStackMark) readStack();
    if (word == L"par") {
        addPiece(MarkupPieceKind::paragraphEnd);
        out_.pieces.back().paragraph = out_.paragraphs.size();
        out_.paragraphs.push_back(now_.paragraph);
    }
    if (word == L"u") {
        addText(static_cast<wchar_t>(value));
        ++at_;  // the character for readers that know no such code
    }
}

void Reader::readWord() {
    std::size_t const from = at_;
    while (text_[at_] >= L'a' && text_[at_] <= L'z')
        ++at_;
    std::wstring const word = text_.substr(from, at_ - from);
    bool const counts = text_[at_] == L'-' || std::iswdigit(static_cast<wint_t>(text_[at_]));
    int const value = counts ? number() : 1;
    if (text_[at_] == L' ') ++at_;
    apply(word, value);
}

// An East Asian code stands as text after an escaped backslash.
void Reader::readSymbol(wchar_t symbol) {
    constexpr std::size_t kCodeLength = 7;  // M+n and four digits
    if (symbol == L'\\' && text_.compare(at_ + 1, 1, L"+") == 0) {
        std::wstring const decoded = decodeLineText(L'\\' + text_.substr(at_, kCodeLength));
        if (decoded.size() == 1) {
            at_ += kCodeLength;
            return addText(decoded[0]);
        }
    }
    addText(symbol == L'~' ? L'\u00A0' : symbol);
}

MarkupText Reader::read() {
    readTables();
    while (at_ < text_.size()) {
        wchar_t const c = text_[at_++];
        if (c == L'{') {
            groups_.push_back(now_);
        } else if (c == L'}') {
            if (groups_.empty()) continue;  // a stray brace of the markup, or the document's own
            now_ = groups_.back();
            groups_.pop_back();
        } else if (c != L'\\') {
            addText(c);
        } else if (text_[at_] >= L'a' && text_[at_] <= L'z') {
            readWord();
        } else {
            readSymbol(text_[at_++]);
        }
    }
    return std::move(out_);
}

}  // namespace

MarkupText readDocument(std::wstring const& document, DocumentScale scale) {
    return Reader(document, scale).read();
}

}  // namespace markuptest
