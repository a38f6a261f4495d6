#include "module/commands/edit_mtext.h"

#include "module/access/class_registration.h"
#include "module/commands/placeholder.h"
#include "module/edit/editor_result.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"

namespace {

TzRxObject* makeEditMtext() {
    return newTzxEditMtext();
}

wchar_t const* commandOf(MTETabType tab) {
    return tab == kMTETabText ? gsEditMtext_GlobalName : gsMtprop_GlobalName;
}

}  // namespace

TzRxClass* TzxEditMtext::gpDesc = nullptr;

TzRxClass* TzxEditMtext::desc() {
    return gpDesc;
}

TzRxClass* TzxEditMtext::isA() const {
    return gpDesc;
}

TzRxClass* TzxEditMtext::rxInit() {
    return registerRuntimeClass(gpDesc, L"TzxEditMtext", L"TzRxObject", makeEditMtext);
}

TzxEditMtext* newTzxEditMtext() {
    return new TzxEditMtext;
}

void TzxEditMtext::EditMtext(MTETabType tab, bool, bool) {
    printNotYetAvailable(commandOf(tab));
}

int EditMtextByAdsName(long long const*, MTETabType tab, bool, bool) {
    printNotYetAvailable(commandOf(tab));
    return kNoEditor;
}
