#pragma once

// Texts as a screen may show them. A name or a text of a drawing may hold control characters, which
// a terminal would obey: they would move its cursor, or make it type answers of its own.

#include <string>
#include <string_view>

namespace tzhost {

enum class LineFeeds { kept, shown };

// The text with each control character but tab shown as `\U+001B`. A line feed is kept, or shown as
// well where the text must stay one line.
[[nodiscard]] std::wstring visible(std::wstring_view text, LineFeeds lineFeeds = LineFeeds::kept);
// The same in UTF-8; a byte that is no UTF-8 becomes U+FFFD.
[[nodiscard]] std::string visible(std::string_view text, LineFeeds lineFeeds);

}  // namespace tzhost
