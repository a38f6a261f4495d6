#pragma once

// What the module makes known to the host at load, and takes back at unload: its classes, its
// service, its commands, and for each drawing the functions of the interpreter. Called by the entry
// alone, in the order in which they stand here.

void registerClasses();
void registerService();
// The names of the seven commands: fixed global ones, and local ones from the resources, empty when
// missing.
void InitGlobalStrings();
// Adds the commands under those names to the module's group. Each command but MTEXTPROPERTIES is
// also reported to the debug output and gets help.
void registerCommands();

// For one drawing: false as soon as the host refuses a function; those defined before it stay.
[[nodiscard]] bool defineFunctions();
void undefineFunctions();
// Runs the function that the interpreter called; false for one without a body.
[[nodiscard]] bool invokeFunction();

// These take back what was registered, and change nothing when it was not registered.
void unregisterClasses();
void unregisterService();
void unregisterCommands();
