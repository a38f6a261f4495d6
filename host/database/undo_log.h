#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "host/database/object_imp.h"
#include "host/settings/variables.h"

// What each command changed in a drawing, so that it can be taken back and done again. An object
// costs something only when a command changes it: its values are copied once per command, before
// the first change.
//
//   log.begin(L"LINE"); ... a command ...; log.end();
//   log.takeBack();      // the drawing is as it was before the command
//   log.doAgain();       // and as the command left it
//
// Outside begin and end nothing is noted.
namespace tzhost {

class Drawing;
struct DrawingSettings;

class UndoLog {
public:
    explicit UndoLog(Drawing& drawing);
    ~UndoLog();

    // Steps do not nest: inside a step, begin and end are counted and change nothing.
    // `name` is what a drafter calls the command.
    void begin(std::wstring name = {});
    // Keeps the step when anything but the last point differs from what it was before the command,
    // and returns whether it is kept: then what was taken back before it cannot be done again.
    bool end();
    // Takes back the last finished step; false when there is none. Within a step the undoing itself
    // is not noted, nor is the doing again.
    bool takeBack();
    // Does again what was taken back last; false when there is nothing.
    bool doAgain();
    void forgetTakenBack();
    // The names of the steps that takeBack and doAgain would take; empty for none.
    [[nodiscard]] std::wstring nextBack() const { return nameOfLast(steps_); }
    [[nodiscard]] std::wstring nextAgain() const { return nameOfLast(takenBack_); }
    [[nodiscard]] bool isEmpty() const { return steps_.empty(); }
    // Finished steps that can be taken back.
    [[nodiscard]] std::size_t steps() const { return steps_.size(); }
    // The drawing is in a file as the finished steps left it, and whether that is so now.
    void noteSaved() { saved_ = state(); }
    [[nodiscard]] bool isSaved() const { return saved_ == state(); }

    // The object is about to change; it also covers erasing.
    void noteChange(TzDbObjectRecord& record);
    // Makes room for noteAppended, which then cannot fail.
    void prepareAppend();
    // The object has just been added to the drawing.
    void noteAppended(TzDbObjectRecord& record) noexcept;

private:
    struct Entry {
        TzDbObjectRecord* record;
        std::unique_ptr<TzDbObjectImp> values;  // null for an object that the step added
        bool erased;

        // An editor sets the fields of a text anew, though they say what they said. Then the
        // object has its old ones again.
        void putBackEqualFields() const;
        // Whether the object is as it was.
        [[nodiscard]] bool isUnchanged() const;
    };
    struct VariableChange {
        std::size_t slot;
        Variables::Slot other;
    };
    // What is otherwise on the other side of a command: before it while it can be taken back, after
    // it once it was. Taking back and doing again exchange the two.
    struct Step {
        std::wstring name;
        std::vector<Entry> entries;
        std::vector<VariableChange> variables;
        std::unique_ptr<DrawingSettings> settings;  // null when they did not change
        std::uint32_t serial = 0;

        [[nodiscard]] bool isKept() const;
    };

    // The step that led to what the drawing holds, 0 for none.
    [[nodiscard]] std::uint32_t state() const { return steps_.empty() ? 0 : steps_.back().serial; }
    [[nodiscard]] static std::wstring nameOfLast(std::vector<Step> const& steps);
    void rememberBase();
    void collectVariables();
    void dropUnchanged();
    static void fetchAhead(std::vector<Entry> const& entries, std::size_t at);
    bool pass(std::vector<Step>& from, std::vector<Step>& to);
    void exchange(Step& step);
    static void exchange(Entry& entry);
    static void exchangeVariables(Step& step);

    Drawing& drawing_;
    std::vector<Step> steps_;
    std::vector<Step> takenBack_;  // the last one is the next to be done again
    Step open_;
    int depth_ = 0;
    std::uint32_t serial_ = 0;  // of the step that is open; records carry it
    std::uint32_t saved_ = 0;   // the state that a file holds
    Variables::Snapshot baseVariables_;
    std::unique_ptr<DrawingSettings> baseSettings_;
};

}  // namespace tzhost
