#pragma once

// The host's fixed table of letter case: simple one-to-one pairs, the same on every machine and
// under every locale. Characters without the other case come back as they are.

namespace tzhost {

[[nodiscard]] wchar_t lowerOf(wchar_t c);
[[nodiscard]] wchar_t upperOf(wchar_t c);

}  // namespace tzhost
