#pragma once

// The host's debug output: text for developers, which only those see who ask for it.

#include "tz/export.h"

namespace Tzworks::Tzdraft::PAL::Diagnostics {

// [any] Sends a text as it stands; the caller formats it and ends its lines.
TZ_API void outputDebugString(wchar_t const* text);

}  // namespace Tzworks::Tzdraft::PAL::Diagnostics

// [any] The same.
TZ_API void OutputDebugString(wchar_t const* text);
