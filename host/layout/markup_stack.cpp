#include "host/layout/markup_stack.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "host/layout/markup_scan.h"

namespace tzhost::markup {
namespace {

// A text counts as a stack when it holds one of these. The letters after the three real stack
// characters belong to the format all the same: a text with a "T" in it is a stack of one part.
constexpr std::wstring_view kStackMarks = L"/#^TzmtedRes.dll";

struct SignRow {
    wchar_t sign;
    StackKind kind;
};

constexpr std::array<SignRow, 3> kStackSigns{{
    {L'/', StackKind::over},
    {L'#', StackKind::fraction},
    {L'^', StackKind::tolerance},
}};

// Where a walk over the arguments of a stack stands. Their end is found with the character after
// an escape pair taken unseen; the stack character is looked for with Unicode codes left out.
struct Walk {
    unsigned int unseen = 0;  // characters still to take without a test for the end
    unsigned int hidden = 0;  // characters of a Unicode code still to leave out
    bool escaped = false;     // after a backslash

    [[nodiscard]] std::uint32_t bit() const {
        return std::uint32_t{1} << (unseen * 7 + (escaped ? 6 : hidden));
    }
    void step(wchar_t c);
};

void Walk::step(wchar_t c) {
    if (unseen > 0) {
        --unseen;
    } else if (c == L'\\') {
        unseen = 2;
    }
    if (escaped) {
        escaped = false;
        hidden = c == L'U' || c == L'u' ? kUnicodeArguments : 0;
    } else if (hidden > 0) {
        --hidden;
    } else {
        escaped = c == L'\\';
    }
}

}  // namespace

bool StackProbe::holdsMark(std::size_t position) {
    seen_.resize(contents_.size());
    Walk walk;
    for (; position < contents_.size(); ++position) {
        wchar_t const c = contents_[position];
        if (c == 0 || (walk.unseen == 0 && c == L';') || (seen_[position] & walk.bit()) != 0) {
            return false;
        }
        seen_[position] |= walk.bit();
        bool const isUnicodeLetter = walk.escaped && (c == L'U' || c == L'u');
        if (walk.hidden == 0 && !isUnicodeLetter && kStackMarks.find(c) != kStackMarks.npos) {
            return true;
        }
        walk.step(c);
    }
    return false;
}

StackParts splitStack(std::wstring const& arguments) {
    StackParts parts;
    auto const append = [&parts](wchar_t c) { (parts.split ? parts.lower : parts.upper) += c; };
    for (wchar_t const* cursor = arguments.c_str(); *cursor != 0;) {
        wchar_t const c = *cursor++;
        if (c != L'\\') {
            auto const sign = std::find_if(kStackSigns.begin(), kStackSigns.end(),
                                           [c](SignRow const& row) { return row.sign == c; });
            if (parts.split || sign == kStackSigns.end()) {
                append(c);
            } else {
                parts.split = true;
                parts.kind = sign->kind;
            }
            continue;
        }
        wchar_t escaped = *cursor;
        if (escaped == 0) {
            break;
        }
        ++cursor;
        if (escaped == L'U' || escaped == L'u') {
            escaped = scanUnicode(cursor);
        }
        if (escaped != 0) {
            append(escaped);
        }
    }
    return parts;
}

}  // namespace tzhost::markup
