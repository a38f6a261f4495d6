#pragma once

#include <cstdint>

#include "tz/db/mtext.h"
#include "tz/export.h"
#include "tz/mte/easy_object.h"
#include "tz/text/string.h"

// Variables that the module exports for other host modules to read. They are defined by the module
// and live from its load to its unload; the module alone writes them, on the host's one thread.
// The comment of each begins with its first value.

// The module's texts by their ids, with variables expanded: "{NAME}" stands for the value of a
// system variable, "{(}" and "{)}" for braces. An id without a text gives the empty text. [any]
class TZ_API TzStringTable {
public:
    [[nodiscard]] TzString operator[](unsigned int id) const;
};

// A point and a rectangle of the screen, in pixels.
struct TzScreenPoint {
    std::int32_t x = 0;
    std::int32_t y = 0;
};
struct TzScreenRect {
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t right = 0;
    std::int32_t bottom = 0;
};

extern "C++" {
// Editing.
extern TZ_API double gdJigBoundBoxHeight;  // 0: height of the box dragged last, in drawing units
extern TZ_API std::uint8_t gbUsedIPE;    // 0: whether the last editor run used the in-place editor
extern TZ_API std::int32_t gMTextFixed;  // 0: MTEXTFIXED at the last editor run
extern TZ_API double g_dMTextObjectHeight;  // 0: height of the edited text, for the editor's size
extern TZ_API double g_dTextSize;           // 0: working text size of the dialog editor
extern TZ_API std::int32_t gwysiwyg;  // 0: whether the dialog editor's place matches the drawing
extern TZ_API TzScreenPoint gcPoint;  // zeros: the dialog editor's window
extern TZ_API TzScreenRect gcRect;
extern TZ_API std::int32_t giPoints;  // 16: point size in the dialog editor
extern TZ_API double gdx;             // 0, 0: the edited text's first point
extern TZ_API double gdy;
extern TZ_API EasyObject<TzDbMText>* gpText;  // null: the text being edited
extern TZ_API void* gpFontList;               // null: font list of the dialog editor
extern TZ_API std::uint8_t g_bEnableFieldUI;  // 1: whether fields may be typed as such; set at load
extern TZ_API std::int32_t gPixelsPerInch;    // 0; nothing reads or sets it

// Conversion between markup and rich text.
extern TZ_API std::int32_t g_nDefaultTabTwips;  // 0: default tab width, twips
extern TZ_API double gdTweakFactor;             // 0.72: indents and tabs of the markup over twips
extern TZ_API double g_dWidthFactor;            // 1: scaling of margins
extern TZ_API std::int64_t TZDB_FIELDCODE_MODIFIED;  // 1: flag of a field with a changed code
extern TZ_API wchar_t const* gszStartOfStackToken;   // "\S"
extern TZ_API wchar_t const* gszEndOfStackToken;     // "\s"
extern TZ_API TzString g_sInitialFont;               // empty

// The font map file.
extern TZ_API wchar_t const* gszIniSHXSectMapDatabase;         // "SHX Map"
extern TZ_API wchar_t const* gszIniPostscriptSectMapDatabase;  // "Postscript Map"
extern TZ_API wchar_t const* gszIniMiscSectMapDatabase;        // "Misc Map"
extern TZ_API wchar_t const* gszIniSectProxyFiles;             // "Proxy Fonts"
extern TZ_API wchar_t const* gszIniKeyOneWaySubst;             // "OneWaySubstitution"
extern TZ_API wchar_t const* gszIniKeyBigfontProxy;            // "Default Bigfont Proxy"
extern TZ_API TzString gsExtensionSHX;                         // ".shx"
extern TZ_API TzString gsIniFileDatabase;                      // empty: path of the font map file

// Names that the module registers, empty until it is loaded: the global ones such as "MTEDIT", and
// the local ones in the user's language.
extern TZ_API TzString gsEditMtext_GlobalName, gsEditMtext_LocalName;
extern TZ_API TzString gsCompatibleEditMtext_GlobalName, gsCompatibleEditMtext_LocalName;
extern TZ_API TzString gsAlignText_GlobalName, gsAlignText_LocalName;
extern TZ_API TzString gsMtext_GlobalName, gsMtext_LocalName;
extern TZ_API TzString gsCompatibleMtext_GlobalName, gsCompatibleMtext_LocalName;
extern TZ_API TzString gsMtprop_GlobalName, gsMtprop_LocalName;
extern TZ_API TzString gsMtextProperties_GlobalName, gsMtextProperties_LocalName;
extern TZ_API TzString gsServiceName;            // empty; "TzMTextService_TZC" once loaded
extern TZ_API TzString gsCommandGroupName;       // empty; "TZCORE_MTEXT" once loaded
extern TZ_API TzString gsMtextRegistryKey;       // empty, also once loaded
extern TZ_API TzString gsLocalizationSeparator;  // " _"
extern TZ_API TzStringTable gStringTable;
}

// The stack characters, "/#^", without a terminator and directly before the resource file's name: a
// reader that takes them for a terminated string sees sixteen characters.
struct TzStackCharacters {
    wchar_t characters[3];
    wchar_t resourceFile[14];
};
extern "C++" TZ_API TzStackCharacters const g_stackCharacters;
extern "C++" TZ_API wchar_t const* const g_pszStackChars;
