#pragma once

// Numbers of character sets, as font tables and text styles hold them: 0 to 255 in the text styles
// of a drawing, any 32-bit number elsewhere. These are the ones with a meaning of their own.
enum Charset : int {
    kAnsiCharset = 0,
    kDefaultCharset = 1,
    kSymbolCharset = 2,
    kMacCharset = 77,
    kShiftJisCharset = 128,
    kHangulCharset = 129,
    kJohabCharset = 130,
    kGb2312Charset = 134,
    kChineseBig5Charset = 136,
    kGreekCharset = 161,
    kTurkishCharset = 162,
    kVietnameseCharset = 163,
    kHebrewCharset = 177,
    kArabicCharset = 178,
    kBalticCharset = 186,
    kRussianCharset = 204,
    kThaiCharset = 222,
    kEastEuropeCharset = 238,
    kOemCharset = 255,
};
