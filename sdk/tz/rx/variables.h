#pragma once

// System variables as objects that a caller may keep.
//
//   static TzRxVariable const* const cursorType =
//       TzRxVariablesDictionary::get()->getVariable(L"CURSORTYPE");
//   if (cursorType && cursorType->intValue() == 1) ...
//
// A variable's object lives with the process and always gives the value in force.

#include "tz/export.h"
#include "tz/rx/resbuf.h"

class TZ_API TzRxVariable {
public:
    virtual ~TzRxVariable() = default;
    // [any] The name in capitals.
    [[nodiscard]] virtual wchar_t const* name() const = 0;
    // [any] The value as tzedGetVar gives it; 5100, or -5001.
    [[nodiscard]] virtual int getValue(resbuf* result) const = 0;
    // [any] The value as a number: a real is truncated, a text or a point gives 0.
    [[nodiscard]] virtual int intValue() const = 0;
};

class TZ_API TzRxVariablesDictionary {
public:
    // [any] Never null, lives with the process.
    [[nodiscard]] static TzRxVariablesDictionary* get();
    // [any] The variable with that name, whatever its case; null when there is none.
    [[nodiscard]] TzRxVariable const* getVariable(wchar_t const* name) const;

private:
    TzRxVariablesDictionary() = default;
};
