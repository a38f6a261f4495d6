#pragma once

// UTF-8 in and out, fast where a text is plain.

#include <cstddef>
#include <string>
#include <string_view>

#include "host/text/local_text.h"

namespace tzconvert {

// The fault of bytes that are none.
inline constexpr char const* kNotUtf8 = tzhost::forLocalText("not UTF-8");

// How far bytes were decoded, and why not to their end.
struct Decoded {
    std::size_t size;   // the bytes that are in the text
    char const* fault;  // of the byte after them, which is refused, in English; null when none is
};

// Decodes a piece of UTF-8 without zeros after `text`. Up to three bytes at its end that begin a
// character are left for the next piece.
[[nodiscard]] Decoded decodeText(std::string_view bytes, std::wstring& text);

// Appends the UTF-8 of a text; a value that is no Unicode scalar becomes U+FFFD.
void encodeText(std::wstring_view text, std::string& bytes);

}  // namespace tzconvert
