#include "tz/mte/dialog_params.h"

#include "module/host_calls/class_registration.h"

namespace {

constexpr wchar_t const* kParent = L"TzApHostDialogParams";
// The file name under which the host knows the module that the dialogs belong to.
constexpr wchar_t const* kModule = L"tzmted.tzx";

}  // namespace

TzRxClass* TzApHostRawEditorParamsFrameless::gpDesc = nullptr;

TzApHostRawEditorParamsFrameless::TzApHostRawEditorParamsFrameless()
    : imp_(new TzApHostEditorParamsImp) {}

TzApHostRawEditorParamsFrameless::~TzApHostRawEditorParamsFrameless() {
    delete imp_;
}

TzRxClass* TzApHostRawEditorParamsFrameless::desc() {
    return gpDesc;
}

TzRxClass* TzApHostRawEditorParamsFrameless::isA() const {
    return gpDesc;
}

TzRxClass* TzApHostRawEditorParamsFrameless::rxInit() {
    return registerRuntimeClass(gpDesc, L"TzApHostRawEditorParamsFrameless", kParent, nullptr);
}

TzRxClass* TzApHostOldEditorParamsFrameless::gpDesc = nullptr;

TzApHostOldEditorParamsFrameless::TzApHostOldEditorParamsFrameless()
    : imp_(new TzApHostEditorParamsImp) {}

TzApHostOldEditorParamsFrameless::~TzApHostOldEditorParamsFrameless() {
    delete imp_;
}

TzRxClass* TzApHostOldEditorParamsFrameless::desc() {
    return gpDesc;
}

TzRxClass* TzApHostOldEditorParamsFrameless::isA() const {
    return gpDesc;
}

TzRxClass* TzApHostOldEditorParamsFrameless::rxInit() {
    return registerRuntimeClass(gpDesc, L"TzApHostOldEditorParamsFrameless", kParent, nullptr);
}

TzApHostDialogRawEditor& TzApHostDialogRawEditor::instance() {
    static TzApHostDialogImp imp(kModule);
    static TzApHostDialogRawEditor dialog(&imp);
    return dialog;
}

TzApHostDialogOldEditor& TzApHostDialogOldEditor::instance() {
    static TzApHostDialogImp imp(kModule);
    static TzApHostDialogOldEditor dialog(&imp);
    return dialog;
}

void MteCoreDialogParamsRXInit() {
    TzApHostRawEditorParamsFrameless::rxInit();
    TzApHostOldEditorParamsFrameless::rxInit();
}

void MteCoreDialogParamsRXUninit() {
    unregisterRuntimeClass(TzApHostRawEditorParamsFrameless::gpDesc);
    unregisterRuntimeClass(TzApHostOldEditorParamsFrameless::gpDesc);
}
