// A second module for the host, made from the headers of sdk/ alone. It adds numbered marks and a
// few lists to the program, and calls what the text module tzmted.tzx offers to other modules, so
// that module has to be loaded first.

#include <array>

#include "bodies.h"
#include "mark_preview.h"
#include "tz/ed/command_stack.h"
#include "tz/ed/functions.h"
#include "tz/ed/print.h"
#include "tz/export.h"
#include "tz/pal/diagnostics.h"
#include "tz/rx/app.h"
#include "tz/rx/class.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"
#include "tz/rx/status.h"

namespace marks {
namespace {

constexpr wchar_t const* kGroup = L"SHEETMARKS";
constexpr wchar_t const* kService = L"SheetMarksService";
constexpr wchar_t const* kTextService = L"TzMTextService_TZC";
constexpr wchar_t const* kFunction = L"MARKTEXT";
constexpr int kFunctionCode = 0;
constexpr int kSeesSelection = 0x2;

struct Command {
    wchar_t const* name;
    TzEdCommandStack::Callback body;
    wchar_t const* help;
};
constexpr std::array kCommands{
    Command{L"MARK", markCommand, L"Places a numbered mark that points at something."},
    Command{L"MARKLIST", listCommand, L"Lists texts with their places and fonts."},
    Command{L"MARKNOTE", noteCommand, L"Writes and edits notes and the texts of attributes."},
    Command{L"MARKSETUP", setupCommand, L"Tells how the program is set up for texts and fonts."},
};

template <class T>
T* registered(wchar_t const* name) {
    return tzrxCast<T>(tzrxSysRegistry()->at(name));
}

void registerCommands(TzEdCommandStack& stack) {
    for (Command const& each : kCommands) {
        stack.addCommand(kGroup, each.name, each.name, kSeesSelection, each.body, nullptr, -1,
                         TzRxResourceInstance::empty, nullptr);
        tzedSetFunHelp(each.name, nullptr, each.help, 0);
    }
}

TzRx::AppRetCode load(void* handle) {
    auto* const linker = registered<TzRxDynamicLinker>(L"DynamicLinker");
    auto* const services = registered<TzRxDictionary>(L"ServiceDictionary");
    auto* const stack = registered<TzEdCommandStack>(L"TZAD_REGISTERED_COMMANDS");
    if (!linker || !services || !stack) return TzRx::kRetError;
    linker->allowUnload(handle);
    linker->declareMultiDocument(handle);
    if (!services->at(kTextService)) {
        tzutPrintf(L"\nThe marks need the module tzmted.tzx, which is not loaded.\n");
        return TzRx::kRetError;
    }
    MarkPreview::registerClass();
    tzrxBuildClassHierarchy();
    tzrxRegisterService(kService);
    registerCommands(*stack);
    OutputDebugString(L"The marks are ready.\r\n");
    return TzRx::kRetOK;
}

// Safe whatever a load has reached.
void unload() {
    MarkPreview::unregisterClass();
    if (auto* const services = registered<TzRxDictionary>(L"ServiceDictionary"))
        delete services->remove(kService);
    if (auto* const stack = registered<TzEdCommandStack>(L"TZAD_REGISTERED_COMMANDS"))
        stack->removeGroup(kGroup);
}

TzRx::AppRetCode callFunction() {
    tzedRetVoid();
    bool const done = tzedGetFunCode() == kFunctionCode && textFunction(tzedGetArgs());
    return done ? TzRx::kRetOK : TzRx::kRetError;
}

}  // namespace
}  // namespace marks

extern "C" TZ_API int tzrxEntryPoint(TzRx::AppMsgCode message, void* argument) {
    switch (message) {
    case TzRx::kInitAppMsg: return marks::load(argument);
    case TzRx::kUnloadAppMsg: marks::unload(); break;
    case TzRx::kLoadDwgMsg:
        if (tzedDefun(marks::kFunction, marks::kFunctionCode) != Tzad::ePromptNormal)
            return TzRx::kRetError;
        break;
    case TzRx::kUnloadDwgMsg: tzedUndef(marks::kFunction, marks::kFunctionCode); break;
    case TzRx::kInvkSubrMsg: return marks::callFunction();
    default: break;
    }
    return TzRx::kRetOK;
}
