#include <array>

#include "module/shell/callbacks.h"
#include "module/shell/registration.h"
#include "module/texts/resources.h"
#include "module/texts/text_ids.h"
#include "tz/ed/command_stack.h"
#include "tz/mte/globals.h"
#include "tz/pal/diagnostics.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"

namespace {

struct Command {
    TzString* globalVariable;
    TzString* localVariable;
    wchar_t const* globalName;
    int localNameId;
    void (*callback)();
};

// Registered in this order. The last one is added in another way: with one more flag, and with
// neither a line in the debug output nor help.
constexpr std::array<Command, 7> kCommands{{
    {&gsEditMtext_GlobalName, &gsEditMtext_LocalName, L"MTEDIT", kText.mteditCommand,
     EditMtextCallback},
    {&gsCompatibleEditMtext_GlobalName, &gsCompatibleEditMtext_LocalName, L"-MTEDIT",
     kText.plainMteditCommand, CompatibleEditMtextCallback},
    {&gsAlignText_GlobalName, &gsAlignText_LocalName, L"TEXTALIGN", kText.textalignCommand,
     AlignTextCallback},
    {&gsMtext_GlobalName, &gsMtext_LocalName, L"MTEXT", kText.mtextCommand, ImprovedMtextCallback},
    {&gsCompatibleMtext_GlobalName, &gsCompatibleMtext_LocalName, L"-MTEXT",
     kText.plainMtextCommand, CompatibleMtextCallback},
    {&gsMtprop_GlobalName, &gsMtprop_LocalName, L"MTPROP", kText.mtpropCommand, MtpropCallback},
    {&gsMtextProperties_GlobalName, &gsMtextProperties_LocalName, L"MTEXTPROPERTIES",
     kText.mtextpropertiesCommand, MtextPropertiesCallback},
}};

constexpr int kSeesSelection = 0x2;
constexpr int kSeesSelectionWithoutDialogs = 0x800002;

TzEdCommandStack* commandStack() {
    return tzrxCast<TzEdCommandStack>(tzrxSysRegistry()->at(L"TZAD_REGISTERED_COMMANDS"));
}

void addCommand(TzString const& globalName,
                TzString const& localName,
                int flags,
                void (*callback)()) {
    // A name that another module has taken stays with that module; the other commands are still
    // added.
    if (TzEdCommandStack* const commands = commandStack())
        (void)commands->addCommand(gsCommandGroupName, globalName, localName, flags, callback,
                                   nullptr, -1, TzRxResourceInstance::empty, nullptr);
}

void RegisterCommand(TzString const& globalName, TzString const& localName, void (*callback)()) {
    addCommand(globalName, localName, kSeesSelection, callback);
    Tzworks::Tzdraft::PAL::Diagnostics::outputDebugString(TzString::formatted(
        L"  Registered command under the global name '%ls' and local name '%ls'\r\n",
        globalName.kwszPtr(), localName.kwszPtr()));
    // A command without help is a command all the same.
    (void)tzedSetFunHelp(globalName, nullptr, globalName, 0);
    (void)tzedSetFunHelp(localName, nullptr, globalName, 0);
}

}  // namespace

void InitGlobalStrings() {
    for (Command const& command : kCommands) {
        *command.globalVariable = command.globalName;
        *command.localVariable = loadResourceString(command.localNameId);
    }
}

void registerCommands() {
    gsCommandGroupName = L"TZCORE_MTEXT";
    for (std::size_t row = 0; row + 1 < kCommands.size(); ++row)
        RegisterCommand(*kCommands[row].globalVariable, *kCommands[row].localVariable,
                        kCommands[row].callback);
    Command const& last = kCommands.back();
    addCommand(*last.globalVariable, *last.localVariable, kSeesSelectionWithoutDialogs,
               last.callback);
}

void unregisterCommands() {
    // A group that is not there has nothing left to remove.
    if (TzEdCommandStack* const commands = commandStack())
        (void)commands->removeGroup(gsCommandGroupName);
}
