#pragma once

#include <string>

// Numbers as the converters write them, whatever the locale.

// After `text`, in decimal.
void appendDecimal(std::wstring& text, long long value);
// After `text`, in that many significant digits without zeros at their end, in the exponent form
// where it is the shorter one: as %g does.
void appendReal(std::wstring& text, double value, int digits = 6);
// After `text`, in capital hex digits, filled up to four.
void appendHex4(std::wstring& text, unsigned int value);
