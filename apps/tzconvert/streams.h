#pragma once

// Input and output of the program: files by name, or its standard streams.

#include <optional>
#include <string>
#include <string_view>

namespace tzconvert {

// What is read or written failed: one line saying what and why.
using Failure = std::optional<std::string>;

// Tells a line on standard error, under the program's name. Control characters, which a file's name
// may hold, are shown and not obeyed.
void tell(std::string const& line);

// An input's name in messages: "-" is standard input.
[[nodiscard]] std::string shownName(std::string const& file);

// Takes a whole file, or standard input for "-", as text. A file that cannot be read, is no UTF-8
// or holds a zero character is refused.
[[nodiscard]] Failure readText(std::string const& file, std::wstring& text);

// The same with any bytes, which may have zeros among them.
[[nodiscard]] Failure readBytes(std::string const& file, std::string& bytes);

// Writes all of a text as UTF-8 to standard output.
[[nodiscard]] Failure writeText(std::wstring_view text);
// Writes bytes, to standard output for an empty name. A file is the old or the new one, whatever
// happens.
[[nodiscard]] Failure writeBytes(std::string const& file, std::string_view bytes);

// That a file is as it was before, and why.
[[nodiscard]] Failure notWritten(std::string const& file, std::string const& reason);

}  // namespace tzconvert
