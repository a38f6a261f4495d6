#include "apps/tzdraft/draft_program.h"

#include <new>
#include <string>
#include <unistd.h>
#include <vector>

#include "apps/tzdraft/command_loop.h"
#include "apps/tzdraft/commands/host_commands.h"
#include "apps/tzdraft/end_signals.h"
#include "apps/tzdraft/event_file.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "apps/tzdraft/progress_line.h"
#include "apps/tzdraft/results.h"
#include "apps/tzdraft/start.h"
#include "apps/tzdraft/terminal_source.h"
#include "apps/tzdraft/version.h"
#include "host/base/audit.h"
#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "host/faults/fault_plan.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"
#include "host/settings/settings.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "host/text/visible_text.h"

namespace tzdraft {
namespace {

// One run of the program. Its parts go in the reverse order of their making: the module before the
// drawing, the drawing before the screens.
class Run {
public:
    Run(Options const& options, Screens screens)
        : options_(options), screens_(std::move(screens)), source_(std::move(screens_.source)),
          loop_(session_, options.isStrict ? Strict::yes : Strict::no) {}
    Run(Run const&) = delete;
    Run& operator=(Run const&) = delete;
    ~Run();

    int toItsEnd();

private:
    bool begin();
    bool openSource();
    void watchJobs();
    bool openDrawing();
    bool planFaults();
    void tellIdleFaults() const;
    bool loadModule();
    [[nodiscard]] bool mustEnd() const;
    void tellEarlyEnd() const;
    void greet() const;
    int finish();
    void writeResults();
    void saveSettings();
    bool complain(std::string const& error) const;

    Options const& options_;
    Screens screens_;
    std::unique_ptr<tzhost::AnswerSource> source_;
    std::unique_ptr<ProgressLine> progress_;  // null where nobody looks on
    EventFile events_;
    ProgramSession session_;
    tzhost::FaultPlan faults_;
    SettingsState settings_ = SettingsState::unusable;
    CommandLoop loop_;
    Results results_;
};

bool Run::complain(std::string const& error) const {
    screens_.errors("tzdraft: " + tzhost::visible(error, tzhost::LineFeeds::shown) + "\n");
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

// Nobody looks on where a script answers, or where the transcript goes to a file.
void Run::watchJobs() {
    if (!tzhost::commandLine().isPerson() || isatty(STDOUT_FILENO) != 1) return;
    progress_ =
        std::make_unique<ProgressLine>(screens_.output, [] { tzhost::commandLine().freshLine(); });
    tzhost::setJobWatcher(progress_.get());
}

// A person may name a drawing that is not there yet; to a script that is a mistake.
bool isToBeMade(std::filesystem::path const& file) {
    std::error_code problem;
    auto const status = std::filesystem::status(file, problem);
    bool const isMissing = status.type() == std::filesystem::file_type::not_found;
    std::filesystem::path const folder = file.has_parent_path() ? file.parent_path() : ".";
    return tzhost::commandLine().isPerson() && isMissing &&
           std::filesystem::is_directory(folder, problem);
}

bool Run::openDrawing() {
    if (options_.drawing.empty()) {
        session_.makeNew();
        return true;
    }
    if (isToBeMade(options_.drawing)) {
        session_.makeNew(options_.drawing);
        tzhost::commandLine().say(
            TzString::formatted(localText(L"New drawing: %ls."), options_.drawing.wstring().c_str())
                .str());
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
    line.setScreen([this](tzhost::Shown kind, std::wstring_view text) {
        if (progress_) progress_->clear();
        auto const& screen = kind == tzhost::Shown::error ? screens_.errors : screens_.output;
        screen(tzhost::toUtf8(text));
    });
    line.setEndCheck([this] { return mustEnd(); });
    line.attach();
    tzhost::audit() = tzhost::Audit();
    tzhost::resetWorstAudit();
    std::string error;
    if (!configureHost(options_, settings_, error)) return complain(error);
    if (!openSource() || !planFaults()) return false;
    line.setSource(source_.get());
    watchJobs();
    if (options_.isStrict) line.endScriptAtProblems();
    if (options_.isQuiet && !line.isPerson()) line.keepToProblems();
    if (!options_.events.empty() && !events_.begin(options_.events, error)) return complain(error);
    registerHostCommands();
    loop_.hook();
    session_.setModule(modulePath(options_));
    session_.setPlotting(options_.page, options_.space);
    session_.saveAtEnd(options_.save);
    if (!openDrawing()) return false;
    if (!options_.faults.empty()) faults_.install();
    return loadModule();
}

bool Run::mustEnd() const {
    return EndSignals::caught() != 0 || !screens_.outputProblem().empty();
}

void Run::tellEarlyEnd() const {
    if (int const signal = EndSignals::caught()) {
        complain(TzString::formatted(localText(L"signal %d ended the session"), signal).toUtf8());
    } else if (std::string const problem = screens_.outputProblem(); !problem.empty()) {
        complain(localText("the transcript cannot be written") + ": " + localText(problem.c_str()));
    }
}

// To a person who may be here for the first time.
void Run::greet() const {
    if (!tzhost::commandLine().isPerson()) return;
    std::filesystem::path const& file = session_.drawing().file();
    std::wstring const name = file.empty() ? std::wstring(localText(L"a drawing without a name"))
                                           : tzhost::fromUtf8(file.string());
    tzhost::commandLine().say(TzString::formatted(localText(L"%ls, %ls. %ls lists the commands."),
                                                  TzString::fromUtf8(kVersion).kwszPtr(),
                                                  name.c_str(), localText(L"HELP"))
                                  .str());
}

void Run::writeResults() {
    struct Plot {
        std::filesystem::path const& file;
        tzhost::PlotFormat format;
    };
    results_.write(options_.save,
                   [&](std::string& error) { return session_.save(options_.save, error); });
    for (Plot const& plot :
         {Plot{options_.svg, tzhost::PlotFormat::svg}, Plot{options_.png, tzhost::PlotFormat::png},
          Plot{options_.pdf, tzhost::PlotFormat::pdf}}) {
        std::vector<std::string> remarks;
        results_.write(plot.file, [&](std::string& error) {
            return session_.plotAs(plot.format, plot.file, error, remarks);
        });
        for (std::string const& each : remarks)
            complain(each);
    }
}

void Run::saveSettings() {
    if (settings_ == SettingsState::unusable) return;
    if (auto const problem = tzhost::saveUserVariables(settingsFile(options_))) {
        results_.noteProblem(*problem);
    }
}

int Run::finish() {
    tzhost::commandLine().freshLine();
    tellEarlyEnd();
    faults_.remove();
    tellIdleFaults();
    writeResults();
    saveSettings();
    bool const leftOver = !tzhost::worstAudit().clean();
    tzhost::dynamicLinker().unloadAll();
    results_.write(options_.events, [&](std::string& error) { return events_.finish(error); });
    std::vector<std::string> const problems = results_.problems();
    for (std::string const& problem : problems)
        complain(problem);
    if (!problems.empty()) return kUnusable;
    if (leftOver) return kLeftOver;
    return tzhost::commandLine().hasFailed() ? kFailed : kDone;
}

int Run::toItsEnd() {
    if (!begin()) return kUnusable;
    EndSignals const endInOrder;
    greet();
    loop_.run();
    return finish();
}

Run::~Run() {
    faults_.remove();
    tzhost::dynamicLinker().unloadAll();
    tzhost::clearCommandHooks();
    (void)tzhost::commandStack().removeGroup(kHostCommandGroup);
    tzhost::setJobWatcher(nullptr);
    tzhost::commandLine().reset();
}

}  // namespace

int runProgram(Options const& options, Screens screens) {
    auto const errors = screens.errors;
    try {
        return Run(options, std::move(screens)).toItsEnd();
    } catch (std::bad_alloc const&) {
        errors("tzdraft: " + localText("there is not enough memory") + "\n");
    }
    return kUnusable;
}

}  // namespace tzdraft
