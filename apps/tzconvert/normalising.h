#pragma once

#include <string>

#include "apps/tzconvert/streams.h"
#include "apps/tzconvert/warnings.h"

namespace tzconvert {

// Takes a whole file of any RTF as the RTF that the converter reads, or writes that to `target`,
// which is standard output when it is empty. What is left out is a warning.
[[nodiscard]] Failure
readNormalised(std::string const& file, std::wstring& text, Warnings& warnings);
[[nodiscard]] Failure
normaliseFile(std::string const& file, std::string const& target, Warnings& warnings);

}  // namespace tzconvert
