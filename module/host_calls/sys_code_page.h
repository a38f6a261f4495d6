#pragma once

// The number of the system's code page: the part of the variable SYSCODEPAGE after its last
// underscore, or the whole value when it has no underscore. 0 when that is no number.
[[nodiscard]] int SysCodePage();
