#pragma once

#include <cstddef>
#include <cstdint>

#include "tz/export.h"
#include "tz/text/string.h"

class TzDbMText;

// The editors that the host offers for a multi-line text. Each runs to its end before it returns,
// changes the entity itself, and leaves it as it was when the user leaves without accepting. The
// entity must be open for write, whether or not it has a database.

// The record that the in-place editor receives. Its layout is part of the interface; what has no
// name is zero. The comments give the byte offset and what the text module puts there.
struct IPESettings {
    bool viewFlag = false;          // 0: `view` of InvokeEditorOn; for an attribute, ATTIPE is on
    std::uint8_t reserved1[3]{};    // 1
    bool attribute = false;         // 4: the text belongs to an attribute
    bool editable = false;          // 5: always true
    bool plainAttribute = false;    // 6: an attribute that is not edited in place
    std::uint8_t reserved7[5]{};    // 7
    std::uint32_t options = 0;      // 12: bits 13 and 14, the last arguments of InvokeEditorOn
    double boxHeight = 0;           // 16: of the box dragged last, drawing units; 0 in a database
    std::uint8_t reserved24[16]{};  // 24
    double scale = 0;               // 40: always 1
    std::uint8_t reserved48[24]{};  // 48
    TzString title;                 // 72: empty
    std::uint8_t reservedAfterTitle[120 - sizeof(TzString)]{};
    std::uint32_t colors[4]{};           // 192: fixed ones, 0x00BBGGRR
    std::uint32_t fifthColor = 0;        // 208: another one
    std::uint16_t flags212 = 0;          // 212: 0
    std::uint16_t reserved214 = 0;       // 214
    std::uint32_t minimumPixelSize = 0;  // 216: 6, or MinPixelSize of the settings MTEXT.IPE
    std::uint32_t fixedPixelSize = 0;    // 220: 12, or FixedPixelSize of these
};
static_assert(offsetof(IPESettings, viewFlag) == 0 && offsetof(IPESettings, attribute) == 4);
static_assert(offsetof(IPESettings, editable) == 5 && offsetof(IPESettings, plainAttribute) == 6);
static_assert(offsetof(IPESettings, options) == 12 && offsetof(IPESettings, boxHeight) == 16);
static_assert(offsetof(IPESettings, scale) == 40 && offsetof(IPESettings, title) == 72);
static_assert(offsetof(IPESettings, colors) == 192 && offsetof(IPESettings, fifthColor) == 208);
static_assert(offsetof(IPESettings, flags212) == 212 &&
              offsetof(IPESettings, minimumPixelSize) == 216);
static_assert(offsetof(IPESettings, fixedPixelSize) == 220 && sizeof(IPESettings) == 224);

// [command] The in-place editor; 0 when the user left without accepting. The settings are read
// only.
[[nodiscard]] TZ_API int IPEInvokeEditorOn(TzDbMText* text, IPESettings const* settings);
// [any] Whether the editor that MTEXTED names is an in-place one; `current` true asks about the
// name in force.
[[nodiscard]] TZ_API bool IPEIsEditor(bool current);
// [command] The external program that MTEXTED names; 0 when it did not run or was left without
// accepting. The embedded host looks at neither flag.
[[nodiscard]] TZ_API int tzedEditMTextInteractive(TzDbMText* text, bool interactive, bool view);
// [command] Tells the editors whether the next text was there before the command.
TZ_API void tzedSetExistingMText(bool existing);
// [command] The dialog for the annotation scale; here it asks nothing and keeps CANNOSCALEVALUE.
TZ_API int tzedInvokeAnnoSelectScaleDlg();
// [command] Brings the picture up to date; zooms for an editor. Both only tell the event file here.
TZ_API void tzedUpdateDisplay();
TZ_API void tzedZoomToolHook(bool in, bool out, bool redraw);
