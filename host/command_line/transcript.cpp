#include "host/command_line/transcript.h"

#include <utility>

#include "host/text/visible_text.h"

namespace tzhost {

namespace {

std::wstring_view withoutLineFeed(std::wstring_view text) {
    if (text.starts_with(L'\n')) text.remove_prefix(1);
    return text;
}

}  // namespace

void Transcript::setScreen(Screen screen) {
    screen_ = std::move(screen);
}

void Transcript::show(Shown kind, std::wstring_view text) {
    if (text.empty() || (isQuiet_ && kind != Shown::problem)) return;
    cursor_ = text.ends_with(L'\n') ? Cursor::lineStart : Cursor::inLine;
    if (screen_) screen_(kind, visible(text));
}

// A line that stands open where problems alone are shown is one of them.
void Transcript::freshLine(Shown next) {
    Shown const kind = isQuiet_ ? Shown::problem : next;
    if (cursor_ == Cursor::inLine || cursor_ == Cursor::afterAnswer) show(kind, L"\n");
    cursor_ = Cursor::lineStart;
}

void Transcript::prompt(std::wstring_view text) {
    freshLine(Shown::prompt);
    show(Shown::prompt, withoutLineFeed(text));
}

void Transcript::answer(std::wstring_view text) {
    if (isQuiet_) return;
    bool const isLineEmpty = cursor_ == Cursor::lineStart && text.empty();
    show(Shown::answer, text);
    cursor_ = isLineEmpty ? Cursor::belowAnswer : Cursor::afterAnswer;
}

void Transcript::message(std::wstring_view text, Shown kind) {
    if (text.empty()) return;
    if (cursor_ == Cursor::belowAnswer) {
        cursor_ = Cursor::lineStart;
        show(kind, withoutLineFeed(text));
        return;
    }
    if (cursor_ == Cursor::afterAnswer && text.front() != L'\n') freshLine(kind);
    bool const isBlankLine = text.find_first_not_of(L'\n') == std::wstring_view::npos;
    show(kind, cursor_ == Cursor::lineStart && !isBlankLine ? withoutLineFeed(text) : text);
}

void Transcript::wholeLine(Shown kind, std::wstring_view text) {
    freshLine(kind);
    show(kind, text);
    freshLine(kind);
}

void Transcript::line(std::wstring_view text) {
    wholeLine(Shown::line, text);
}

void Transcript::problem(std::wstring_view text) {
    wholeLine(Shown::problem, text);
}

void Transcript::error(std::wstring_view text) {
    if (screen_) screen_(Shown::error, visible(text, LineFeeds::shown) + L"\n");
}

void Transcript::answerWasTyped() {
    cursor_ = Cursor::belowAnswer;
}

}  // namespace tzhost
