#include "host/editors/returned_stacks.h"

#include <charconv>

#include "host/text/utf8.h"

namespace tzhost {
namespace {

constexpr std::string_view kStackMark = "\\dn1234";
constexpr std::wstring_view kWordStarts = L"flpt";

// A part of a normalised document.
struct Unit {
    enum class Kind {
        character,
        open,  // of a group, with the words of its look
        close,
        blank,  // a line end, which is no text
        part,   // a word that parts text, such as `\par`
        end,
    };
    Kind kind = Kind::end;
    std::string_view text;
    wchar_t c = 0;  // of a character
};

bool isLetter(char c) {
    return c >= 'a' && c <= 'z';
}

std::size_t wordLength(std::string_view text) {
    std::size_t at = 1;
    while (at < text.size() && isLetter(text[at]))
        ++at;
    while (at < text.size() && (text[at] == '-' || (text[at] >= '0' && text[at] <= '9')))
        ++at;
    return at;
}

bool isWord(std::string_view text) {
    return text.size() > 1 && text[0] == '\\' && isLetter(text[1]);
}

Unit wordUnit(std::string_view text) {
    std::size_t length = wordLength(text);
    std::string_view const word = text.substr(0, length);
    if (word.size() > 2 && word[1] == 'u' && !isLetter(word[2])) {
        int code = 0;
        std::from_chars(word.data() + 2, word.data() + word.size(), code);
        return {Unit::Kind::character, text.substr(0, length + 1), static_cast<wchar_t>(code)};
    }
    if (length < text.size() && text[length] == ' ') ++length;
    return {Unit::Kind::part, text.substr(0, length)};
}

Unit groupUnit(std::string_view text) {
    std::size_t length = 1;
    while (isWord(text.substr(length)))
        length += wordLength(text.substr(length));
    if (length < text.size() && text[length] == ' ') ++length;
    return {Unit::Kind::open, text.substr(0, length)};
}

std::size_t characterLength(std::string_view text) {
    std::size_t length = 1;
    while (length < text.size() && (static_cast<unsigned char>(text[length]) & 0xC0) == 0x80)
        ++length;
    return length;
}

Unit unitAt(std::string_view text) {
    if (text.empty()) return {};
    if (isWord(text)) return wordUnit(text);
    switch (text.front()) {
    case '{': return groupUnit(text);
    case '}': return {Unit::Kind::close, text.substr(0, 1)};
    case '\n': return {Unit::Kind::blank, text.substr(0, 1)};
    case '\\': {
        std::string_view const symbol = text.substr(0, 2);
        wchar_t const c = static_cast<wchar_t>(symbol.back());
        return {Unit::Kind::character, symbol, c == L'~' ? L'\xA0' : c};
    }
    default: break;
    }
    std::string_view const bytes = text.substr(0, characterLength(text));
    return {Unit::Kind::character, bytes, fromUtf8(bytes).front()};
}

// The groups and looks along a text: a normalised document has groups of one depth only.
class Look {
public:
    void pass(Unit const& unit) {
        if (unit.kind == Unit::Kind::open) words_ = unit.text;
        if (unit.kind == Unit::Kind::close) words_ = {};
    }
    [[nodiscard]] bool isOpen() const { return !words_.empty(); }
    // The words that open a group of this look, without the mark of a stack.
    [[nodiscard]] std::string opening() const {
        std::string words(words_);
        if (std::size_t const mark = words.find(kStackMark); mark != words.npos)
            words.erase(mark, kStackMark.size());
        return words == "{ " ? "{" : words;
    }

private:
    std::string_view words_;
};

// Text in bare characters, since words would be dropped between the stack's sign and its text. A
// line end keeps a letter after a backslash from reading as a word of paragraphs; a brace brings
// its backslash along.
std::string stackText(std::wstring_view text) {
    std::wstring written;
    for (std::size_t at = 0; at < text.size(); ++at) {
        wchar_t const c = text[at];
        wchar_t const next = at + 1 < text.size() ? text[at + 1] : L'\0';
        if (c == L'{' || c == L'}') {
            written += L'\\';
            written += c;
        } else if (c != L'\\') {
            written += c;
        } else if (next == L'\\') {
            written += L"\\\\\\\\";
            ++at;
        } else if (next != L'{' && next != L'}') {
            written += L"\\\\";
            if (kWordStarts.find(next) != kWordStarts.npos) written += L'\n';
        }
    }
    return toUtf8(written);
}

class Returning {
public:
    explicit Returning(std::string_view document) : rest_(document) {
        document_.reserve(document.size());
    }

    std::string run();

private:
    void copy(Unit const& unit);
    void takeBackslashes();
    bool takeStack(std::string_view afterSign);
    void putStack(std::wstring_view text, Look const& after);

    std::string_view rest_;
    std::string document_;
    Look look_;
    char const* noEndBefore_ = nullptr;  // no stack ends before this place
};

// The tables end in the document's first line end.
std::string Returning::run() {
    std::size_t const head = rest_.find('\n');
    if (head == rest_.npos) return std::string(rest_);
    document_ += rest_.substr(0, head);
    rest_.remove_prefix(head);
    for (Unit unit = unitAt(rest_); unit.kind != Unit::Kind::end; unit = unitAt(rest_)) {
        if (unit.kind == Unit::Kind::character && unit.c == L'\\')
            takeBackslashes();
        else
            copy(unit);
    }
    return std::move(document_);
}

void Returning::copy(Unit const& unit) {
    look_.pass(unit);
    document_ += unit.text;
    rest_.remove_prefix(unit.text.size());
}

// Takes a run of backslashes, through changes of look. Before an "S" each pair of them is one of
// the text, and one more makes the sign of a stack.
void Returning::takeBackslashes() {
    std::size_t count = 0;
    std::string_view after = rest_;
    Unit next = unitAt(after);
    while (next.kind == Unit::Kind::open || next.kind == Unit::Kind::close ||
           next.kind == Unit::Kind::blank ||
           (next.kind == Unit::Kind::character && next.c == L'\\')) {
        if (next.kind == Unit::Kind::character) ++count;
        after.remove_prefix(next.text.size());
        next = unitAt(after);
    }
    bool const isSign = next.kind == Unit::Kind::character && next.c == L'S';
    std::size_t kept = isSign ? count / 2 : count;
    while (rest_.size() > after.size()) {
        Unit const unit = unitAt(rest_);
        bool const isBackslash = unit.kind == Unit::Kind::character;
        if (!isBackslash || kept > 0)
            copy(unit);
        else
            rest_.remove_prefix(unit.text.size());
        if (isBackslash && kept > 0) --kept;
    }
    if (!isSign || count % 2 == 0) return;
    if (takeStack(after.substr(next.text.size()))) return;
    document_ += "\\\\\n";  // of the text, after all; the line end keeps the "S" apart from it
}

// Makes a stack of the text up to the ";" that ends it; false when the paragraph has none.
bool Returning::takeStack(std::string_view afterSign) {
    if (afterSign.data() < noEndBefore_) return false;
    std::wstring text;
    Look look = look_;
    bool isEscaped = false;
    std::string_view rest = afterSign;
    for (Unit unit = unitAt(rest);; unit = unitAt(rest)) {
        if (unit.kind == Unit::Kind::part || unit.kind == Unit::Kind::end) {
            noEndBefore_ = rest.data();
            return false;
        }
        rest.remove_prefix(unit.text.size());
        look.pass(unit);
        if (unit.kind != Unit::Kind::character) continue;
        if (unit.c == L';' && !isEscaped) break;
        isEscaped = unit.c == L'\\' && !isEscaped;
        text += unit.c;
    }
    putStack(text, look);
    rest_ = rest;
    look_ = look;
    return true;
}

void Returning::putStack(std::wstring_view text, Look const& after) {
    std::string const opening = look_.isOpen() ? look_.opening() : std::string("{");
    bool const hasLook = opening != "{";
    if (look_.isOpen()) document_ += '}';
    if (hasLook) document_ += opening;
    document_ += "{\\dn1234 \\\\S}";
    document_ += stackText(text);
    document_ += hasLook ? ";{\\dn6}}" : ";{\\dn6}";
    if (after.isOpen()) document_ += after.opening();
}

}  // namespace

std::string withStacks(std::string_view document) {
    return Returning(document).run();
}

}  // namespace tzhost
