#include "apps/tzdraft/commands/host_commands.h"

#include <array>

#include "apps/tzdraft/commands/bodies.h"
#include "host/runtime/command_stack.h"
#include "tz/ed/command_stack.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"

namespace tzdraft {
namespace {

// Flags: whether the command sees the selection made before it.
constexpr int kAlone = 0;
constexpr int kSeesSelection = tzhost::Command::kUsesImpliedSelection;

// name, body, flags, help
constexpr std::array kCommands{
    HostCommand{L"ATTDEF", attdefCommand, kAlone,
                L"Makes the definition of an attribute, of one line or of several, for a block."                },
    HostCommand{L"BLOCK",  blockCommand,  kSeesSelection,
                L"Makes a block of entities, which leave the drawing; INSERT places it."                        },
    HostCommand{L"CIRCLE", circleCommand, kAlone,         L"Draws a circle from its center and radius."         },
    HostCommand{L"ERASE",  eraseCommand,  kSeesSelection,
                L"Erases what is selected, but for what lies on locked layers."                                 },
    HostCommand{L"HELP",   helpCommand,   kAlone,         L"Lists all commands, or tells about one."            },
    HostCommand{L"INSERT", insertCommand, kAlone,
                L"Places a block, and asks for the values of its attributes."                                   },
    HostCommand{L"LAYER",  layerCommand,  kAlone,
                L"Makes layers, sets the current one, colours, locks and unlocks them."                         },
    HostCommand{L"LINE",   lineCommand,   kAlone,         L"Draws lines from point to point; Enter ends."       },
    HostCommand{L"LIST",   listCommand,   kSeesSelection,
                L"Tells what objects are, where they lie and how large they are."                               },
    HostCommand{L"LOAD",   loadCommand,   kAlone,         L"Loads a module, once this command has ended."       },
    HostCommand{L"NEW",    newCommand,    kAlone,
                L"Begins a new drawing; it asks nothing, and U brings the drawing before it back."              },
    HostCommand{L"OPEN",   openCommand,   kAlone,         L"Opens a drawing in place of this one."              },
    HostCommand{
                L"PLOT",   plotCommand,   kAlone,
                L"Plots the active space, fitted to its extents; the file's ending (.svg, .png, .pdf) says how."},
    HostCommand{L"QUIT",   quitCommand,   kAlone,         L"Ends the session."                                  },
    HostCommand{L"SAVE",   saveCommand,   kAlone,         L"Writes the drawing to a file."                      },
    HostCommand{L"SELECT", selectCommand, kAlone,         L"Selects entities for the next command."             },
    HostCommand{L"SETVAR", setvarCommand, kAlone,
                L"Shows and sets a system variable; ? lists them."                                              },
    HostCommand{L"STYLE",  styleCommand,  kAlone,
                L"Makes or changes a text style and makes it current."                                          },
    HostCommand{L"TEXT",   textCommand,   kAlone,         L"Writes a single line of text."                      },
    HostCommand{L"U",      undoCommand,   kAlone,         L"Takes the last command back; it asks nothing."      },
    HostCommand{L"UCS",    ucsCommand,    kAlone,         L"Moves and turns the user coordinate system."        },
    HostCommand{
                L"UNLOAD", unloadCommand, kAlone,
                L"Unloads the module that was loaded last, once this command has ended; it asks nothing."       },
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
        (void)stack->addCommand(kHostCommandGroup, each.name, each.name, each.flags, each.body,
                                nullptr, -1, TzRxResourceInstance::empty, nullptr);
        (void)tzedSetFunHelp(each.name, nullptr, each.help, 0);
    }
}

}  // namespace tzdraft
