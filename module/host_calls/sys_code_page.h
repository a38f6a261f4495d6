#pragma once

// The number of the system's code page: the variable SYSCODEPAGE after its last underscore, or
// whole without one. 0 when no number stands there.
[[nodiscard]] int SysCodePage();
