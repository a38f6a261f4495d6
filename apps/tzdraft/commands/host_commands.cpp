#include "apps/tzdraft/commands/host_commands.h"

#include <array>

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/program_texts.h"
#include "host/runtime/command_stack.h"
#include "tz/ed/command_stack.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"

namespace tzdraft {
namespace {

struct HostCommand {
    wchar_t const* name;  // the global one; its local text is the local one
    void (*body)();
    int flags;            // as the command stack takes them
    wchar_t const* help;  // one sentence a line
};

// Flags: whether the command sees the selection made before it.
constexpr int kAlone = 0;
constexpr int kSeesSelection = tzhost::Command::kUsesImpliedSelection;

// name, body, flags, help
constexpr std::array kCommands{
    HostCommand{
        forLocalText(L"ATTDEF"), attdefCommand, kAlone,
        forLocalText(
            L"Makes the definition of an attribute, of one line or of several, for a block.")},
    HostCommand{
        forLocalText(L"BLOCK"), blockCommand, kSeesSelection,
        forLocalText(L"Makes a block of entities, which leave the drawing; INSERT places it.")},
    HostCommand{forLocalText(L"CIRCLE"), circleCommand, kAlone,
                forLocalText(L"Draws a circle from its center and radius.")},
    HostCommand{forLocalText(L"COPY"), copyCommand, kSeesSelection,
                forLocalText(L"Copies what is selected from a base point to others; Enter ends.")},
    HostCommand{forLocalText(L"ERASE"), eraseCommand, kSeesSelection,
                forLocalText(L"Erases what is selected, but for what lies on locked layers.")},
    HostCommand{forLocalText(L"EXIT"), quitCommand, kAlone,
                forLocalText(L"Ends the session, as QUIT does.")},
    HostCommand{forLocalText(L"HELP"), helpCommand, kAlone,
                forLocalText(L"Lists all commands, or tells about one.")},
    HostCommand{forLocalText(L"INSERT"), insertCommand, kAlone,
                forLocalText(L"Places a block, and asks for the values of its attributes.")},
    HostCommand{forLocalText(L"LAYER"), layerCommand, kAlone,
                forLocalText(
                    L"Makes, colours, locks, hides and deletes layers, and sets the current one.")},
    HostCommand{forLocalText(L"LINE"), lineCommand, kAlone,
                forLocalText(L"Draws lines from point to point; Enter ends.")},
    HostCommand{forLocalText(L"LIST"), listCommand, kSeesSelection,
                forLocalText(L"Tells what objects are, where they lie and how large they are.")},
    HostCommand{forLocalText(L"LOAD"), loadCommand, kAlone,
                forLocalText(L"Loads a module, once this command has ended.")},
    HostCommand{forLocalText(L"MOVE"), moveCommand, kSeesSelection,
                forLocalText(L"Moves what is selected from a base point to another.")},
    HostCommand{forLocalText(L"NEW"), newCommand, kAlone,
                forLocalText(L"Begins a new drawing; U brings the drawing before it back.")},
    HostCommand{forLocalText(L"OPEN"), openCommand, kAlone,
                forLocalText(L"Opens a drawing in place of this one.")},
    HostCommand{
        forLocalText(L"PAGE"), pageCommand, kAlone,
        forLocalText(
            L"Sets what plots are put on: paper, orientation, scale, unit, margin and window.")},
    HostCommand{
        forLocalText(L"PLOT"), plotCommand, kAlone,
        forLocalText(
            L"Plots the active space, on the drawing's page if it has one; the file's ending (.svg, .png, .pdf) says how.")},
    HostCommand{forLocalText(L"QUIT"), quitCommand, kAlone, forLocalText(L"Ends the session.")},
    HostCommand{forLocalText(L"REDO"), redoCommand, kAlone,
                forLocalText(L"Does again what U took back last; it asks nothing.")},
    HostCommand{forLocalText(L"ROTATE"), rotateCommand, kSeesSelection,
                forLocalText(L"Turns what is selected about a base point.")},
    HostCommand{forLocalText(L"SAVE"), saveCommand, kAlone,
                forLocalText(L"Writes the drawing to a file.")},
    HostCommand{forLocalText(L"SELECT"), selectCommand, kAlone,
                forLocalText(L"Selects entities for the next command.")},
    HostCommand{
        forLocalText(L"SETVAR"), setvarCommand, kAlone,
        forLocalText(
            L"Shows and sets a system variable; ? lists them, and . stands for the empty text.")},
    HostCommand{forLocalText(L"STYLE"), styleCommand, kAlone,
                forLocalText(L"Makes or changes a text style and makes it current.")},
    HostCommand{
        forLocalText(L"TEXT"), textCommand, kAlone,
        forLocalText(
            L"Writes a single line of text; Justify, or a word of it such as MC, at the start "
            L"point says what of the text lies there.")},
    HostCommand{forLocalText(L"U"), undoCommand, kAlone,
                forLocalText(L"Takes the last command back; it asks nothing.")},
    HostCommand{forLocalText(L"UCS"), ucsCommand, kAlone,
                forLocalText(L"Moves and turns the user coordinate system.")},
    HostCommand{forLocalText(L"UNDO"), undoCommand, kAlone,
                forLocalText(L"Takes the last command back, as U does.")},
    HostCommand{
        forLocalText(L"UNLOAD"), unloadCommand, kAlone,
        forLocalText(
            L"Unloads the module that was loaded last, once this command has ended; it asks nothing.")},
};

}  // namespace

void registerHostCommands() {
    auto* const stack =
        static_cast<TzEdCommandStack*>(tzrxSysRegistry()->at(L"TZAD_REGISTERED_COMMANDS"));
    for (HostCommand const& each : kCommands) {
        // The names are fixed and differ, so nothing can be refused but by a fault plan.
        (void)stack->addCommand(kHostCommandGroup, each.name, localText(each.name), each.flags,
                                each.body, nullptr, -1, TzRxResourceInstance::empty, nullptr);
        (void)tzedSetFunHelp(each.name, nullptr, localText(each.help), 0);
    }
}

}  // namespace tzdraft
