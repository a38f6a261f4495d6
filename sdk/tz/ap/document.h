#pragma once

#include "tz/export.h"

class TzDbDatabase;

namespace Tzworks::Tzdraft {
class TzApView;
}

// An open drawing with its input and its view.
class TZ_API TzApDocument {
public:
    virtual ~TzApDocument() = default;
    // [any] The drawing's database; owned by the document.
    [[nodiscard]] virtual TzDbDatabase* database() const = 0;
    // [any] The view on it; owned by the document, never null.
    [[nodiscard]] virtual Tzworks::Tzdraft::TzApView* view() const = 0;
};

// The open drawings.
class TZ_API TzApDocManager {
public:
    virtual ~TzApDocManager() = default;
    // [any] The drawing that commands work on; null when none is open.
    [[nodiscard]] virtual TzApDocument* curDocument() const = 0;
    // [any] Draws every view anew.
    virtual void redraw() = 0;
    // [any] Types a text at the document's command line as soon as it is idle: a blank or a line
    // end ends an answer, but a blank after a comma does not. The three flags (activate, wrapped
    // up, echo) change nothing here. 0, or a failing status without a document.
    virtual int sendStringToExecute(
        TzApDocument* document, wchar_t const* text, bool activate, bool wrapUp, bool echo) = 0;
};

// [any] Never null, lives with the process.
[[nodiscard]] TZ_API TzApDocManager* tzDocManagerPtr();
