#pragma once

#include <string>
#include <string_view>
#include <vector>

// What the Tab key makes of a line that is being typed. Nothing here looks at the terminal.
namespace tzdraft {

struct Completion {
    std::wstring insert;                // goes in at the cursor
    std::vector<std::wstring> choices;  // what it could become, when that is not decided yet
};

// Of the word before the cursor, by words that compare without regard to case, and in lower case
// after a small letter. Words of every language begin with "_" and are offered after one.
[[nodiscard]] Completion completeWord(std::wstring_view typed,
                                      std::vector<std::wstring> const& words);

// The same of the whole text, by names, which may hold blanks.
[[nodiscard]] Completion completeName(std::wstring_view typed,
                                      std::vector<std::wstring> const& names);

// Of the whole text as the name of a file, relative to the working folder; a folder gets a slash.
// Names that begin with a dot are offered when the dot is typed. A name without a slash is one of
// `home` instead, unless that is empty.
[[nodiscard]] Completion completeFile(std::wstring_view typed, std::wstring_view home = {});

}  // namespace tzdraft
