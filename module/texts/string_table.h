#pragma once

#include "tz/mte/globals.h"

// The module's texts with the values of system variables put in: "{NAME}" in a text stands for the
// variable's value, "{(}" and "{)}" for braces.
//
//   TzString const prompt = gStringTable[1065];
//
// The table itself, gStringTable, is among the exported variables.
