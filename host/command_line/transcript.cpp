#include "host/command_line/transcript.h"

#include <utility>

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

void Transcript::show(std::wstring_view text) {
    if (text.empty()) return;
    cursor_ = text.ends_with(L'\n') ? Cursor::lineStart : Cursor::inLine;
    if (screen_) screen_(text);
}

void Transcript::freshLine() {
    if (cursor_ == Cursor::inLine || cursor_ == Cursor::behindAnswer) show(L"\n");
    cursor_ = Cursor::lineStart;
}

void Transcript::prompt(std::wstring_view text) {
    freshLine();
    show(withoutLineFeed(text));
}

void Transcript::answer(std::wstring_view text) {
    bool const isLineEmpty = cursor_ == Cursor::lineStart && text.empty();
    show(text);
    cursor_ = isLineEmpty ? Cursor::belowAnswer : Cursor::behindAnswer;
}

void Transcript::message(std::wstring_view text) {
    if (text.empty()) return;
    if (cursor_ == Cursor::belowAnswer) {
        cursor_ = Cursor::lineStart;
        show(withoutLineFeed(text));
        return;
    }
    if (cursor_ == Cursor::behindAnswer && text.front() != L'\n') freshLine();
    bool const isBlankLine = text.find_first_not_of(L'\n') == std::wstring_view::npos;
    show(cursor_ == Cursor::lineStart && !isBlankLine ? withoutLineFeed(text) : text);
}

void Transcript::line(std::wstring_view text) {
    freshLine();
    show(text);
    freshLine();
}

void Transcript::answeredOnTerminal() {
    cursor_ = Cursor::belowAnswer;
}

}  // namespace tzhost
