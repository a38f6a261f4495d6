#pragma once

// What the module makes known to the host at load, and takes back at unload: its classes, its
// service, its commands, and for each drawing the functions of the interpreter. Called by the entry
// alone, in the order in which they stand here.

void registerClasses();
void registerService();
// The names of the seven commands: fixed global ones, and local ones from the resources, empty when
// missing.
void InitGlobalStrings();
// Adds the commands under those names to the module's group. But for MTEXTPROPERTIES each one is
// told to the debug output and gets its help registered.
void registerCommands();

// For one drawing: false as soon as the host refuses a function; those defined before it stay.
[[nodiscard]] bool defineFunctions();
void undefineFunctions();
// Runs the function that the interpreter called; false for one without a body.
[[nodiscard]] bool invokeFunction();

// They take back what was registered, and do no harm when it was not.
void unregisterClasses();
void unregisterService();
void unregisterCommands();
