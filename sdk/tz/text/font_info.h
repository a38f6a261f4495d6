#pragma once

#include "tz/export.h"
#include "tz/text/charset.h"
#include "tz/text/std_str.h"

// The fonts of the machine, by file and by face. Faces are known by their exact family name: an
// unknown face or file is answered with an empty text, never with a stand-in. Stroke fonts
// (`*.shx`) are not known here.
//
//   CStdStrW file;
//   tzFontInfo().FontNameToFile(L"DejaVu Sans", false, false, file);
//
// The catalogue is opened at the first question, and answers are kept. [any]

// Pitch, the low four bits of a pitch-and-family number.
enum class FontPitch : int { kDefault = 0, kFixed = 1, kVariable = 2 };

// Family, the high four bits.
enum class FontFamily : int {
    kDoNotCare = 0,
    kRoman = 0x10,
    kSwiss = 0x20,
    kModern = 0x30,
    kScript = 0x40,
    kDecorative = 0x50,
};

// One face as the catalogue knows it.
struct CFontInfoItem {
    CStdStrW faceName;
    CStdStrW fileName;  // of its regular form, without a folder
    Charset charset = kAnsiCharset;
    FontPitch pitch = FontPitch::kDefault;
    FontFamily family = FontFamily::kDoNotCare;
    bool hasBold = false;
    bool hasItalic = false;
};

class TZ_API CFontInfo {
public:
    virtual ~CFontInfo() = default;

    // The face that a font file holds, with its form; the file may have a folder, which does not
    // count. For an unknown file the face is empty and everything else 0 and false. True when
    // known.
    virtual bool FileToFontName(CStdStrW const& file,
                                CStdStrW& face,
                                bool& bold,
                                bool& italic,
                                Charset& charset,
                                FontPitch& pitch,
                                FontFamily& family) const = 0;
    // The file, without a folder, of a face's form; the nearest form there is when it has no such
    // form. Empty for an unknown face. True when known.
    virtual bool
    FontNameToFile(CStdStrW const& face, bool bold, bool italic, CStdStrW& file) const = 0;
    // False, with an item without a name, for an unknown face.
    virtual bool FontInfoFromTypeFaceName(CStdStrW const& face, CFontInfoItem& item) const = 0;
    // A face's name in its own language to its English one, and back; an unknown one comes back as
    // it is.
    [[nodiscard]] virtual CStdStrW TypefaceNativeToEnglish(CStdStrW const& face) const = 0;
    [[nodiscard]] virtual CStdStrW TypefaceEnglishToNative(CStdStrW const& face) const = 0;
};

// The font service; lives with the process.
[[nodiscard]] TZ_API CFontInfo& tzFontInfo();

// The number that font tables and text styles hold for both.
[[nodiscard]] TZ_API int getPitchAndFamilyValueFromEnum(FontPitch pitch, FontFamily family);
