#include "host/command_line/script_source.h"

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <iostream>
#include <sstream>
#include <utility>

#include "host/text/local_text.h"
#include "host/text/system_words.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

constexpr std::wstring_view kCancel = L"^C";
constexpr std::wstring_view kComment = L";;";
constexpr std::wstring_view kBlockStart = L"<<<";
constexpr std::wstring_view kBlockEnd = L">>>";
constexpr std::wstring_view kBlockCancel = L">>>cancel";
constexpr std::wstring_view kBlockEscape = L">>>>";

constexpr std::size_t kMostBytes = 4 * (kLongestAnswer + 1);
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

using Traits = std::istream::traits_type;

// Reads up to a line end and keeps at most `most` bytes. False at the end of the text.
bool readBytes(std::streambuf& from, std::size_t most, std::string& bytes, bool& isCut) {
    int c = from.sbumpc();
    if (Traits::eq_int_type(c, Traits::eof())) return false;
    for (; !Traits::eq_int_type(c, Traits::eof()) && c != '\n'; c = from.sbumpc()) {
        if (bytes.size() < most) {
            bytes += Traits::to_char_type(c);
        } else {
            isCut = true;
        }
    }
    if (!isCut && bytes.ends_with('\r')) bytes.pop_back();
    return true;
}

struct Fault {
    std::size_t at;
    wchar_t const* what;
};

// The first thing that no script holds. Names would end at a zero character.
std::optional<Fault> faultIn(std::string_view bytes) {
    std::size_t const bad = firstBadByte(bytes);
    std::size_t const zero = bytes.substr(0, bad).find('\0');
    if (zero != bytes.npos) return Fault{zero, forLocalText(L"this line holds a zero character")};
    if (bad == kAllUtf8) return std::nullopt;
    return Fault{bad, forLocalText(L"this line is not UTF-8")};
}

std::wstring_view withoutBlanksBehind(std::wstring_view text) {
    return text.substr(0, text.find_last_not_of(L" \t") + 1);
}

}  // namespace

ScriptSource::ScriptSource(std::string name, std::unique_ptr<std::istream> text)
    : name_(std::move(name)), text_(std::move(text)) {}

ScriptSource::ScriptSource(std::string_view text, std::string name)
    : ScriptSource(std::move(name), std::make_unique<std::istringstream>(std::string(text))) {}

std::unique_ptr<ScriptSource> ScriptSource::open(std::string const& file, std::string& error) {
    if (file == "-") {
        return std::make_unique<ScriptSource>(localText("standard input"),
                                              std::make_unique<std::istream>(std::cin.rdbuf()));
    }
    errno = 0;
    std::ifstream input(file, std::ios::binary);
    std::ostringstream whole;
    // A folder opens, and its first read fails.
    if (!input || (input.peek() != Traits::eof() && !(whole << input.rdbuf())) || errno == EISDIR) {
        error = file + ": " + localText("the script cannot be read") + ": " + systemWords(errno);
        return nullptr;
    }
    std::string const text = whole.str();
    if (auto const fault = faultIn(text)) {
        auto const at = text.begin() + static_cast<std::ptrdiff_t>(fault->at);
        error = file + ":" + std::to_string(1 + std::count(text.begin(), at, '\n')) + ": " +
                toUtf8(localText(fault->what));
        return nullptr;
    }
    return std::make_unique<ScriptSource>(text, file);
}

std::wstring ScriptSource::placeOf(int line) const {
    return fromUtf8(name_) + L":" + std::to_wstring(line) + L": ";
}

void ScriptSource::fail(int line, wchar_t const* what) {
    fault_ = placeOf(line) + localText(what);
    text_.reset();
    peeked_.reset();
}

std::optional<ScriptSource::Line> ScriptSource::read(Length length) {
    if (peeked_) return std::exchange(peeked_, std::nullopt);
    if (!text_) return std::nullopt;
    Line line;
    std::string bytes;
    std::size_t const most = length == Length::any ? std::string::npos : kMostBytes;
    if (!readBytes(*text_->rdbuf(), most, bytes, line.isTooLong)) return std::nullopt;
    line.number = ++lines_;
    if (line.number == 1 && bytes.starts_with(kByteOrderMark))
        bytes.erase(0, kByteOrderMark.size());
    if (line.isTooLong) return line;
    if (auto const fault = faultIn(bytes)) {
        fail(line.number, fault->what);
        return std::nullopt;
    }
    line.text = fromUtf8(bytes);
    line.isTooLong = length == Length::bounded && line.text.size() > kLongestAnswer;
    return line;
}

ScriptSource::Line const* ScriptSource::peek() {
    while (!peeked_) {
        auto line = read(Length::bounded);
        if (!line) return nullptr;
        bool const isComment = !line->isTooLong && line->text.starts_with(kComment);
        if (!isComment) peeked_ = std::move(line);
    }
    return &*peeked_;
}

// The line that was peeked at last opens the block.
std::optional<EditorBlock> ScriptSource::readBlock() {
    int const start = peeked_->number;
    peeked_.reset();
    EditorBlock block;
    bool isFirst = true;
    while (auto line = read(Length::any)) {
        if (line->text == kBlockEnd) return block;
        if (line->text == kBlockCancel) {
            block.accepted = false;
            return block;
        }
        if (!std::exchange(isFirst, false)) block.text += L'\n';
        block.text += line->text == kBlockEscape ? kBlockEnd : std::wstring_view(line->text);
    }
    if (fault_.empty())
        fail(start, forLocalText(L"this block has no end, a line >>> or >>>cancel"));
    return std::nullopt;
}

// Where a fault ended the script nobody knows what was meant for the editor: it is left.
std::optional<EditorBlock> ScriptSource::takeBlock() {
    Line const* const line = peek();
    bool const opens = line != nullptr && withoutBlanksBehind(line->text) == kBlockStart;
    std::optional<EditorBlock> block = opens ? readBlock() : std::nullopt;
    if (!block && !fault_.empty()) block = EditorBlock{L"", false};
    return block;
}

// A script that a fault ended has no end of its own that would be worth a line.
Answer ScriptSource::last() {
    if (!fault_.empty()) {
        isBroken_ = true;
        return {Answer::Kind::fault, std::exchange(fault_, {})};
    }
    hasEnded_ = true;
    return {Answer::Kind::end, isBroken_ ? std::wstring() : placeOf(lines_)};
}

Answer ScriptSource::next(AnswerRequest const& request) {
    Line const* const line = peek();
    if (line == nullptr) return last();
    taken_ = line->number;
    if (line->isTooLong) {
        peeked_.reset();
        return {Answer::Kind::tooLong, {}};
    }
    bool const isString = request.kind == QuestionKind::string;
    std::wstring_view const word =
        isString ? std::wstring_view(line->text) : withoutBlanksBehind(line->text);
    if (!isString && word == kBlockStart) {
        int const start = line->number;
        if (!readBlock()) return last();
        return {Answer::Kind::fault, placeOf(start) + localText(L"no editor takes this block")};
    }
    if (word == kCancel) {
        peeked_.reset();
        return {Answer::Kind::cancel, {}};
    }
    return {Answer::Kind::line, std::exchange(peeked_, std::nullopt)->text};
}

}  // namespace tzhost
