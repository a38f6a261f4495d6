#include "module/shell/registration.h"

#include "module/host_calls/class_registration.h"
#include "tz/mte/dialog_params.h"
#include "tz/mte/edit_mtext.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"
#include "tz/rx/registry.h"

void registerClasses() {
    TzxEditMtext::rxInit();
    TzxMtextCommand::rxInit();
    MteCoreDialogParamsRXInit();
    tzrxBuildClassHierarchy();
}

void unregisterClasses() {
    unregisterRuntimeClass(TzxEditMtext::gpDesc);
    unregisterRuntimeClass(TzxMtextCommand::gpDesc);
    MteCoreDialogParamsRXUninit();
}

void registerService() {
    gsServiceName = L"TzMTextService_TZC";
    tzrxRegisterService(gsServiceName);
}

void unregisterService() {
    auto* const services = tzrxCast<TzRxDictionary>(tzrxSysRegistry()->at(L"ServiceDictionary"));
    if (services) delete services->remove(gsServiceName);
}

// The module never calls it; other modules of the host may refer to it by name.
void UpdateCommandName(TzString&, TzString&) {}
