#include "host/database/undo_log.h"

#include <algorithm>
#include <utility>

#include "host/database/drawing.h"
#include "host/database/object_list.h"
#include "host/database/symbol_imp.h"
#include "host/database/user_system.h"

namespace tzhost {
namespace {

bool isSameSlot(Variables::Slot const& a, Variables::Slot const& b) {
    return a.value == b.value && a.override_ == b.override_;
}

// Whether a slot of a snapshot is LASTPOINT.
bool isLastPoint(std::size_t slot) {
    for (VariableDefinition const& row : variableTable()) {
        if (row.kept != KeptIn::drawing) continue;
        if (slot-- == 0) return row.name == L"LASTPOINT";
    }
    return false;
}

}  // namespace

UndoLog::UndoLog(Drawing& drawing) : drawing_(drawing) {}

UndoLog::~UndoLog() = default;

void UndoLog::rememberBase() {
    baseVariables_ = Variables::instance().snapshot();
    if (!baseSettings_) baseSettings_ = std::make_unique<DrawingSettings>();
    *baseSettings_ = drawing_.settings();
}

void UndoLog::begin() {
    if (depth_ == 0) {
        rememberBase();
        ++serial_;
    }
    ++depth_;
}

void UndoLog::collectVariables() {
    Variables::Snapshot const now = Variables::instance().snapshot();
    for (std::size_t slot = 0; slot < now.size() && slot < baseVariables_.size(); ++slot) {
        if (isSameSlot(now[slot], baseVariables_[slot])) continue;
        open_.variables.push_back({slot, std::move(baseVariables_[slot])});
    }
}

// Values that were set to what they were, or there and back, and objects that came and went, are no
// change that a drafter would take back.
void UndoLog::dropUnchanged() {
    std::erase_if(open_.entries, [](Entry const& entry) {
        TzDbObjectRecord const& record = *entry.record;
        if (record.erased != entry.erased) return false;
        return !entry.values || TzDbObjectAccess::imp(*record.object)->isSameAs(*entry.values);
    });
}

// A command that only picked a point, such as LIST, is none that a drafter would take back.
bool UndoLog::Step::isKept() const {
    return !entries.empty() || settings ||
           !std::all_of(variables.begin(), variables.end(),
                        [](VariableChange const& change) { return isLastPoint(change.slot); });
}

void UndoLog::end() {
    if (depth_ == 0 || --depth_ > 0) return;
    collectVariables();
    dropUnchanged();
    if (!baseSettings_->isSameAs(drawing_.settings())) open_.settings = std::move(baseSettings_);
    Step step = std::exchange(open_, {});
    if (!step.isKept()) return;
    step.serial = serial_;
    step.entries.shrink_to_fit();
    step.variables.shrink_to_fit();
    steps_.push_back(std::move(step));
}

void UndoLog::noteChange(TzDbObjectRecord& record) {
    if (depth_ == 0 || record.notedIn == serial_) return;
    open_.entries.push_back(
        {&record, TzDbObjectAccess::imp(*record.object)->copy(), record.erased});
    record.notedIn = serial_;
}

void UndoLog::prepareAppend() {
    if (depth_ == 0) return;
    if (open_.entries.size() == open_.entries.capacity()) {
        open_.entries.reserve(open_.entries.size() * 2 + 1);
    }
}

void UndoLog::noteAppended(TzDbObjectRecord& record) noexcept {
    if (depth_ == 0) return;
    open_.entries.push_back({&record, nullptr, true});
    record.notedIn = serial_;
}

void UndoLog::takeBack(Entry& entry) {
    TzDbObjectRecord& record = *entry.record;
    record.erased = entry.erased;
    if (record.object->isKindOf(TzDbSymbolTableRecord::desc())) noteNamesChanged();
    if (!entry.values) {
        if (record.owner) removeFromList(*record.owner, record);
        return;
    }
    TzDbObjectAccess::exchange(*record.object, std::move(entry.values));
    if (record.object->isKindOf(TzDbTextStyleTableRecord::desc())) noteLooksChanged();
}

void UndoLog::restoreVariables(Step const& step) {
    if (step.variables.empty()) return;
    Variables::Snapshot now = Variables::instance().snapshot();
    for (VariableChange const& change : step.variables)
        now[change.slot] = change.before;
    Variables::instance().restore(now);
}

bool UndoLog::takeBack() {
    if (steps_.empty()) return false;
    Step step = std::move(steps_.back());
    steps_.pop_back();
    for (auto entry = step.entries.rbegin(); entry != step.entries.rend(); ++entry) {
        takeBack(*entry);
    }
    if (step.settings) drawing_.setSettings(*step.settings);
    restoreVariables(step);
    noteUserSystem();
    if (depth_ > 0) rememberBase();
    return true;
}

}  // namespace tzhost
