#pragma once

// What the system variables hold: one store for the process, as one drawing is worked on at a time.
// Whoever opens a drawing puts its values in, whoever saves one takes them out, and undo takes
// snapshots.
//
//   tzhost::Variables& store = tzhost::Variables::instance();
//   if (auto const written = store.set(L"LUNITS", short{4}, tzhost::Writer::user);
//   !written.isDone()) {
//       say(written.reason);
//   }
//
// An override is a value for this run alone, whatever the variable's kind: it shows in every read,
// hides what the drawing or the settings say, is never saved, and ends with the next write; one of
// a read-only variable holds, as only the host itself writes those. Not thread-safe.

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "host/settings/variable_table.h"
#include "host/settings/variable_value.h"

namespace tzhost {

// Who writes. Users and modules are refused at read-only variables; the host is not.
enum class Writer { user, module, host };

struct WriteResult {
    int status = 0;       // 5100, or -5001 and nothing has changed
    std::wstring reason;  // why not: one sentence that names the variable; empty when done

    [[nodiscard]] bool isDone() const { return reason.empty(); }
};

// One write that took place, the value being equal to the one before or not.
struct VariableWrite {
    VariableDefinition const& definition;
    VariableValue const& value;
    Writer writer;
};

class Variables {
public:
    // The process's store, made with the defaults on first use.
    [[nodiscard]] static Variables& instance();

    // The value in force, valid until the variable's next write; null for an unknown name.
    [[nodiscard]] VariableValue const* get(std::wstring_view name) const;
    // The value in force as a number or a text; 0 or empty for an unknown name or another type.
    [[nodiscard]] double number(std::wstring_view name) const;
    [[nodiscard]] std::wstring text(std::wstring_view name) const;

    WriteResult set(std::wstring_view name, VariableValue const& value, Writer writer);
    // The same from a text as SETVAR and --var get it.
    WriteResult setFromText(std::wstring_view name, std::wstring_view text, Writer writer);
    // A value for this run alone, read-only variables included; limits hold.
    WriteResult overrideFromText(std::wstring_view name, std::wstring_view text);

    // The values of one kind beneath the overrides, by name: what a drawing or the settings save.
    using Values = std::vector<std::pair<std::wstring_view, VariableValue>>;
    [[nodiscard]] Values kept(KeptIn kind) const;
    // Puts every variable of one kind back to its default beneath the overrides, as a new drawing
    // does.
    void resetKept(KeptIn kind);
    // Everything as at the start, without overrides. Observers stay and are not told.
    void reset();
    // Puts a value that a drawing or the settings kept in its place beneath an override, read-only
    // variables included. Observers are not told.
    WriteResult setKept(std::wstring_view name, VariableValue const& value);

    // Everything of the drawing, overrides included, for undo: restore brings back the same state.
    struct Slot {
        VariableValue value;
        std::optional<VariableValue> override_;
    };
    using Snapshot = std::vector<Slot>;
    [[nodiscard]] Snapshot snapshot() const;
    void restore(Snapshot const& snapshot);

    // Calls `observer` behind every write of set and setFromText; the number takes it out again.
    using Observer = std::function<void(VariableWrite const&)>;
    int addObserver(Observer observer);
    void removeObserver(int number);

private:
    Variables();
    [[nodiscard]] Slot& slotOf(VariableDefinition const& row);
    [[nodiscard]] Slot const& slotOf(VariableDefinition const& row) const;

    std::vector<Slot> slots_;  // in the order of the table
    std::map<int, Observer> observers_;
    int nextObserver_ = 1;
};

}  // namespace tzhost
