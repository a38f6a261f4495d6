#include "module/commands/locked_warning_filter.h"

#include "module/host_calls/selection_sets.h"
#include "tz/db/entity.h"
#include "tz/ed/warning.h"
#include "tz/mte/easy_object.h"

namespace {

constexpr int kGrowth = 8;

// Whether the host refuses to open the entity for write because its layer is locked. An entity that
// another holder has open is refused for that reason instead, and counts as unlocked.
bool isLocked(TzDbObjectId id) {
    EasyObject<TzDbEntity> entity;
    Tzad::ErrorStatus const read = tzdbOpenObject(entity.object, id, TzDb::kForRead);
    if (read != Tzad::eOk) return read == Tzad::eOnLockedLayer;
    return entity->upgradeOpen() == Tzad::eOnLockedLayer;
}

}  // namespace

TzLockedWarningFilter::TzLockedWarningFilter(TzApDocument* document) : m_document(document) {
    if (m_document) addSSgetFilterInputContextReactor(m_document, this, kEveryHook);
}

TzLockedWarningFilter::~TzLockedWarningFilter() {
    if (m_document) removeSSgetFilterInputContextReactor(m_document, this);
}

void TzLockedWarningFilter::endSSGet(int /*status*/,
                                     int /*flags*/,
                                     TzEdSelectionSetService& service,
                                     TzArray<TzDbObjectId> const& selectionSet) {
    if (selectionSet.isEmpty()) return;
    TzArray<int> locked(0, kGrowth);
    for (int index = 0; index < selectionSet.length(); ++index)
        if (isLocked(selectionSet[index])) locked.append(index);
    m_counts = {selectionSet.length(), locked.length()};
    (void)service.remove(locked);  // all indices lie in the array
}

void TzLockedWarningFilter::sendWarning(TzString warningId,
                                        TzString lockedLine,
                                        TzString foundFormat,
                                        TzString oneLockedText,
                                        TzString manyLockedFormat,
                                        FilterCount counts) {
    TzString message;
    for (int line = 0; line < counts.locked; ++line)
        message += lockedLine;
    message += TzString::formatted(foundFormat, counts.found);
    message +=
        counts.locked == 1 ? oneLockedText : TzString::formatted(manyLockedFormat, counts.locked);
    tzutWarning(warningId, true, message);
}
