#pragma once

#include <string>
#include <string_view>

// What the reader of rich text passed over, for programs that warn of it.
struct RtfLosses {
    struct Kind {
        int count = 0;
        std::wstring first;  // the word that the first of them has

        void note(std::wstring_view word) {
            if (count++ == 0) first = word;
        }
    };
    Kind unknownWords;             // that say something about the text
    Kind texts;                    // of groups that an unknown word opens
    bool hasTextAfterEnd = false;  // after a "}" that closes more than was opened
};

// Whether a document says something about its text by a word that the reader does not know. It does
// not by the words of every document's head, nor by those of paragraphs.
[[nodiscard]] bool isWordLost(std::wstring_view word, int value);

// Whether the rest of a group that an unknown word opens holds text of the document. A few groups
// hold names and numbers alone. `begin` and `end` lie in the group.
[[nodiscard]] bool isTextLost(std::wstring_view word, wchar_t const* begin, wchar_t const* end);

// Whether anything but the ends of groups and blanks stands at the cursor or after it.
[[nodiscard]] bool isMoreThanBlank(wchar_t const* cursor);
