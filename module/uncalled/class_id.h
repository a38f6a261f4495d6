#pragma once

#include "tz/pal/windows_calls.h"
#include "tz/text/std_str.h"

// A class id as text, which is empty when the host fails. Returns the host's result, 0 for success.
// Nothing calls it: it is part of what the module promises of its access to the host.
[[nodiscard]] int StringFromCLSID(_GUID const& id, CStdStr<wchar_t>& text);
