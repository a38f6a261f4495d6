#include "host/rtf/dialect_writer.h"

#include <charconv>

#include "host/code_pages/code_page_converter.h"
#include "host/code_pages/code_page_table.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

constexpr wchar_t kHardSpace = 0xA0;
constexpr wchar_t kLastEscaped = 0xFFFF;

void appendWord(std::string& text, char const* word) {
    text += '\\';
    text += word;
}

void appendWord(std::string& text, char const* word, long long value) {
    appendWord(text, word);
    char digits[24];
    text.append(digits, std::to_chars(digits, digits + sizeof digits, value).ptr);
}

void appendLook(std::string& text, DialectLook const& look) {
    if (look.font >= 0) appendWord(text, "f", look.font);
    if (look.size > 0) appendWord(text, "fs", look.size);
    if (look.color >= 0) appendWord(text, "cf", look.color);
    if (look.isBold) appendWord(text, "b");
    if (look.isItalic) appendWord(text, "i");
    if (look.isUnderlined) appendWord(text, "ul");
    if (look.isStruck) appendWord(text, "strike");
    if (look.isStackMark) appendWord(text, "dn1234");
}

char const* familyWord(int family) {
    static constexpr char const* kWords[] = {"fnil",    "froman",  "fswiss",
                                             "fmodern", "fscript", "fdecor"};
    auto const at = static_cast<std::size_t>(family) >> 4;
    return kWords[at < std::size(kWords) ? at : 0];
}

// The name in the page of its set, which is how the reader takes names; signs of the table are
// left out.
void appendName(std::string& text, DialectFont const& font) {
    static constexpr char kHex[] = "0123456789abcdef";
    for (char const c : encode(codePageOf(static_cast<Charset>(font.charset)), font.name)) {
        auto const byte = static_cast<unsigned char>(c);
        if (byte >= 0x80)
            text.append({'\\', '\'', kHex[byte >> 4], kHex[byte & 0xF]});
        else if (byte >= ' ' && std::string_view("\\{};").find(c) == std::string_view::npos)
            text += c;
    }
}

void appendFont(std::string& text, std::size_t number, DialectFont const& font) {
    text += '{';
    appendWord(text, "f", static_cast<long long>(number));
    appendWord(text, familyWord(font.family));
    if (font.pitch > 0) appendWord(text, "fprq", font.pitch);
    appendWord(text, "fcharset", font.charset);
    text += ' ';
    appendName(text, font);
    text += ";}";
}

}  // namespace

int DialectWriter::addFont(DialectFont const& font) {
    fonts_.push_back({font});
    return static_cast<int>(fonts_.size()) - 1;
}

int DialectWriter::colorNumber(unsigned int rgb) {
    auto const [at, isNew] = colorNumbers_.try_emplace(rgb, static_cast<int>(colors_.size()));
    if (isNew) colors_.push_back(rgb);
    return at->second;
}

void DialectWriter::setLook(DialectLook const& look) {
    writeMark();
    if (look == look_) return;
    closeLook();
    if (look == DialectLook()) return;
    protectStackSign();
    if (look.font >= 0) fonts_[static_cast<std::size_t>(look.font)].isUsed = true;
    body_ += '{';
    appendLook(body_, look);
    body_ += ' ';
    look_ = look;
    if (look.isStackMark) isInStack_ = true;
}

void DialectWriter::closeLook() {
    if (look_ == DialectLook()) return;
    bool const isAhead = body_.size() == paragraphStart_;
    body_ += '}';
    if (isAhead) {
        paragraphStart_ = body_.size();
        startLook_ = {};
    }
    hasLeftStart_ = true;
    look_ = {};
}

// The reader looks for words of paragraphs after every backslash, also after the second of an
// escaped pair; a line end in between, which it skips, keeps it from finding one there.
void DialectWriter::ascii(std::string_view text) {
    if (text.empty()) return;
    writeMark();
    hasContent_ = true;
    bool const isAfterBackslash = !body_.empty() && body_.back() == '\\';
    if (isAfterBackslash && std::string_view("flpt").find(text[0]) != std::string_view::npos)
        body_ += '\n';
    bool const isStackSign = isAfterBackslash && text == "S" && !look_.isStackMark;
    stackSignAt_ = isStackSign ? body_.size() : kNowhere;
    body_ += text;
}

void DialectWriter::character(wchar_t c) {
    writeMark();
    if (c > kLastEscaped) {
        stackSignAt_ = kNowhere;
        body_ += toUtf8(std::wstring_view(&c, 1));
    } else if (c == kHardSpace) {
        stackSignAt_ = kNowhere;
        body_ += "\\~";
    } else if (c >= 0x80) {
        protectStackSign();
        appendWord(body_, "u", c);
        body_ += '?';
    } else if (c == '\\' || c == '{' || c == '}') {
        stackSignAt_ = kNowhere;
        body_ += '\\';
        body_ += static_cast<char>(c);
    } else {
        char const plain = static_cast<char>(c);
        ascii({&plain, 1});
    }
    hasContent_ = true;
}

void DialectWriter::tab() {
    writeWord("\\tab ");
}

void DialectWriter::line() {
    writeWord("\\line ");
}

void DialectWriter::writeWord(char const* word) {
    writeMark();
    protectStackSign();
    body_ += word;
    hasContent_ = true;
}

void DialectWriter::endStack() {
    if (!isInStack_) return;
    isInStack_ = false;
    writeMark();
    body_ += "{\\dn6}";
}

// After an escaped backslash and an "S" the reader swallows words up to the next text. The "S"
// as a number of its own is no such sign.
void DialectWriter::protectStackSign() {
    if (stackSignAt_ == kNowhere) return;
    body_.replace(stackSignAt_, 1, "\\u83?");
    stackSignAt_ = kNowhere;
}

void DialectWriter::endParagraph(DialectParagraph const& paragraph, DialectLook const& mark) {
    writeMark();
    insertSettings(paragraph);
    mark_ = mark;
    hasMark_ = true;
    hasContent_ = false;
}

void DialectWriter::writeMark() {
    if (!hasMark_) return;
    hasMark_ = false;
    setLook(mark_);
    protectStackSign();
    body_ += "\\par\n";
    paragraphStart_ = body_.size();
    startLook_ = look_;
    hasLeftStart_ = false;
}

// Settings hold for the whole paragraph and are known at its end. A group that is open from the
// paragraph before and ends within this one would take them along, so it ends before them and
// begins anew. A stack's mark stays: twice it would be two stacks.
void DialectWriter::insertSettings(DialectParagraph const& paragraph) {
    std::string words;
    appendWord(words, "pard");
    if (paragraph.firstIndent != 0) appendWord(words, "fi", paragraph.firstIndent);
    if (paragraph.leftIndent != 0) appendWord(words, "li", paragraph.leftIndent);
    for (int const stop : paragraph.tabs)
        appendWord(words, "tx", stop);
    words += ' ';
    if (hasLeftStart_ && startLook_ != DialectLook() && !startLook_.isStackMark) {
        words.insert(0, 1, '}');
        words += '{';
        appendLook(words, startLook_);
        words += ' ';
    }
    body_.insert(paragraphStart_, words);
    if (stackSignAt_ != kNowhere) stackSignAt_ += words.size();
}

std::string DialectWriter::head() const {
    std::string text = "{\\rtf1\\ansi";
    std::string fonts;
    for (std::size_t i = 0; i < fonts_.size(); ++i) {
        if (fonts_[i].isUsed) appendFont(fonts, i, fonts_[i].face);
    }
    if (!fonts.empty()) text += "{\\fonttbl" + fonts + "}";
    if (!colors_.empty()) text += "{\\colortbl";
    for (unsigned int const rgb : colors_) {
        appendWord(text, "red", rgb & 0xFF);
        appendWord(text, "green", (rgb >> 8) & 0xFF);
        appendWord(text, "blue", (rgb >> 16) & 0xFF);
        text += ';';
    }
    if (!colors_.empty()) text += '}';
    return text += '\n';
}

std::string DialectWriter::finish(DialectParagraph const& last) {
    if (hasContent_) endParagraph(last, look_);
    mark_ = look_;  // the last one has the look of what is ahead, whatever its own
    writeMark();
    closeLook();
    body_ += '}';
    body_.insert(0, head());
    return std::move(body_);
}

}  // namespace tzhost
