#pragma once

// The texts of this suite: keywords of every form, by ids of their own.

constexpr unsigned int kTopLeft = 1;      // TL
constexpr unsigned int kWithComma = 2;    // what stands after the comma only serves to match
constexpr unsigned int kManyWords = 3;    // blanks, "=" and parentheses in both parts
constexpr unsigned int kNoSeparator = 4;  // no global part
constexpr unsigned int kTranslated = 5;   // another word in the user's language
constexpr unsigned int kSameGlobal = 6;   // the global word of kTranslated
