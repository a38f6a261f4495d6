#pragma once

#include <cstdint>

#include "tz/db/object_id.h"
#include "tz/export.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/object.h"

class TzDbMText;

// How a multi-line text reaches an editor.

// The side on which an editor opens.
enum MTETabType : std::int32_t { kMTETabText = 0, kMTETabProperties = 1 };

// The commands that edit one text: finds it by selection or pick and opens the editor on it.
class TZ_API TzxEditMtext : public TzRxObject {
public:
    // [command] The two flags pass down to the editor.
    virtual void EditMtext(MTETabType tab, bool interactive, bool view);

    static TzRxClass* gpDesc;
    static TzRxClass* desc();
    static TzRxClass* rxInit();
    [[nodiscard]] TzRxClass* isA() const override;
};

// The gate: decides which editor runs on a text, and runs it. 1 accepted, 2 left without accepting,
// 3 no editor ran (no text, locked, or not writable; one message said why). `flags` go to the
// dialog editor alone; `interactive` to an external one; `attribute` for the text of an attribute;
// the last two are options of the in-place editor. [command]
TZ_API int InvokeEditorOn(EasyObject<TzDbMText>& text,
                          MTETabType tab,
                          unsigned int flags,
                          bool interactive,
                          bool view,
                          bool attribute,
                          bool option13,
                          bool option14);
// The same by id: opens for read, tests locks, closes.
TZ_API int
InvokeEditorOn(TzDbObjectId id, MTETabType tab, unsigned int flags, bool interactive, bool view);
// The same for a text that the caller has open; it is closed when the call returns.
TZ_API int InvokeEditorOn(TzDbMText* text,
                          MTETabType tab,
                          unsigned int flags,
                          bool interactive,
                          bool view,
                          bool option13,
                          bool option14);
