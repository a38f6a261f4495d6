#include "tests/sweep/command_sweep.h"

#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>
#include <random>
#include <string_view>

#include "apps/tzdraft/draft_program.h"
#include "apps/tzdraft/program_session.h"
#include "host/command_line/script_source.h"
#include "host/drawing_file/drawing_file.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/selection/entity_list.h"

namespace tztest {
namespace {

constexpr wchar_t kModuleGroup[] = L"TZCORE_MTEXT";
// Commands of the program that change the drawing at their end or not at all.
constexpr wchar_t const* kWholeCommands[] = {L"MOVE", L"COPY", L"ROTATE", L"TEXT", L"INSERT"};

bool isSwept(tzhost::Command const& command) {
    return command.group == kModuleGroup ||
           std::any_of(std::begin(kWholeCommands), std::end(kWholeCommands),
                       [&](wchar_t const* name) { return command.globalName == name; });
}

// What a command was given, in the order in which it asked: answers and blocks of editors.
struct Recorded {
    std::vector<tzhost::Answer> answers;
    std::vector<tzhost::EditorBlock> blocks;
};

// One try: how many answers are given before everything is cancelled, and which call fails.
struct Plan {
    std::string what;
    std::size_t answers = 0;
    std::string fault;
};

// Drawings are flushed to the disk when they are written, which takes nearly all of a sweep's time
// unless the file lies in memory.
std::filesystem::path scratchFile() {
    static std::filesystem::path const file = [] {
        std::filesystem::path const memory = "/dev/shm";
        std::error_code none;
        bool const usable =
            std::filesystem::is_directory(memory, none) && ::access(memory.c_str(), W_OK) == 0;
        return (usable ? memory : std::filesystem::path(std::getenv("TZ_TEST_SCRATCH"))) /
               ("tz_sweep_" + std::to_string(::getpid()) + ".json");
    }();
    return file;
}

// The drawing as a file would hold it, without the last point; empty when it cannot be saved.
std::string savedDrawing() {
    if (!tzhost::writeDrawing(tzdraft::ProgramSession::current().drawing(), scratchFile()).empty())
        return {};
    std::ifstream in(scratchFile(), std::ios::binary);
    std::string text{std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
    constexpr std::string_view kEnd = "],";
    if (auto const point = text.find(R"("LASTPOINT":[)"); point != text.npos)
        text.erase(point, text.find(kEnd, point) + kEnd.size() - point);
    return text;
}

class SweepSource : public tzhost::AnswerSource {
public:
    SweepSource(std::string const& script,
                Sweep kind,
                SweepDepth depth,
                std::function<void(SweepTry const&)> const& judge,
                SweepCounts& counts)
        : script_(script), kind_(kind), depth_(depth), judge_(judge), counts_(counts) {}

    [[nodiscard]] tzhost::Answer next(tzhost::AnswerRequest const& request) override;
    [[nodiscard]] std::optional<tzhost::EditorBlock> takeBlock() override;

private:
    enum class Phase { passing, recording, trying };

    tzhost::Answer nextCommand(tzhost::AnswerRequest const& request);
    tzhost::Answer begin(tzhost::Answer const& line);
    void planTries();
    void planFaults();
    void startTry(Plan const& plan);
    void finishTry();
    void takeBack();

    tzhost::ScriptSource script_;
    Sweep kind_;
    SweepDepth depth_;
    std::function<void(SweepTry const&)> const& judge_;
    SweepCounts& counts_;
    Phase phase_ = Phase::passing;
    tzhost::Answer command_;
    Recorded recorded_;
    std::vector<Plan> plans_;
    std::size_t plan_ = 0;
    std::size_t answered_ = 0;
    std::size_t blocksTaken_ = 0;
    std::size_t undoSteps_ = 0;
    tzhost::EntityIds implied_;  // every try has it anew
    std::string before_;
    tzhost::FaultPlan faults_;
    std::mt19937 random_{20261121};
};

tzhost::Answer SweepSource::next(tzhost::AnswerRequest const& request) {
    if (request.kind == tzhost::QuestionKind::command) return nextCommand(request);
    if (phase_ == Phase::passing) return script_.next(request);
    if (phase_ == Phase::recording) {
        recorded_.answers.push_back(script_.next(request));
        return recorded_.answers.back();
    }
    if (answered_ < plans_[plan_].answers && answered_ < recorded_.answers.size()) {
        return recorded_.answers[answered_++];
    }
    return {tzhost::Answer::Kind::cancel, L""};
}

std::optional<tzhost::EditorBlock> SweepSource::takeBlock() {
    if (phase_ == Phase::trying) {
        if (blocksTaken_ == recorded_.blocks.size()) return std::nullopt;
        return recorded_.blocks[blocksTaken_++];
    }
    std::optional<tzhost::EditorBlock> block = script_.takeBlock();
    if (block && phase_ == Phase::recording) recorded_.blocks.push_back(*block);
    return block;
}

// At the idle prompt: ends what ran, and begins the next try or the next command.
tzhost::Answer SweepSource::nextCommand(tzhost::AnswerRequest const& request) {
    if (phase_ == Phase::recording) {
        planTries();
        faults_.remove();
        takeBack();
    } else if (phase_ == Phase::trying) {
        finishTry();
        ++plan_;
    }
    if (phase_ != Phase::passing && plan_ < plans_.size()) {
        startTry(plans_[plan_]);
        return command_;
    }
    phase_ = Phase::passing;
    return begin(script_.next(request));
}

tzhost::Answer SweepSource::begin(tzhost::Answer const& line) {
    if (line.kind != tzhost::Answer::Kind::line) return line;
    tzhost::Command const* const command = tzhost::commandStack().find(TzString(line.text));
    if (!command || !isSwept(*command)) return line;
    ++counts_.commands;
    phase_ = Phase::recording;
    command_ = line;
    recorded_ = {};
    plans_.clear();
    plan_ = 0;
    undoSteps_ = tzdraft::ProgramSession::current().drawing().undoLog().steps();
    implied_ = tzhost::impliedSelection();
    before_ = savedDrawing();
    faults_.clear();
    faults_.install();  // without rules it counts the calls
    return line;
}

void SweepSource::planTries() {
    std::size_t const all = recorded_.answers.size();
    counts_.questions += static_cast<long>(all);
    if (kind_ == Sweep::faults) {
        planFaults();
    } else {
        for (std::size_t given = 0; given < all; ++given) {
            plans_.push_back({"cancel from question " + std::to_string(given + 1), given, ""});
        }
    }
    plans_.push_back({"", all, ""});  // the last one is for good
}

void SweepSource::planFaults() {
    std::size_t const all = recorded_.answers.size();
    for (auto const& [operation, calls] : faults_.calls()) {
        counts_.calls += calls;
        std::vector<long> chosen;
        for (long call = 1; call <= std::min(calls, depth_.allUpTo); ++call)
            chosen.push_back(call);
        if (calls > depth_.allUpTo) {
            std::uniform_int_distribution<long> beyond(depth_.allUpTo + 1, calls);
            for (long count = 0; count < depth_.sampleBeyond; ++count) {
                chosen.push_back(beyond(random_));
            }
        }
        for (long const call : chosen) {
            std::string const rule = operation + ":" + std::to_string(call);
            plans_.push_back({rule, all, rule});
        }
    }
}

void SweepSource::startTry(Plan const& plan) {
    phase_ = Phase::trying;
    answered_ = 0;
    blocksTaken_ = 0;
    tzhost::setImpliedSelection(implied_);
    faults_.clear();
    if (!plan.fault.empty() && !faults_.add(plan.fault)) faults_.install();
}

void SweepSource::finishTry() {
    Plan const& plan = plans_[plan_];
    faults_.remove();
    if (plan.what.empty()) return;
    ++counts_.tries;
    SweepTry done;
    done.command = TzString(command_.text).toUtf8();
    done.what = plan.what;
    tzhost::Audit left = tzhost::worstAudit();
    done.auditIsClean = left.clean();
    left.highlighted = 0;
    done.onlyHighlightingIsLeft = !done.auditIsClean && left.clean();
    std::string const after = savedDrawing();
    done.drawingIsUntouched = after == before_;
    done.drawingIsValid = !after.empty() && tzhost::readDrawing(scratchFile()).drawing != nullptr;
    tzhost::resetWorstAudit();
    takeBack();
    judge_(done);
}

void SweepSource::takeBack() {
    tzhost::UndoLog& log = tzdraft::ProgramSession::current().drawing().undoLog();
    while (log.steps() > undoSteps_ && log.takeBack()) {
    }
}

}  // namespace

SweepCounts sweepScript(SweepInput const& input,
                        Sweep kind,
                        SweepDepth depth,
                        std::function<void(SweepTry const&)> const& judge) {
    SweepCounts counts;
    tzdraft::Options options;
    options.settings = std::filesystem::path(std::getenv("TZ_TEST_SCRATCH")) / "settings.json";
    std::ofstream(options.settings) << "{}";
    options.drawing = input.drawing;
    options.module = std::filesystem::path(std::getenv("TZ_TEST_LIB")) / "tzmted.tzx";
    tzdraft::Screens screens;
    screens.output = [](std::string_view) {};
    screens.errors = [](std::string_view) {};
    screens.source = std::make_unique<SweepSource>(input.script, kind, depth, judge, counts);
    int const status = tzdraft::runProgram(options, std::move(screens));
    if (status != tzdraft::kDone)
        judge({"the whole run", "exit status " + std::to_string(status), false});
    std::filesystem::remove(scratchFile());
    return counts;
}

}  // namespace tztest
