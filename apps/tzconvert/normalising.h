#pragma once

#include <string>

#include "apps/tzconvert/streams.h"

namespace tzconvert {

// Takes a whole file of any RTF as the RTF that the converter reads, or writes that to `target`,
// which is standard output when it is empty. What is left out is counted in a line on standard
// error.
[[nodiscard]] Failure readNormalised(std::string const& file, std::wstring& text);
[[nodiscard]] Failure normaliseFile(std::string const& file, std::string const& target);

}  // namespace tzconvert
