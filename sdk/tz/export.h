#pragma once

// Marks what a shared library of the system gives to others: the host's operations and classes in
// libtz.so.1, and in the module the names of its export list. Everything else stays hidden.
#define TZ_API __attribute__((visibility("default")))
