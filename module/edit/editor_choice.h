#pragma once

// Which of the host's editors opens on a multi-line text: the drafter's choice in MTEXTED.

enum class TextEditorKind {
    inPlace,   // in the drawing
    dialog,    // on rich text, the "old" editor
    raw,       // on the plain markup
    external,  // the program that MTEXTED names
};

// Reads the settings in force. MTEXTED empty or the built-in name means the editor in place, the
// built-in name and "-" the raw one, "OLDEDITOR" the dialog, all without regard to case; any other
// text names an editor of the host's or a program. A process of the Fabric kind only has the editor
// in place, whatever MTEXTED says.
[[nodiscard]] TextEditorKind chooseTextEditor();
