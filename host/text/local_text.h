#pragma once

// The host's own texts in the language of the session. The English text stands in the code and
// finds the one that is shown:
//
//   say(localText(L"An answer is needed."));
//   constexpr wchar_t const* kWords = forLocalText(L"Single Multiple");
//   say(localText(kWords));
//
// A language has a table of them. It is UTF-8, one text a line: the English one, a tab, the
// translation, both with the escapes of host/text/text_escapes.h; lines that begin with # and empty
// ones are skipped. A text that the table lacks is shown in English.

#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

struct LocalTextRow {
    std::wstring english;
    std::wstring local;
    int line;
};

// The rows of a table. What cannot be used is left out and added to `faults`, each "12: what is
// wrong": a line that is no row, a text that stands twice, and a translation whose conversions are
// not those of the English format, since it would be filled with other arguments.
[[nodiscard]] std::vector<LocalTextRow> readLocalTexts(std::string_view bytes,
                                                       std::vector<std::string>& faults);

// Makes the texts of a table those that are shown; an empty one brings English back. Texts given
// out before are no longer valid.
void setLocalTexts(std::vector<LocalTextRow> rows);

// The text to show, which may be `english` itself; valid until the language changes. Takes no
// memory.
[[nodiscard]] wchar_t const* localText(wchar_t const* english);
// The same in UTF-8.
[[nodiscard]] std::string localText(char const* english);

// Marks a text that is looked up elsewhere, so that the tables' test finds it.
constexpr wchar_t const* forLocalText(wchar_t const* english) {
    return english;
}
constexpr char const* forLocalText(char const* english) {
    return english;
}

}  // namespace tzhost
