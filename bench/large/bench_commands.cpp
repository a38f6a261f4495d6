// Commands on one entity of a drawing with 100,000, each taken back again. The floor is the same in
// a drawing with 10: neither the audit nor undo may look at objects that a command does not touch.
// Further commands work on all of 100,000 texts. Their floor is as many texts in 100 drawings of
// 1,000, each visited once a turn as in a session: the cost of a text must not grow with the
// selection.
#include <benchmark/benchmark.h>

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "apps/tzdraft/commands/host_commands.h"
#include "bench/support/against_floor.h"
#include "bench/support/filled_drawing.h"
#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "host/files/install_paths.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "host/runtime/module_linker.h"
#include "tz/db/symbol_table.h"
#include "tz/mte/easy_object.h"

namespace {

constexpr double kMost = 1.2;
constexpr int kSmall = 10;
constexpr int kLarge = 100000;
constexpr int kRepeats = 100;
constexpr double kMostForAll = 1.3;
constexpr int kFew = 1000;

struct CommandRow {
    char const* name;
    wchar_t const* command;
    char const* answers;
    bool changes;  // leaves a step to take back
};
constexpr CommandRow kCommands[] = {
    {"erase", L"ERASE", "#6\n\n", true},
    {"eraseLast", L"ERASE", "last\n\n", true},
    {"list", L"LIST", "#6\n\n", false},
    {"newText", L"-MTEXT", "0,-5\n10,-9\nAnother note\n\n", true},
};

constexpr CommandRow kOnAll[] = {
    {"heightOfAll", L"-MTEDIT", "all\n\n5\n", true},
    {"styleOfAll", L"MTEXTPROPERTIES", "all\n\nStyle\nTwo\n", true},
    {"turnAll", L"MTEXTPROPERTIES", "all\n\nRotate\n45\n", true},
    {"justifyAll", L"MTEXTPROPERTIES", "all\n\nJustify\nMC\n", true},
};

// The program's commands and the module's, with undo around each.
class Commands {
public:
    Commands() {
        tzdraft::registerHostCommands();
        tzhost::addCommandHooks({[](auto const&) { tzhost::workingDrawing()->undoLog().begin(); },
                                 [](auto const&) { tzhost::workingDrawing()->undoLog().end(); }});
        tzhost::commandLine().attach();
        auto const module = std::filesystem::path(tzhost::libraryFolder()) / "tzmted.tzx";
        isLoaded_ = tzhost::dynamicLinker().load(module, error_);
    }
    Commands(Commands const&) = delete;
    Commands& operator=(Commands const&) = delete;
    ~Commands() {
        tzhost::documents().close();
        tzhost::dynamicLinker().unloadAll();
        tzhost::clearCommandHooks();
        (void)tzhost::commandStack().removeGroup(tzdraft::kHostCommandGroup);
        tzhost::commandLine().reset();
        tzhost::setWorkingDrawing(nullptr);
    }
    [[nodiscard]] bool isLoaded() const { return isLoaded_; }
    [[nodiscard]] std::string const& error() const { return error_; }

    // Runs the command and takes it back, again and again; how often that went wrong.
    static int repeat(tzhost::Drawing* drawing, CommandRow const& row, int times = kRepeats) {
        tzhost::setWorkingDrawing(drawing);
        tzhost::documents().open(drawing);
        tzhost::Command const* const command = tzhost::commandStack().find(row.command);
        int wrong = 0;
        for (int left = times; left > 0; --left) {
            tzhost::ScriptSource answers{std::string_view(row.answers)};
            tzhost::commandLine().setSource(&answers);
            bool const isClean = tzhost::runCommand(*command, tzhost::AnswersFrom::script).clean();
            bool const isTakenBack = drawing->undoLog().takeBack();
            wrong += isClean && isTakenBack == row.changes ? 0 : 1;
        }
        tzhost::commandLine().setSource(nullptr);
        return wrong;
    }

private:
    std::string error_;
    bool isLoaded_;
};

void runOnOne(benchmark::State& state) {
    CommandRow const& row = kCommands[state.range(0)];
    state.SetLabel(row.name);
    Commands const commands;
    if (!commands.isLoaded()) state.SkipWithError(commands.error().c_str());
    auto const small = tzbench::drawingWith(kSmall);
    auto const large = tzbench::drawingWith(kLarge);
    if (Commands::repeat(small.get(), row) > 0) state.SkipWithError("the command went wrong");
    tzbench::AgainstFloor against(state, kMost);
    while (state.KeepRunning())
        against.turn([&] { return Commands::repeat(large.get(), row); },
                     [&] { return Commands::repeat(small.get(), row); });
}
BENCHMARK(runOnOne)
    ->DenseRange(0, std::size(kCommands) - 1)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);

// A drawing of texts with a second style to choose.
std::unique_ptr<tzhost::Drawing> textsWithTwoStyles(int count) {
    auto drawing = tzbench::drawingWithTexts(count);
    EasyTable<TzDbTextStyleTable> styles;
    if (drawing->getTextStyleTable(styles.object, TzDb::kForWrite) != Tzad::eOk) return drawing;
    auto* const style = new TzDbTextStyleTableRecord;
    TzDbObjectId id;
    // When the style is refused, its first use finds that it is missing.
    if (style->setName(L"Two") == Tzad::eOk && styles->addRecord(style, id) == Tzad::eOk)
        (void)style->close();
    return drawing;
}

void runOnAll(benchmark::State& state) {
    CommandRow const& row = kOnAll[state.range(0)];
    state.SetLabel(row.name);
    Commands const commands;
    if (!commands.isLoaded()) state.SkipWithError(commands.error().c_str());
    std::vector<std::unique_ptr<tzhost::Drawing>> few;
    while (few.size() < kLarge / kFew)
        few.push_back(textsWithTwoStyles(kFew));
    auto const many = textsWithTwoStyles(kLarge);
    auto const repeatFew = [&] {
        int wrong = 0;
        for (auto const& drawing : few)
            wrong += Commands::repeat(drawing.get(), row, 1);
        return wrong;
    };
    if (repeatFew() > 0) state.SkipWithError("the command went wrong");
    tzbench::AgainstFloor against(state, kMostForAll);
    while (state.KeepRunning())
        against.turn([&] { return Commands::repeat(many.get(), row, 1); }, repeatFew);
}
// Turns of a tenth of a second differ by a third on a machine of several users.
BENCHMARK(runOnAll)
    ->DenseRange(0, std::size(kOnAll) - 1)
    ->MinTime(3.0)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
}  // namespace
