#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tz/text/string.h"

// One session of an editor that holds markup: the in-place, the raw and the external one.
namespace tzhost {

// The program that serves for the in-place and raw editors, empty for none.
struct EditorConfiguration {
    std::string textEditor;
    std::vector<std::wstring> inPlaceEditors;  // values of MTEXTED that name an in-place editor
};
[[nodiscard]] EditorConfiguration& editorConfiguration();

// Edits a text: with the next block of the script, else with the program, else not at all. The new
// contents, or nothing when the user left without accepting or the program failed; then one message
// has said why, and what was edited lies in a file whose name was printed. A text left unchanged
// comes back byte for byte.
[[nodiscard]] std::optional<TzString> editMarkup(TzString const& contents,
                                                 std::string const& program);

}  // namespace tzhost
