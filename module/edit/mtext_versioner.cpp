#include "module/edit/mtext_versioner.h"

#include "module/holders/scope_guard.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/pal/message_box.h"

namespace {

constexpr int kFirstNewerFormat = 4;

}  // namespace

MTextVersioner::MTextVersioner(TzDbMText* text)
    : TextEditor(text, true, false, false, false, 0.0, 0.0, 0.0, false, false) {}

MTextVersioner::~MTextVersioner() = default;

bool MTextVersioner::isNewer(wchar_t const* contents) {
    TzScopeGuard const engine([&] { initialize(contents); }, [&] { uninitialize(); });
    return !unreadable_.IsEmpty() || from_mtext(contents) >= kFirstNewerFormat;
}

bool MTextVersioner::too_new(wchar_t const* contents) {
    if (!isNewer(contents)) return false;
    MessageBox(nullptr, gStringTable[kText.tooNew], nullptr, kMessageBoxError);
    return true;
}
