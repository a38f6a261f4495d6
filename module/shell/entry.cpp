#include "module/shell/entry.h"

#include "module/shell/registration.h"
#include "module/texts/resources.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/globals.h"
#include "tz/pal/settings.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"

namespace {

// "FIELD", each character code raised by one.
constexpr wchar_t const* kFieldFeature = L"GJFME";

TzRxDynamicLinker* dynamicLinker() {
    return tzrxCast<TzRxDynamicLinker>(tzrxSysRegistry()->at(L"DynamicLinker"));
}

// A linker that does not know the handle loads the module all the same.
void declareToLinker(void* appHandle) {
    if (TzRxDynamicLinker* const linker = dynamicLinker()) (void)linker->allowUnload(appHandle);
    if (TzRxDynamicLinker* const linker = dynamicLinker())
        (void)linker->declareMultiDocument(appHandle);
}

TzRx::AppRetCode load(void* appHandle) {
    declareToLinker(appHandle);
    if (!getMteResourceInstance().isLoaded()) return TzRx::kRetError;
    registerClasses();
    registerService();
    InitGlobalStrings();
    registerCommands();
    LoadFontDatabase();
    g_bEnableFieldUI = IsCommandAllowed(kFieldFeature) ? 1 : 0;
    return TzRx::kRetOK;
}

TzRx::AppRetCode unload() {
    unregisterClasses();
    unregisterService();
    unregisterCommands();
    UnloadFontDatabase();
    return TzRx::kRetOK;
}

TzRx::AppRetCode resultOf(bool succeeded) {
    return succeeded ? TzRx::kRetOK : TzRx::kRetError;
}

}  // namespace

CHandleObject ghBackgroundThread;

int tzrxEntryPoint(TzRx::AppMsgCode message, void* argument) {
    return tzrxEntryPoint_Mte(message, argument);
}

int tzrxEntryPoint_Mte(TzRx::AppMsgCode message, void* appHandle) {
    switch (message) {
    case TzRx::kInitAppMsg: return load(appHandle);
    case TzRx::kUnloadAppMsg: return unload();
    case TzRx::kLoadDwgMsg: return resultOf(defineFunctions());
    case TzRx::kUnloadDwgMsg: undefineFunctions(); return TzRx::kRetOK;
    case TzRx::kInvkSubrMsg: return resultOf(invokeFunction());
    default: return TzRx::kRetOK;
    }
}
