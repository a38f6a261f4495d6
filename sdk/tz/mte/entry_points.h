#pragma once

#include "tz/export.h"
#include "tz/mte/edit_mtext.h"
#include "tz/rx/app.h"

class TzDbMText;
class TzxMtextCommand;

// What the module offers to other modules by C names. All of it is for the host's one thread, while
// the module is loaded.
//
//   int const accepted = doMTextCommandForAttributeDlg(text);  // a text of the caller's
extern "C" {

// [any] Takes every message of the host; 0, or 3 for a failure.
[[nodiscard]] TZ_API int tzrxEntryPoint(TzRx::AppMsgCode message, void* argument);

// [any] Fresh objects on the heap, owned by the caller. The second reads the drawing's defaults, so
// a drawing must be open.
[[nodiscard]] TZ_API TzxEditMtext* newTzxEditMtext();
[[nodiscard]] TZ_API TzxMtextCommand* newTzxMtextCommand();

// [command] Runs the flow of MTEXT on a text that the caller owns, for a multi-line attribute in a
// dialog: asks for the place only when the text lies at the origin. 1 accepted, 0 cancelled or
// null.
[[nodiscard]] TZ_API int doMTextCommandForAttributeDlg(TzDbMText* text);
// [command] Runs the questions of MTEXT for an attribute definition and copies the answers to the
// caller's text. 1 answered, 0 cancelled or null.
[[nodiscard]] TZ_API int doMTextCommandForAttDefCmd(TzDbMText* text);
// [command] Opens an editor on a text that the caller has open and keeps, with the result of
// InvokeEditorOn; no lock is tested, and null gives 3 without a message. The two ignored arguments
// belong to the signature. A field that an accepted session leaves is attached.
[[nodiscard]] TZ_API int TzadEditMTextEntity(void* ignored,
                                             MTETabType tab,
                                             TzDbMText* text,
                                             int ignoredNumber,
                                             unsigned int flags,
                                             bool interactive,
                                             bool view);
}

class TzString;
// [any] Does nothing; hosts that rename a command may still call it.
TZ_API void UpdateCommandName(TzString& globalName, TzString& localName);
