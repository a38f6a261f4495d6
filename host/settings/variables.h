#pragma once

// The values of the system variables: one store for the process, since one drawing is open at a
// time. Opening a drawing puts its values in, saving one takes them out, and undo takes snapshots.
//
//   tzhost::Variables& store = tzhost::Variables::instance();
//   if (auto const written = store.set(L"LUNITS", short{4}, tzhost::Writer::user);
//   !written.isDone()) {
//       say(written.reason);
//   }
//
// An override is a value for this run alone. It hides the value of the drawing or the settings in
// every read and is never saved. The next write ends it, but not that of a read-only variable,
// which only the host writes. Not thread-safe.

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

// Who writes. Only the host may write read-only variables.
enum class Writer { user, module, host };

struct WriteResult {
    int status = 0;       // 5100, or -5001 and nothing has changed
    std::wstring reason;  // why not: one sentence that names the variable; empty when done

    [[nodiscard]] bool isDone() const { return reason.empty(); }
};

// A write that took place. The value may equal the previous one.
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
    // The same for a row of the table, without a search.
    [[nodiscard]] VariableValue const& get(VariableDefinition const& row) const;
    // The value in force as a number or a text; 0 or empty for an unknown name or another type.
    [[nodiscard]] double number(std::wstring_view name) const;
    [[nodiscard]] std::wstring text(std::wstring_view name) const;

    WriteResult set(std::wstring_view name, VariableValue const& value, Writer writer);
    // The same from a text as SETVAR and --var get it.
    WriteResult setFromText(std::wstring_view name, std::wstring_view text, Writer writer);
    // Sets an override. Read-only variables take one too; limits hold.
    WriteResult overrideFromText(std::wstring_view name, std::wstring_view text);

    // The values of one kind without overrides, by name: what a drawing or the settings save.
    using Values = std::vector<std::pair<std::wstring_view, VariableValue>>;
    [[nodiscard]] Values kept(KeptIn kind) const;
    // Puts every variable of one kind back to its default, as a new drawing does. Overrides stay.
    void resetKept(KeptIn kind);
    // Puts every variable back to its default, without overrides. Observers stay and are not told.
    void reset();
    // Sets the value that a drawing or the settings kept; an override stays. Read-only variables
    // are set too. Observers are not told.
    WriteResult setKept(std::wstring_view name, VariableValue const& value);

    // All variables that a drawing keeps, with their overrides, for undo: restore brings them back.
    struct Slot {
        VariableValue value;
        std::optional<VariableValue> override_;
    };
    using Snapshot = std::vector<Slot>;
    [[nodiscard]] Snapshot snapshot() const;
    void restore(Snapshot const& snapshot);

    // Calls `observer` after every write by set and setFromText. Returns its number, by which
    // removeObserver takes it out.
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
