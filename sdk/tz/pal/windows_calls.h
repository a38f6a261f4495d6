#pragma once

#include <cstdint>

#include "tz/export.h"

// The part of the host's layer of window-system calls that modules use. A screen exists in numbers
// only: the desktop, the application's window, and the drawing area in it, in pixels from the
// desktop's top left corner.
//
//   RECT desktop{};
//   if (GetWindowRect(GetDesktopWindow(), &desktop)) ...
//
// [any]

// Windows by name; null is none.
using HWND = struct TzWindow const*;

struct POINT {
    std::int32_t x;
    std::int32_t y;
};

struct RECT {
    std::int32_t left;
    std::int32_t top;
    std::int32_t right;
    std::int32_t bottom;
};

struct _GUID {
    std::uint32_t Data1;
    std::uint16_t Data2;
    std::uint16_t Data3;
    std::uint8_t Data4[8];
};

[[nodiscard]] TZ_API HWND GetDesktopWindow();
[[nodiscard]] TZ_API HWND GetApplicationWindow();
// The window that tzedCoordFromWorldToPixel counts its pixels in.
[[nodiscard]] TZ_API HWND GetDrawingAreaWindow();
// 1, or 0 for no window, which leaves `rect` as it is.
TZ_API int GetWindowRect(HWND window, RECT* rect);
// Turns a point of the window's inside into one of the screen; 1, or 0 for no window.
TZ_API int ClientToScreen(HWND window, POINT* point);

// Milliseconds since the host started; wraps after 49 days.
[[nodiscard]] TZ_API std::uint32_t GetTickCount();
// number * numerator / denominator, rounded to nearest, halves away from zero; -1 when the
// denominator is 0 or the result does not fit.
[[nodiscard]] TZ_API int MulDiv(int number, int numerator, int denominator);
// Closes a handle of the host's. This host gives out none, so the call only tells whether `handle`
// could be one: 1, or 0 for null and for all bits set.
TZ_API int CloseHandle(void* handle);

// A class id as text, such as "{00021401-0000-0000-C000-000000000046}", in memory that the caller
// gives back with CoTaskMemFree. 0, or a negative code on failure, with a null text.
[[nodiscard]] TZ_API int StringFromCLSID(_GUID const& id, wchar_t** text);
TZ_API void CoTaskMemFree(void* memory);
