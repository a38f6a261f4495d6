#pragma once

// The settings of an alignment in system variables: a value that cannot be read, or has another
// type, reads as the default. Writing gives whether the host took the value.

[[nodiscard]] int getSysVarInt16(wchar_t const* name, int defaultValue);
[[nodiscard]] bool setSysVarInt16(wchar_t const* name, int value);
[[nodiscard]] double getSysVarDouble(wchar_t const* name, double defaultValue);
[[nodiscard]] bool setSysVarDouble(wchar_t const* name, double value);
