#include "host/database/undo_log.h"

#include <algorithm>
#include <cstdint>
#include <utility>

#include "host/base/memory_faults.h"
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

// Asks the processor for the first lines of its cache that values take, where most values lie.
void fetchValues(TzDbObjectImp const* values) {
    constexpr std::uintptr_t kLine = 64;
    constexpr std::uintptr_t kLines = 3;
    auto const start = reinterpret_cast<std::uintptr_t>(values);
    for (std::uintptr_t line = 0; line < kLines; ++line)
        __builtin_prefetch(reinterpret_cast<void const*>(start + line * kLine));
}

}  // namespace

UndoLog::UndoLog(Drawing& drawing) : drawing_(drawing) {}

UndoLog::~UndoLog() = default;

void UndoLog::rememberBase() {
    baseVariables_ = Variables::instance().snapshot();
    if (!baseSettings_) baseSettings_ = std::make_unique<DrawingSettings>();
    *baseSettings_ = drawing_.settings();
}

std::wstring UndoLog::nameOfLast(std::vector<Step> const& steps) {
    return steps.empty() ? std::wstring() : steps.back().name;
}

void UndoLog::begin(std::wstring name) {
    if (depth_ == 0) {
        rememberBase();
        open_.name = std::move(name);
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
    std::vector<Entry>& entries = open_.entries;
    std::size_t kept = 0;
    for (std::size_t at = 0; at < entries.size(); ++at) {
        fetchAhead(entries, at);
        entries[at].putBackEqualFields();
        if (entries[at].isUnchanged()) continue;
        if (kept != at) entries[kept] = std::move(entries[at]);
        ++kept;
    }
    entries.erase(entries.begin() + static_cast<std::ptrdiff_t>(kept), entries.end());
}

void UndoLog::Entry::putBackEqualFields() const {
    if (!values || !values->fields) return;
    auto const& now = TzDbObjectAccess::imp(*record->object)->fields;
    if (!now || now->size() != values->fields->size()) return;
    for (std::size_t at = 0; at < now->size(); ++at) {
        auto const& [key, old] = (*values->fields)[at];
        auto& [newKey, added] = (*now)[at];
        TzDbObjectRecord& before = *old.record();
        TzDbObjectRecord& after = *added.record();
        if (key != newKey || !before.erased || after.erased) continue;
        TzDbObjectImp const& said = *TzDbObjectAccess::imp(*before.object);
        if (!said.isSameAs(*TzDbObjectAccess::imp(*after.object))) continue;
        added = old;
        before.erased = false;
        after.erased = true;
    }
}

bool UndoLog::Entry::isUnchanged() const {
    if (record->erased != erased) return false;
    return !values || TzDbObjectAccess::imp(*record->object)->isSameAs(*values);
}

// The objects of a long step lie all over the memory, and the processor would wait for the record,
// the object and both its values, one after the other. Each is asked for some entries before. That
// changes nothing but the time: records stay where they are as long as their drawing.
void UndoLog::fetchAhead(std::vector<Entry> const& entries, std::size_t at) {
    constexpr std::size_t kRecord = 16;
    constexpr std::size_t kObject = 8;
    constexpr std::size_t kValues = 4;
    if (at + kRecord < entries.size()) __builtin_prefetch(entries[at + kRecord].record);
    if (at + kObject < entries.size()) {
        __builtin_prefetch(entries[at + kObject].record->object);
        fetchValues(entries[at + kObject].values.get());
    }
    if (at + kValues >= entries.size()) return;
    TzDbObject const* const object = entries[at + kValues].record->object;
    if (object) fetchValues(TzDbObjectAccess::imp(*object));
}

// A step that only moved LASTPOINT, as a pick of LIST does, is not kept: a drafter would not want
// it taken back.
bool UndoLog::Step::isKept() const {
    return !entries.empty() || settings ||
           !std::all_of(variables.begin(), variables.end(),
                        [](VariableChange const& change) { return isLastPoint(change.slot); });
}

bool UndoLog::end() {
    if (depth_ == 0 || --depth_ > 0) return false;
    collectVariables();
    dropUnchanged();
    if (!baseSettings_->isSameAs(drawing_.settings())) open_.settings = std::move(baseSettings_);
    Step step = std::exchange(open_, {});
    if (!step.isKept()) return false;
    step.serial = serial_;
    step.entries.shrink_to_fit();
    step.variables.shrink_to_fit();
    steps_.push_back(std::move(step));
    takenBack_.clear();
    return true;
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

void UndoLog::exchange(Entry& entry) {
    TzDbObjectRecord& record = *entry.record;
    record.drawing->changes().note(record, ChangeJournal::Kind::values);
    std::swap(record.erased, entry.erased);
    if (record.object->isKindOf(TzDbSymbolTableRecord::desc())) noteNamesChanged();
    if (entry.values) {
        entry.values = TzDbObjectAccess::exchange(*record.object, std::move(entry.values));
        if (record.object->isKindOf(TzDbTextStyleTableRecord::desc())) noteLooksChanged();
    } else if (record.owner) {
        if (record.erased) {
            removeFromList(*record.owner, record);
        } else {
            addToList(*record.owner, record);
        }
    }
}

void UndoLog::exchangeVariables(Step& step) {
    if (step.variables.empty()) return;
    Variables::Snapshot now = Variables::instance().snapshot();
    for (VariableChange& change : step.variables)
        std::swap(now[change.slot], change.other);
    Variables::instance().restore(now);
}

// What the step added leaves its lists last first, and comes back first first. Variables go before
// the settings, which show their style in one of them.
void UndoLog::exchange(Step& step) {
    std::reverse(step.entries.begin(), step.entries.end());
    for (std::size_t at = 0; at < step.entries.size(); ++at) {
        fetchAhead(step.entries, at);
        exchange(step.entries[at]);
    }
    exchangeVariables(step);
    if (step.settings) {
        DrawingSettings const present = drawing_.settings();
        drawing_.setSettings(*step.settings);
        *step.settings = present;
    }
    noteUserSystem();
}

// Whole or not at all.
bool UndoLog::pass(std::vector<Step>& from, std::vector<Step>& to) {
    if (from.empty()) return false;
    MemoryFaultPause const isWhole;
    to.push_back(std::move(from.back()));
    from.pop_back();
    exchange(to.back());
    if (depth_ > 0) rememberBase();
    return true;
}

bool UndoLog::takeBack() {
    return pass(steps_, takenBack_);
}

void UndoLog::forgetTakenBack() {
    takenBack_.clear();
}

bool UndoLog::doAgain() {
    return pass(takenBack_, steps_);
}

}  // namespace tzhost
