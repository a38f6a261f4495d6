#pragma once

// Tells the user that a command has no body yet.
void printNotYetAvailable(wchar_t const* command);
