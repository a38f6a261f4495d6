#pragma once

#include "tz/export.h"
#include "tz/rx/object.h"

class TzRxResourceInstance;

// Commands of the host and of its modules, in groups. Found in the system registry under
// "TZAD_REGISTERED_COMMANDS".
//
// Bits of a command's flags: 0x2 the command sees the selection that was made before it began
// (without it the host drops that selection first). The others, such as 0x800000 for a command
// that opens no dialog, are kept and change nothing in the embedded host.
class TZ_API TzEdCommandStack : public TzRxObject {
public:
    using Callback = void (*)();

    // [any] Adds a command. The global name is the same in every language, the local name is the
    // translator's; either starts the command, without regard to case. `reactor` and `data` may be
    // null, and `sequence` is -1; the embedded host looks at none of the three and adds the command
    // after all others. 0, or the failing status when the global name is empty or taken.
    virtual int addCommand(wchar_t const* group,
                           wchar_t const* globalName,
                           wchar_t const* localName,
                           int flags,
                           Callback callback,
                           TzRxObject* reactor,
                           int sequence,
                           TzRxResourceInstance const& resources,
                           void* data) = 0;
    // [any] Removes a group with all its commands; 0, or the failing status for an unknown group.
    virtual int removeGroup(wchar_t const* group) = 0;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// [any] Help of a command or function: `file` is the help file or null for the host's own, `topic`
// the topic in it, `command` 0. The embedded host's HELP looks the topic up in the help beside the
// modules, whatever the file. 5100, or -5001 for an empty name.
TZ_API int
tzedSetFunHelp(wchar_t const* name, wchar_t const* file, wchar_t const* topic, int command);
