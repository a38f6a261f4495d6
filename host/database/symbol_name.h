#pragma once

#include <string_view>

// Which names the records of a drawing's tables may have.
namespace tzhost {

// Whether a text can be such a name, or a pattern for some, or the name of a record of another
// drawing, which has a bar in it: at most 255 characters, no control characters, and none of
// < > / \ " : ; = `
[[nodiscard]] bool isNameOrPattern(std::wstring_view text);
// Whether a record may get this name: not empty, no blanks at its ends, and no ? * , | either.
[[nodiscard]] bool isSymbolName(std::wstring_view text);

}  // namespace tzhost
