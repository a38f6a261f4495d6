#pragma once

// Selections of multi-line texts, by the names that the host gives to sets.

// The two codes under which a filter names the kind of an entity; the host takes both alike.
enum class KindCode : short { group = 0, result = 5020 };

// Selects multi-line texts only, in a mode of tzedSSGet, and returns its status. After a normal
// status the caller frees the set.
[[nodiscard]] int selectMText(long long* set, wchar_t const* mode, KindCode code);
