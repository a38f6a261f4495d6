#include "apps/tzdraft/commands/host_commands.h"

#include <array>

#include "apps/tzdraft/commands/bodies.h"
#include "tz/ed/command_stack.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"

namespace tzdraft {
namespace {

// A command of the program sees the selection made before it.
constexpr int kFlags = 2;

// name, body, help
constexpr std::array kCommands{
    HostCommand{L"LAYER",  layerCommand,
                L"Makes layers, sets the current one, colours, locks and unlocks them."                         },
    HostCommand{L"LINE",   lineCommand,   L"Draws lines from point to point; Enter ends."                       },
    HostCommand{L"LIST",   listCommand,
                L"Tells what objects are, where they lie and how large they are."                               },
    HostCommand{L"NEW",    newCommand,    L"Begins a new drawing; it asks nothing."                             },
    HostCommand{L"OPEN",   openCommand,   L"Opens a drawing in place of this one."                              },
    HostCommand{
                L"PLOT",   plotCommand,
                L"Plots the active space, fitted to its extents; the file's ending (.svg, .png, .pdf) says how."},
    HostCommand{L"QUIT",   quitCommand,   L"Ends the session."                                                  },
    HostCommand{L"SAVE",   saveCommand,   L"Writes the drawing to a file."                                      },
    HostCommand{L"SETVAR", setvarCommand, L"Shows and sets a system variable; ? lists them."                    },
    HostCommand{L"STYLE",  styleCommand,  L"Makes or changes a text style and makes it current."                },
    HostCommand{L"UCS",    ucsCommand,    L"Moves and turns the user coordinate system."                        },
};

}  // namespace

std::span<HostCommand const> hostCommands() {
    return kCommands;
}

void registerHostCommands() {
    auto* const stack =
        static_cast<TzEdCommandStack*>(tzrxSysRegistry()->at(L"TZAD_REGISTERED_COMMANDS"));
    for (HostCommand const& each : kCommands) {
        // The names are fixed and differ, so nothing can be refused but by a fault plan.
        (void)stack->addCommand(kHostCommandGroup, each.name, each.name, kFlags, each.body, nullptr,
                                -1, TzRxResourceInstance::empty, nullptr);
        (void)tzedSetFunHelp(each.name, nullptr, each.help, 0);
    }
}

}  // namespace tzdraft
