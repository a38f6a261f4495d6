#include "apps/tzdraft/program.h"

#include <exception>
#include <optional>
#include <string>
#include <vector>

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/host_commands.h"
#include "apps/tzdraft/event_file.h"
#include "apps/tzdraft/function_call.h"
#include "apps/tzdraft/local_text.h"
#include "apps/tzdraft/session.h"
#include "apps/tzdraft/start.h"
#include "apps/tzdraft/terminal_source.h"
#include "host/base/audit.h"
#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "host/faults/fault_plan.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"
#include "host/selection/entity_list.h"
#include "host/selection/selection_sets.h"
#include "host/settings/settings.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

// One run of the program. Its parts go in the reverse order of their making: the module before the
// drawing, the drawing before the screens.
class Run {
public:
    Run(Options const& options, Screens screens)
        : options_(options), screens_(std::move(screens)), source_(std::move(screens_.source)) {}
    Run(Run const&) = delete;
    Run& operator=(Run const&) = delete;
    ~Run();

    int toItsEnd();

private:
    bool begin();
    bool openSource();
    bool openDrawing();
    bool planFaults();
    void tellIdleFaults() const;
    bool loadModule();
    void readCommands();
    [[nodiscard]] std::vector<std::wstring> commandNames() const;
    void runCall(std::wstring const& line);
    void runTyped(std::wstring const& line);
    void runGuarded(std::wstring const& line);
    void beginCommand(tzhost::Command const& command);
    void endCommand(tzhost::Command const& command);
    int finish();
    void writeResults();
    void saveSettings();
    void note(std::filesystem::path const& result, std::string const& problem);
    bool complain(std::string const& error) const;

    Options const& options_;
    Screens screens_;
    std::unique_ptr<tzhost::AnswerSource> source_;
    EventFile events_;
    Session session_;
    tzhost::FaultPlan faults_;
    SettingsState settings_ = SettingsState::unusable;
    std::vector<std::string> problems_;  // with results, one line each
    std::string written_;                // results, apart by commas
};

bool Run::complain(std::string const& error) const {
    screens_.errors("tzdraft: " + error + "\n");
    return false;
}

bool Run::openSource() {
    if (source_) return true;
    if (options_.script.empty() && TerminalSource::isThere()) {
        source_ = std::make_unique<TerminalSource>();
        return true;
    }
    std::string error;
    source_ = tzhost::ScriptSource::open(options_.script.empty() ? "-" : options_.script, error);
    return source_ ? true : complain(error);
}

bool Run::openDrawing() {
    if (options_.drawing.empty()) {
        session_.makeNew();
        return true;
    }
    std::string error;
    return session_.open(options_.drawing, error) || complain(error);
}

bool Run::planFaults() {
    for (std::string const& rule : options_.faults) {
        if (auto const problem = faults_.add(rule)) return complain("--fail " + *problem);
    }
    return true;
}

// A fault that struck nothing is easily taken for one that was survived.
void Run::tellIdleFaults() const {
    for (auto const& [rule, calls] : faults_.idleRules()) {
        complain("--fail \"" + rule + "\": " +
                 localText("made nothing fail; calls of the operation: ") + std::to_string(calls));
    }
}

bool Run::loadModule() {
    std::string error;
    if (tzhost::dynamicLinker().load(modulePath(options_), error)) return true;
    std::error_code unseen;  // the loader has said what is wrong with the name
    if (std::filesystem::exists(modulePath(options_), unseen) && !hasModuleResources())
        error += "; " + localText("its resource library is missing or damaged");
    return complain(error);
}

bool Run::begin() {
    tzhost::CommandLine& line = tzhost::commandLine();
    line.reset();
    line.setScreen([this](std::wstring_view text) { screens_.output(tzhost::toUtf8(text)); });
    line.setErrorScreen([this](std::wstring_view text) { screens_.errors(tzhost::toUtf8(text)); });
    line.attach();
    tzhost::audit() = tzhost::Audit();
    tzhost::resetWorstAudit();
    std::string error;
    if (!configureHost(options_, settings_, error)) return complain(error);
    if (!openSource() || !planFaults()) return false;
    line.setSource(source_.get());
    if (!options_.events.empty() && !events_.begin(options_.events, error)) return complain(error);
    registerHostCommands();
    tzhost::addCommandHooks({[this](tzhost::Command const& command) { beginCommand(command); },
                             [this](tzhost::Command const& command) { endCommand(command); }});
    session_.setModule(modulePath(options_));
    if (!openDrawing()) return false;
    if (!options_.faults.empty()) faults_.install();
    return loadModule();
}

// Names of commands, for completion.
std::vector<std::wstring> Run::commandNames() const {
    std::vector<std::wstring> names;
    if (tzhost::commandLine().isScripted()) return names;
    for (tzhost::Command const& each : tzhost::commandStack().commands()) {
        names.push_back(each.localName.str());
        names.push_back(L'_' + each.globalName.str());
    }
    return names;
}

// A call is taken back as a command is.
void Run::runCall(std::wstring const& line) {
    session_.beginCommand();
    try {
        callTyped(line);
    } catch (...) {
        session_.endCommand();
        throw;
    }
    session_.endCommand();
}

bool isCall(std::wstring const& line) {
    return line.front() == L'(';
}

void Run::runTyped(std::wstring const& line) {
    if (isCall(line)) return runCall(line);
    tzhost::Command const* const command = tzhost::commandStack().find(TzString(line));
    if (!command) {
        return tzhost::commandLine().say(
            TzString::formatted(localText(L"There is no command \"%ls\"."), line.c_str()).str());
    }
    auto const answers = tzhost::commandLine().isScripted() ? tzhost::AnswersFrom::script
                                                            : tzhost::AnswersFrom::user;
    tzhost::runCommand(*command, answers);
}

void Run::runGuarded(std::wstring const& line) {
    try {
        runTyped(line);
        session_.doPostponed();
    } catch (std::exception const& problem) {
        tzhost::commandLine().say(line + localText(L" ended early: ") +
                                  tzhost::fromUtf8(problem.what()));
    }
    // The command's audit has counted them; a call has none, so the next command's does.
    if (!isCall(line)) tzhost::freeAllSets();
}

// Enter alone repeats the line before it at a terminal; in a script it does nothing.
void Run::readCommands() {
    std::wstring last;
    while (!session_.wantsToEnd()) {
        std::optional<std::wstring> const line = tzhost::commandLine().readCommand(commandNames());
        if (!line) return;
        if (!line->empty()) last = *line;
        if (!line->empty() || (!last.empty() && !tzhost::commandLine().isScripted()))
            runGuarded(last);
    }
}

// What a command of the program prints is no event, and one that does not look at the selection
// made before it begins without one.
void Run::beginCommand(tzhost::Command const& command) {
    bool const isOwn = command.group == TzString(kHostCommandGroup);
    tzhost::commandLine().setVoice(isOwn ? tzhost::CommandLine::Voice::host
                                         : tzhost::CommandLine::Voice::module);
    if ((command.flags & tzhost::Command::kUsesImpliedSelection) == 0) {
        tzhost::dropImpliedSelection();
    }
    session_.beginCommand();
}

void Run::endCommand(tzhost::Command const& command) {
    session_.endCommand();
    if (command.callback != selectCommand) tzhost::dropImpliedSelection();
    tzhost::commandLine().setVoice(tzhost::CommandLine::Voice::module);
}

// A result that was written, or why it was not.
void Run::note(std::filesystem::path const& result, std::string const& problem) {
    if (!problem.empty()) return problems_.push_back(problem);
    if (!written_.empty()) written_ += ", ";
    written_ += result.string();
}

// One that cannot be written keeps none of the others back.
void Run::writeResults() {
    struct Plot {
        std::filesystem::path const& file;
        tzhost::PlotFormat format;
    };
    if (!options_.save.empty()) {
        std::string error;
        (void)session_.save(options_.save, error);  // the error says it
        note(options_.save, error);
    }
    for (Plot const& plot : {
             Plot{options_.svg, tzhost::PlotFormat::svg},
             Plot{options_.png, tzhost::PlotFormat::png},
             Plot{options_.pdf, tzhost::PlotFormat::pdf}
    }) {
        if (plot.file.empty()) continue;
        std::string error;
        (void)session_.plotAs(plot.format, plot.file, error);
        note(plot.file, error);
    }
}

void Run::saveSettings() {
    if (settings_ == SettingsState::unusable) return;
    if (auto const problem = tzhost::saveUserVariables(settingsFile(options_))) {
        problems_.push_back(*problem);
    }
}

int Run::finish() {
    tzhost::commandLine().freshLine();
    faults_.remove();
    tellIdleFaults();
    writeResults();
    saveSettings();
    bool const leftOver = !tzhost::worstAudit().clean();
    tzhost::dynamicLinker().unloadAll();
    if (!options_.events.empty()) {
        std::string error;
        (void)events_.finish(error);
        note(options_.events, error);
    }
    if (!problems_.empty()) {
        if (!written_.empty()) problems_.back() += "; " + tzhost::localText("written: ") + written_;
        for (std::string const& problem : problems_)
            complain(problem);
        return kUnusable;
    }
    if (leftOver) return kLeftOver;
    return tzhost::commandLine().hasFailed() ? kInputEnded : kDone;
}

int Run::toItsEnd() {
    if (!begin()) return kUnusable;
    readCommands();
    return finish();
}

Run::~Run() {
    faults_.remove();
    tzhost::dynamicLinker().unloadAll();
    tzhost::clearCommandHooks();
    (void)tzhost::commandStack().removeGroup(kHostCommandGroup);
    tzhost::commandLine().reset();
}

}  // namespace

int runProgram(Options const& options, Screens screens) {
    return Run(options, std::move(screens)).toItsEnd();
}

}  // namespace tzdraft
