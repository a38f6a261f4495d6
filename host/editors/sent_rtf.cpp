#include "host/editors/sent_rtf.h"

#include <charconv>
#include <optional>

#include "host/code_pages/code_page_converter.h"
#include "host/rtf/font_table.h"
#include "host/rtf/tokens.h"

namespace tzhost {
namespace {

// A stack `1/2` is `{\dn1234 \\S<0,100>}1/2{\dn1234 \\s}`: between the angle brackets its alignment
// and its size in per cent of that in force.
constexpr std::wstring_view kStackStart = L"{\\dn1234 \\\\S<";
constexpr std::wstring_view kStackEnd = L"{\\dn1234 \\\\s}";
constexpr std::wstring_view kWhiteEntry = L"\\red255\\green255\\blue255;";
constexpr std::string_view kShownWhiteEntry = "\\red1\\green1\\blue1;";
constexpr std::wstring_view kColorTable = L"{\\colortbl";

constexpr wchar_t kLastOfOneWord = 0xFFFF;
constexpr int kHalf = 0x10000;
constexpr int kFirstNegative = 0x8000;

bool isLetter(wchar_t c) {
    return c >= L'a' && c <= L'z';
}

bool isDigit(wchar_t c) {
    return c >= L'0' && c <= L'9';
}

// A control word with its number and the blank that ends it.
struct Word {
    std::wstring_view name;
    std::wstring_view digits;
    std::optional<int> value;
    std::size_t length = 0;  // from the backslash on
};

int numberOf(std::wstring_view digits) {
    std::string const ascii(digits.begin(), digits.end());
    int value = 0;
    std::from_chars(ascii.data(), ascii.data() + ascii.size(), value);
    return value;
}

Word wordAt(std::wstring_view text) {
    Word word;
    std::size_t at = 1;
    while (at < text.size() && isLetter(text[at]))
        ++at;
    word.name = text.substr(1, at - 1);
    std::size_t const number = at;
    if (at + 1 < text.size() && text[at] == L'-' && isDigit(text[at + 1])) ++at;
    while (at < text.size() && isDigit(text[at]))
        ++at;
    word.digits = text.substr(number, at - number);
    if (at > number) word.value = numberOf(word.digits);
    if (at < text.size() && text[at] == L' ') ++at;
    word.length = at;
    return word;
}

class Sending {
public:
    explicit Sending(std::wstring_view document) : rest_(document) {
        sent_.reserve(document.size() + document.size() / 4);
    }

    std::string run();

private:
    void takeBrace();
    void takeBackslash();
    void takeWord(Word const& word);
    void takeCharacter(wchar_t c);
    bool takeStack();
    void takeColorTable();
    void putStyle();

    void put(std::wstring_view ascii) { sent_.append(ascii.begin(), ascii.end()); }
    void putNumber(int number);
    void putUnicode(wchar_t c);
    void putShown(wchar_t c);
    void putStackText(std::wstring_view text);
    void doubleBackslashes();

    std::wstring_view rest_;
    std::string sent_;
    std::vector<int> sizes_{0};  // half-points, of the groups that are open; 0 before the first
    bool hasStyle_ = false;
    std::size_t backslashes_ = 0;  // of the text, directly before `rest_`
};

std::string Sending::run() {
    while (!rest_.empty()) {
        wchar_t const c = rest_.front();
        if (c == L'{' || c == L'}') {
            takeBrace();
        } else if (c == L'\\') {
            takeBackslash();
        } else {
            takeCharacter(c);
            rest_.remove_prefix(1);
        }
    }
    return std::move(sent_);
}

void Sending::takeBrace() {
    if (rest_.starts_with(kColorTable)) return takeColorTable();
    if (rest_.starts_with(kStackStart) && takeStack()) return;
    if (rest_.front() == L'{')
        sizes_.push_back(sizes_.back());
    else if (sizes_.size() > 1)
        sizes_.pop_back();
    put(rest_.substr(0, 1));
    rest_.remove_prefix(1);
}

void Sending::takeBackslash() {
    if (rest_.size() > 1 && isLetter(rest_[1])) return takeWord(wordAt(rest_));
    std::wstring_view const symbol = rest_.substr(0, 2);
    rest_.remove_prefix(symbol.size());
    backslashes_ = symbol == L"\\\\" ? backslashes_ + 1 : 0;
    put(symbol);
}

void Sending::takeWord(Word const& word) {
    std::wstring_view const whole = rest_.substr(0, word.length);
    rest_.remove_prefix(word.length);
    if (word.name == L"u" && word.value) {
        if (rest_.starts_with(L'?')) rest_.remove_prefix(1);
        return takeCharacter(static_cast<wchar_t>(*word.value));
    }
    if (word.name == L"fs" && word.value) sizes_.back() = *word.value;
    if (word.name == L"pard" && !hasStyle_) putStyle();
    if (word.name == L"par" || word.name == L"line" || word.name == L"tab") backslashes_ = 0;
    if (word.value == 1 && (word.name == L"b" || word.name == L"i")) {
        put(whole.substr(0, word.name.size() + 1));  // some programs take `\b1` for an end
        sent_ += ' ';
    } else {
        put(whole);
    }
}

// The text starts with the words of its look, of which the size comes last.
void Sending::putStyle() {
    hasStyle_ = true;
    std::size_t const at = rest_.find(L"\\fs");
    if (at == rest_.npos) return;
    std::wstring_view const size = wordAt(rest_.substr(at)).digits;
    sent_ += "{\\stylesheet{\\s0\\f0\\fs";
    put(size);
    sent_ += "\\afs";
    put(size);
    sent_ += " Normal;}}\n";
}

void Sending::takeCharacter(wchar_t c) {
    if (c == L'S') doubleBackslashes();
    if (c != L'\n' && c != L'\r') backslashes_ = 0;
    if (c > 0 && c < 0x80)
        sent_ += static_cast<char>(c);
    else
        putUnicode(c);
}

// Twice as many backslashes say that what follows is no stack.
void Sending::doubleBackslashes() {
    for (std::size_t i = 0; i < backslashes_; ++i)
        sent_ += "\\\\";
    backslashes_ = 0;
}

bool Sending::takeStack() {
    std::wstring_view const stack = rest_.substr(0, rest_.find(kStackEnd));
    std::size_t const textStart = stack.find(L'}');
    std::size_t const comma = stack.find(L',');
    if (stack.size() == rest_.size() || textStart == stack.npos || comma > textStart) return false;
    int const percent = numberOf(stack.substr(comma + 1, textStart - comma - 2));
    long long const size = (static_cast<long long>(sizes_.back()) * percent + 50) / 100;
    doubleBackslashes();
    bool const hasSize = percent != 100 && size > 0 && size <= kFirstNegative;
    if (hasSize) {
        sent_ += "{\\fs";
        putNumber(static_cast<int>(size));
        sent_ += ' ';
    }
    sent_ += "\\\\S";
    putStackText(stack.substr(textStart + 1));
    sent_ += hasSize ? ";}" : ";";
    rest_.remove_prefix(stack.size() + kStackEnd.size());
    return true;
}

// The text of a stack is markup; its codes of characters alone are words already.
void Sending::putStackText(std::wstring_view text) {
    while (!text.empty()) {
        wchar_t const c = text.front();
        if (text.size() > 1 && c == L'\\' && text[1] == L'u') {
            Word const word = wordAt(text);
            putUnicode(static_cast<wchar_t>(word.value.value_or(0)));
            text.remove_prefix(word.length);
            if (text.starts_with(L'?')) text.remove_prefix(1);
            continue;
        }
        putShown(c);
        text.remove_prefix(1);
        if (c != L'\\' || text.empty()) continue;
        putShown(text.front());
        text.remove_prefix(1);
    }
}

void Sending::putShown(wchar_t c) {
    if (c == L'\\' || c == L'{' || c == L'}') sent_ += '\\';
    if (c > 0 && c < 0x80)
        sent_ += static_cast<char>(c);
    else
        putUnicode(c);
}

void Sending::putNumber(int number) {
    char digits[16];
    sent_.append(digits, std::to_chars(digits, digits + sizeof digits, number).ptr);
}

// Numbers have 16 bits and a sign. A bare "?" would be no end of the number to every program: one
// takes the next character away with it.
void Sending::putUnicode(wchar_t c) {
    if (c > kLastOfOneWord) {
        putUnicode(static_cast<wchar_t>(0xD800 + ((c - kHalf) >> 10)));
        c = static_cast<wchar_t>(0xDC00 + ((c - kHalf) & 0x3FF));
    }
    sent_ += "\\u";
    putNumber(c >= kFirstNegative ? c - kHalf : c);
    sent_ += "\\'3f";
}

void Sending::takeColorTable() {
    std::wstring_view table = rest_.substr(0, rest_.find(L'}'));
    rest_.remove_prefix(table.size());
    for (std::size_t white = 0; (white = table.find(kWhiteEntry)) != table.npos;) {
        put(table.substr(0, white));
        sent_ += kShownWhiteEntry;
        table.remove_prefix(white + kWhiteEntry.size());
    }
    put(table);
    sizes_.push_back(sizes_.back());  // for the brace that ends it
}

// Names of fonts are bytes of the page of each font.
class SentFonts {
public:
    // False once the table has ended.
    bool take(RtfToken const& token);
    [[nodiscard]] std::vector<DialectFont> fonts() const;

private:
    void endBytes();

    RtfFontTable table_;
    std::string bytes_;
    int depth_ = 0;
};

bool SentFonts::take(RtfToken const& token) {
    using Kind = RtfToken::Kind;
    if (token.kind == Kind::byte) {
        bytes_ += static_cast<char>(token.value);
        return true;
    }
    endBytes();
    if (token.kind == Kind::word) table_.takeWord(token.text, token.value);
    if (token.kind == Kind::text) {
        for (char const c : token.text) {
            if (c != ';') table_.takeLetter(static_cast<wchar_t>(c));
        }
    }
    if (token.kind == Kind::open) ++depth_;
    if (token.kind == Kind::close) {
        table_.endFont();
        --depth_;
    }
    return token.kind != Kind::end && depth_ > 0;
}

void SentFonts::endBytes() {
    if (bytes_.empty()) return;
    for (wchar_t const c : decode(table_.namePage(), bytes_).value_or(std::wstring()))
        table_.takeLetter(c);
    bytes_.clear();
}

std::vector<DialectFont> SentFonts::fonts() const {
    std::vector<DialectFont> fonts;
    while (RtfFont const* const font = table_.find(static_cast<int>(fonts.size())))
        fonts.push_back(font->face);
    return fonts;
}

}  // namespace

std::string sentRtf(std::wstring_view document) {
    return Sending(document).run();
}

std::vector<DialectFont> fontsOf(std::string_view sent) {
    std::size_t const table = sent.find("{\\fonttbl");
    if (table == sent.npos) return {};
    RtfTokens tokens(sent.substr(table));
    SentFonts fonts;
    while (fonts.take(tokens.next())) {
    }
    return fonts.fonts();
}

}  // namespace tzhost
