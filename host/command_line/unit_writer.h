#pragma once

// Numbers as the texts of lengths and angles hold them. No locale; each call adds to `text`.

#include <string>

namespace tzhost {

// A finite number with that many decimals, as "%.*f" writes it, but without a sign before a
// zero.
void writeFixed(std::string& text, double value, int decimals);
// The same as "%.*E" writes it, with at least two digits of exponent.
void writeScientific(std::string& text, double value, int decimals);
// A whole number of pieces as "15 1/2", "1/2", "15" or "0": `pieces` are 1 over `denominator`, a
// power of two.
void writeMixed(std::string& text, double pieces, double denominator);

// Cuts a row of digits into the quotient by 12, which stays, and the remainder, 0 to 11.
int divideByTwelve(std::string& digits);

}  // namespace tzhost
