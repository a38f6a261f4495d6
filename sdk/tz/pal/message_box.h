#pragma once

// Messages that wait for the user to have seen them. This host shows them as lines and goes on.

#include "tz/export.h"

// Styles of a message. They choose only the icon, since "seen" is the only answer.
constexpr unsigned kMessageBoxError = 0x10;
constexpr unsigned kMessageBoxWarning = 0x30;

// [any] Shows a text. The owner is ignored; the caption may be null. Returns 1, the user's "OK".
TZ_API int MessageBox(void* owner, wchar_t const* text, wchar_t const* caption, unsigned style);

class TwHostMessageBox {
public:
    // [any] A message without owner and caption. Returns 1, the user's "OK".
    static TZ_API int simple(wchar_t const* text, unsigned style);
};
