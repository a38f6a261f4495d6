#include "apps/tzdraft/program.h"

#include <exception>
#include <optional>
#include <string>

#include "apps/tzdraft/commands/host_commands.h"
#include "apps/tzdraft/event_file.h"
#include "apps/tzdraft/function_call.h"
#include "apps/tzdraft/session.h"
#include "apps/tzdraft/start.h"
#include "host/base/audit.h"
#include "host/base/settings.h"
#include "host/base/utf8.h"
#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "host/faults/fault_plan.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"

namespace tzdraft {
namespace {

// One run of the program. Its parts go in the reverse order of their making: the module before the
// drawing, the drawing before the screens.
class Run {
public:
    Run(Options const& options, Screens const& screens) : options_(options), screens_(screens) {}
    Run(Run const&) = delete;
    Run& operator=(Run const&) = delete;
    ~Run();

    int toItsEnd();

private:
    bool begin();
    bool openScript();
    bool openDrawing();
    bool planFaults();
    bool loadModule();
    void readCommands();
    void runTyped(std::wstring const& line);
    int finish();
    bool writeResults();
    bool saveSettings();
    bool complain(std::string const& error) const;

    Options const& options_;
    Screens const& screens_;
    std::unique_ptr<tzhost::AnswerSource> source_;
    EventFile events_;
    Session session_;
    tzhost::FaultPlan faults_;
    SettingsState settings_ = SettingsState::unusable;
};

bool Run::complain(std::string const& error) const {
    screens_.errors("tzdraft: " + error + "\n");
    return false;
}

bool Run::openScript() {
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

bool Run::loadModule() {
    std::string error;
    return tzhost::dynamicLinker().load(modulePath(options_), error) || complain(error);
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
    if (!openScript() || !planFaults()) return false;
    line.setSource(source_.get());
    if (!options_.events.empty() && !events_.begin(options_.events, error)) return complain(error);
    registerHostCommands();
    tzhost::addCommandHooks({[this](tzhost::Command const&) { session_.beginCommand(); },
                             [this](tzhost::Command const&) { session_.endCommand(); }});
    if (!openDrawing()) return false;
    if (!options_.faults.empty()) faults_.install();
    return loadModule();
}

void Run::runTyped(std::wstring const& line) {
    if (line.front() == L'(') return callTyped(line);
    tzhost::Command const* const command = tzhost::commandStack().find(TzString(line));
    if (!command) {
        return tzhost::commandLine().say(L"There is no command \"" + line + L"\".");
    }
    TzString const name = command->globalName;
    auto const answers = tzhost::commandLine().isScripted() ? tzhost::AnswersFrom::script
                                                            : tzhost::AnswersFrom::user;
    try {
        tzhost::runCommand(*command, answers);
    } catch (std::exception const& problem) {
        tzhost::commandLine().say(name.str() + L" ended early: " +
                                  tzhost::fromUtf8(problem.what()));
    }
}

void Run::readCommands() {
    while (!session_.wantsToEnd()) {
        std::optional<std::wstring> const line = tzhost::commandLine().readCommand();
        if (!line) return;
        if (!line->empty()) runTyped(*line);
    }
}

bool Run::writeResults() {
    struct Plot {
        std::filesystem::path const& file;
        tzhost::PlotFormat format;
    };
    bool done = true;
    std::string error;
    if (!options_.save.empty() && !session_.save(options_.save, error)) done = complain(error);
    for (Plot const& plot : {
             Plot{options_.svg, tzhost::PlotFormat::svg},
             Plot{options_.png, tzhost::PlotFormat::png},
             Plot{options_.pdf, tzhost::PlotFormat::pdf}
    }) {
        if (plot.file.empty() || session_.plotAs(plot.format, plot.file, error)) continue;
        done = complain(error);
    }
    return done;
}

bool Run::saveSettings() {
    if (settings_ == SettingsState::unusable) return true;
    auto const problem = tzhost::saveUserVariables(settingsFile(options_));
    return !problem || complain(*problem);
}

int Run::finish() {
    tzhost::commandLine().freshLine();
    faults_.remove();
    std::string error;
    bool written = writeResults();
    if (!saveSettings()) written = false;
    bool const leftOver = !tzhost::worstAudit().clean();
    tzhost::dynamicLinker().unloadAll();
    if (!events_.finish(error)) written = complain(error);
    if (!written) return kUnusable;
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

int runProgram(Options const& options, Screens const& screens) {
    return Run(options, screens).toItsEnd();
}

}  // namespace tzdraft
