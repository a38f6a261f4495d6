#pragma once

#include "tz/export.h"
#include "tz/mte/edit_mtext.h"
#include "tz/rx/app.h"

class CMTextEditorInterface;
class TzDbMText;
class TzxMtextCommand;

// What the module offers to other modules by C names. All of it is for the host's one thread, while
// the module is loaded.
extern "C" {

// Takes every message of the host; 0, or 3 for a failure.
TZ_API int tzrxEntryPoint(TzRx::AppMsgCode message, void* argument);

// Fresh objects on the heap, owned by the caller.
TZ_API TzxEditMtext* newTzxEditMtext();
TZ_API TzxMtextCommand* newTzxMtextCommand();

// [command] Runs the flow of MTEXT on a text that the caller owns, for a multi-line attribute in a
// dialog: asks for the place only when the text lies at the origin. 1 accepted, 0 cancelled or
// null.
TZ_API int doMTextCommandForAttributeDlg(TzDbMText* text);
// [command] Runs the questions of MTEXT for an attribute definition and copies the answers to the
// caller's text. 1 answered, 0 cancelled or null.
TZ_API int doMTextCommandForAttDefCmd(TzDbMText* text);
// [command] Opens an editor on a text that the caller holds, as InvokeEditorOn does. The two
// ignored arguments belong to the signature. A field that the session leaves is attached to the
// text.
TZ_API int TzadEditMTextEntity(void* ignored,
                               MTETabType tab,
                               TzDbMText* text,
                               int ignoredNumber,
                               unsigned int flags,
                               bool interactive,
                               bool view);

// An editor session primed from the drawing, owned by the caller; null is ignored by the second.
TZ_API CMTextEditorInterface* new_CMTextEditorInterface();
TZ_API void delete_CMTextEditorInterface(CMTextEditorInterface* state);
}

class TzString;
// Does nothing; hosts that rename a command may still call it.
TZ_API void UpdateCommandName(TzString& globalName, TzString& localName);
