#pragma once

// Texts with places that are filled in, each a "%s", and the way back from such a text to what was
// filled in. So are the messages of libraries said in the language of the session: a library speaks
// English, and its message is found by its form.
//
//   filled(localText("%s excludes %s"), {"--font", "--font-file"});
//   partsOf("a.so: file too short", "%s: file too short");   // {"a.so"}

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

using TextParts = std::vector<std::string>;

// The text with a part in each of its places, in order. Parts that are left over are left out.
[[nodiscard]] std::string filled(std::string_view text, TextParts const& parts);

// What stands in a message in the places of a text, each as short as can be; nothing when the
// message has another form.
[[nodiscard]] std::optional<TextParts> partsOf(std::string_view message, std::string_view text);

// A message of a library that has the form of one of `texts`, the first that fits: that text in the
// language of the session, with its parts said by `part`. Any other message is as it was.
[[nodiscard]] std::string localMessage(std::string const& message,
                                       std::span<char const* const> texts,
                                       std::string (*part)(std::string const&));

}  // namespace tzhost
