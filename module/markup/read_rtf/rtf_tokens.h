#pragma once

#include <climits>
#include <string_view>

// What rich text is made of, below what its words mean: control words, groups, signs, characters.
// Every function moves a cursor on and stops at the terminating zero.
//
//   wchar_t const* cursor = L"fs28 x";              // after the backslash
//   int value;
//   std::wstring_view word = readControlWord(cursor, value);   // "fs", 28; the cursor is on "x"

// The value of a word without a number.
inline constexpr int kNoValue = INT_MIN;

// The small letters at the cursor, which stands after a backslash, the number after them and one
// blank. Empty when no letter stands there, though a number may. The view is into the text.
[[nodiscard]] std::wstring_view readControlWord(wchar_t const*& cursor, int& value);

// One step of the walk over rich text. All readers of groups walk by these steps; a reader that
// treats something in its own way (one leaves a closing brace to its caller, say) goes back to
// where the step began and does it there.
struct RtfStep {
    enum Kind {
        end,        // of the text; the cursor does not move
        open,       // "{"
        close,      // "}"
        word,       // a control word, with its number and blank
        symbol,     // a backslash without a word; the cursor stands on what it escapes
        character,  // any other
    };
    Kind kind = end;
    wchar_t const* start = nullptr;
    std::wstring_view name;  // of a word
    int value = kNoValue;    // of a word
};
[[nodiscard]] inline RtfStep nextStep(wchar_t const*& cursor) {
    RtfStep step;
    step.start = cursor;
    if (*cursor == 0) return step;
    wchar_t const c = *cursor++;
    if (c == L'\\') {
        step.name = readControlWord(cursor, step.value);
        step.kind = step.name.empty() ? RtfStep::symbol : RtfStep::word;
    } else {
        step.kind = c == L'{' ? RtfStep::open : c == L'}' ? RtfStep::close : RtfStep::character;
    }
    return step;
}

// To the "}" that closes the group in which the cursor stands, but not over it. Escaped braces do
// not count; words are passed over as characters, since none holds a brace.
void IgnoreToMatchingBrace(wchar_t const*& cursor);

// The same, and over that "}".
void skipGroupRest(wchar_t const*& cursor);
