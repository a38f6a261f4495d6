#pragma once

#include <cstdint>

#include "tz/db/object_id.h"
#include "tz/export.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/object.h"

class TzDbMText;

// How a multi-line text reaches an editor.
//
//   int const result = InvokeEditorOn(id, kMTETabText, 0, true, true);
//
// Results: 1 the user accepted; 2 the user left without accepting, and the text is as before; 3 no
// editor ran, and one message said why.
//
// Two arguments go on to the editor as they are, and what they change for the user is the host's
// business: `interactive` to an external program, `view` to every editor but the raw one. The
// module's own commands pass true for both.

// The side on which an editor opens.
enum MTETabType : std::int32_t { kMTETabText = 0, kMTETabProperties = 1 };

// The commands that edit one text: finds it by selection or pick and opens the editor on it.
class TZ_API TzxEditMtext : public TzRxObject {
public:
    // [command] Both flags go on to the editor, as described above.
    virtual void EditMtext(MTETabType tab, bool interactive, bool view);

    static TzRxClass* gpDesc;
    static TzRxClass* desc();
    static TzRxClass* rxInit();
    [[nodiscard]] TzRxClass* isA() const override;
};

// [command] The gate: decides which editor runs on an open text, and runs it. 3 without a text, and
// when the text cannot be made writable. A text that is open for read is open for read again
// afterwards. `tab` and `flags` go to the dialog editor alone; `attribute` says that it is the text
// of an attribute, whose in-place session follows the variable ATTIPE instead of `view`; the last
// two are options of the in-place editor. A field that the session leaves in the holder is the
// caller's.
[[nodiscard]] TZ_API int InvokeEditorOn(EasyObject<TzDbMText>& text,
                                        MTETabType tab,
                                        unsigned int flags,
                                        bool interactive,
                                        bool view,
                                        bool attribute,
                                        bool option13,
                                        bool option14);
// [command] The same by id: opens the text for read and closes it. 3 also for a text on a locked
// layer or outside the working set.
[[nodiscard]] TZ_API int
InvokeEditorOn(TzDbObjectId id, MTETabType tab, unsigned int flags, bool interactive, bool view);
// [command] The same for a text that the caller has open, with the same two refusals; it is closed
// when the call returns, whatever the result. A field that an accepted session leaves is attached
// to it.
[[nodiscard]] TZ_API int InvokeEditorOn(TzDbMText* text,
                                        MTETabType tab,
                                        unsigned int flags,
                                        bool interactive,
                                        bool view,
                                        bool option13,
                                        bool option14);

// [command] The same by the older name of an entity, or of a set whose first entity is edited. 3,
// without a message, for a name of no object.
[[nodiscard]] TZ_API int
EditMtextByAdsName(long long* name, MTETabType tab, bool interactive, bool view);
[[nodiscard]] TZ_API int
EditMtextInSelectionSet(long long* set, MTETabType tab, bool interactive, bool view);
