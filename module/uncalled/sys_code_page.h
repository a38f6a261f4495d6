#pragma once

// Nothing calls it yet: it is for the dialog editor's list of text styles, where an East Asian page
// decides the charset of a stroke font.

// The number of the system's code page: the variable SYSCODEPAGE behind its last underscore, or
// whole without one. 0 when no number stands there.
[[nodiscard]] int SysCodePage();
