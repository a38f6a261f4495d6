#pragma once

#include <string>
#include <vector>

// Which programs serve as editors.
namespace tzhost {

struct EditorConfiguration {
    std::string textEditor;      // command of the in-place and raw editors; may be empty
    std::string richTextEditor;  // command of the dialog editor; may be empty
    std::vector<std::wstring> inPlaceEditors;  // values of MTEXTED that name an in-place editor
};
[[nodiscard]] EditorConfiguration& editorConfiguration();

// The command of the in-place and raw editors: the configured one. Without one a session at a
// terminal takes `editor` or `vi`, whichever the folders of $PATH hold; a script has none then, as
// such a program would wait for keys. Relative folders of $PATH are passed over, since a stranger's
// folder may be the working folder. Empty when there is none.
[[nodiscard]] std::string textEditorProgram();

}  // namespace tzhost
