#pragma once

#include <string>

#include "apps/tzconvert/streams.h"
#include "apps/tzconvert/warnings.h"

namespace tzconvert {

// Takes a whole file of any RTF as the RTF that the converter reads. What is left out is a warning.
[[nodiscard]] Failure
readNormalised(std::string const& file, std::wstring& text, Warnings& warnings);
// The same in UTF-8.
[[nodiscard]] Failure
readNormalised(std::string const& file, std::string& document, Warnings& warnings);

}  // namespace tzconvert
