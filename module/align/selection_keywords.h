#pragma once

#include "tz/rx/resbuf.h"

class TzMTextAlignCmd;

// What the keywords of the selection prompt do. The host hands them to one function of the process,
// so the command that they belong to is kept beside it.
class TzMTextAlignSSCallbackHandler {
public:
    // Takes the global word; any word but the two known ones does nothing. Returns null, so that
    // the selection goes on.
    static resbuf* keywordCallback(wchar_t const* keyword);

    // The command that selects; it stays set when the selection is over.
    static TzMTextAlignCmd* m_command;

private:
    // True when the user chose something new.
    static bool promptAlignDirectionOpt();
    static bool promptOptions();
};
