#include "host/editors/markup_lines.h"

namespace tzhost {
namespace {

constexpr std::wstring_view kParagraphEnd = L"\\P";
constexpr std::wstring_view kLineFeedCode = L"\\U+000A";

// The length of the code at the text's start: a backslash with its character, or one character.
std::size_t unitLength(std::wstring_view text) {
    return text.front() == L'\\' && text.size() > 1 ? 2 : 1;
}

}  // namespace

std::wstring markupToLines(std::wstring_view markup) {
    std::wstring lines;
    while (!markup.empty()) {
        std::size_t const length = unitLength(markup);
        std::wstring_view const unit = markup.substr(0, length);
        if (unit == kParagraphEnd) {
            lines += L'\n';
        } else if (unit == L"\n") {
            lines += kLineFeedCode;
        } else {
            lines += unit;
        }
        markup.remove_prefix(length);
    }
    return lines;
}

std::wstring linesToMarkup(std::wstring_view lines) {
    if (lines.ends_with(L'\n')) lines.remove_suffix(lines.ends_with(L"\r\n") ? 2 : 1);
    std::wstring markup;
    while (!lines.empty()) {
        if (lines.starts_with(kLineFeedCode)) {
            markup += L'\n';
            lines.remove_prefix(kLineFeedCode.size());
            continue;
        }
        std::size_t const length = unitLength(lines);
        if (lines.front() == L'\n') {
            markup += kParagraphEnd;
        } else if (length == 2 && lines[1] == L'\n') {
            // A lone backslash at a line's end is a character; it must not become part of the code.
            markup += L"\\\\";
            markup += kParagraphEnd;
        } else if (lines.front() != L'\r' || lines.size() < 2 || lines[1] != L'\n') {
            markup += lines.substr(0, length);
        }
        lines.remove_prefix(length);
    }
    return markup;
}

}  // namespace tzhost
