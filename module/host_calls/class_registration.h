#pragma once

#include "tz/rx/class.h"

// How the module's runtime classes reach the host's registry.
//
//   TzRxClass* TzxEditMtext::rxInit() {
//       return registerRuntimeClass(gpDesc, L"TzxEditMtext", L"TzRxObject", create);
//   }

// Registers a class and keeps its descriptor in `descriptor`, or returns the one that is there.
// Ends the process with "Class mismatch" when the name now stands for another class.
TzRxClass* registerRuntimeClass(TzRxClass*& descriptor,
                                wchar_t const* name,
                                wchar_t const* parent,
                                TzRxCreator creator);
// Takes the class out of the registry and zeroes `descriptor`.
void unregisterRuntimeClass(TzRxClass*& descriptor);
