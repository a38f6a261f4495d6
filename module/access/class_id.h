#pragma once

#include "tz/pal/windows_calls.h"
#include "tz/text/std_str.h"

// A class id as text, which is empty when the host fails. Returns the host's result, 0 for success.
[[nodiscard]] int StringFromCLSID(_GUID const& id, CStdStr<wchar_t>& text);
