#pragma once

// Warnings: what a conversion could not carry over, in one line a kind with its count.

#include <string>
#include <string_view>
#include <vector>

#include "apps/tzconvert/conversion.h"

namespace tzconvert {

using Warnings = std::vector<std::string>;  // without the file's name

// What was met in markup that was read, and in RTF.
void addIncidents(Warnings& warnings, MarkupFindings const& found);
void addLosses(Warnings& warnings, RtfLosses const& losses);
// That an input looks like one of the other direction, by its first characters.
void addLook(Warnings& warnings, Direction direction, std::wstring_view input);
void addLook(Warnings& warnings, Direction direction, std::string_view input);

}  // namespace tzconvert
