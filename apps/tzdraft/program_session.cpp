#include "apps/tzdraft/program_session.h"

#include <algorithm>
#include <array>
#include <utility>

#include "apps/tzdraft/program_texts.h"
#include "host/base/memory_faults.h"
#include "host/command_line/command_line.h"
#include "host/display/plot.h"
#include "host/drawing_file/drawing_file.h"
#include "host/runtime/documents.h"
#include "host/runtime/module_linker.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

ProgramSession* running = nullptr;

struct PlotEnding {
    wchar_t const* ending;
    tzhost::PlotFormat format;
};
constexpr std::array kPlotEndings{
    PlotEnding{L".svg", tzhost::PlotFormat::svg},
    PlotEnding{L".png", tzhost::PlotFormat::png},
    PlotEnding{L".pdf", tzhost::PlotFormat::pdf},
};

// Drawings that undo can bring back.
constexpr std::size_t kMostReplaced = 8;

std::wstring nameOf(tzhost::Drawing const& drawing) {
    if (drawing.file().empty()) return localText(L"a drawing without a name");
    return tzhost::fromUtf8(drawing.file().string());
}

// A person typed a name that leads elsewhere than it may seem; a script is not told.
void tellPerson(wchar_t const* what, std::filesystem::path const& file) {
    tzhost::CommandLine& line = tzhost::commandLine();
    std::wstring const name = tzhost::fromUtf8(file.string());
    if (line.isPerson()) line.say(TzString::formatted(what, name.c_str()).str());
}

}  // namespace

ProgramSession::ProgramSession() {
    running = this;
}

ProgramSession::~ProgramSession() {
    if (drawing_) {
        tzhost::documents().close();
        tzhost::setWorkingDrawing(nullptr);
    }
    running = nullptr;
}

ProgramSession& ProgramSession::current() {
    return *running;
}

// Whole or not at all: without a document in the end no command could run.
void ProgramSession::replaceBy(std::unique_ptr<tzhost::Drawing> drawing,
                               std::function<void()> const& setVariables) {
    tzhost::MemoryFaultPause const isWhole;
    if (drawing_) {
        // What the command has done so far to the drawing that goes stays one step of its undo.
        if (isInCommand_) (void)drawing_->undoLog().end();
        tzhost::documents().close();
    }
    std::swap(drawing_, drawing);
    setVariables();  // before the drawing itself shows its style in them
    tzhost::setWorkingDrawing(drawing_.get());
    if (drawing) retired_.push_back(std::move(drawing));
    if (isInCommand_) drawing_->undoLog().begin(command_);
    tzhost::documents().open(drawing_.get());
}

void ProgramSession::replaceForUndo(std::unique_ptr<tzhost::Drawing> drawing,
                                    std::function<void()> const& setVariables) {
    bool const hadDrawing = drawing_ != nullptr;
    tzhost::Variables::Snapshot variables = tzhost::Variables::instance().snapshot();
    replaceBy(std::move(drawing), setVariables);
    if (!hadDrawing) return;
    replaced_.push_back({nullptr, std::move(variables), command_});
    replaced_.back().drawing = std::move(retired_.back());
    retired_.pop_back();
    replaced_.back().drawing->undoLog().forgetTakenBack();
    for (Replaced& each : std::exchange(takenBack_, {}))
        retired_.push_back(std::move(each.drawing));
}

void ProgramSession::makeNew() {
    replaceForUndo(tzhost::Drawing::create(), [] { tzhost::setKeptVariables({}); });
}

void ProgramSession::makeNew(std::filesystem::path const& file) {
    makeNew();
    drawing_->setFile(file);
}

bool ProgramSession::open(std::filesystem::path const& file, std::string& error) {
    tzhost::DrawingRead read = tzhost::readDrawing(file);
    if (!read.drawing) {
        error = read.error;
        return false;
    }
    for (std::string const& warning : read.warnings) {
        tzhost::commandLine().say(tzhost::fromUtf8(warning));
    }
    ownFiles_.note(file);
    replaceForUndo(std::move(read.drawing), [&] { tzhost::setKeptVariables(read.variables); });
    return true;
}

std::vector<std::wstring> ProgramSession::unsaved() const {
    std::vector<std::wstring> names;
    if (!drawing_->undoLog().isSaved()) names.push_back(nameOf(*drawing_));
    for (Replaced const& each : replaced_) {
        if (!each.drawing->undoLog().isSaved()) names.push_back(nameOf(*each.drawing));
    }
    return names;
}

std::wstring ProgramSession::unsavedToDrop() const {
    if (replaced_.size() < kMostReplaced) return {};
    tzhost::Drawing& oldest = *replaced_.front().drawing;
    return oldest.undoLog().isSaved() ? std::wstring() : nameOf(oldest);
}

std::optional<std::wstring> ProgramSession::pass(ReplacedDrawings& from, ReplacedDrawings& to) {
    if (from.empty()) return std::nullopt;
    tzhost::MemoryFaultPause const isWhole;
    to.push_back({nullptr, tzhost::Variables::instance().snapshot(), from.back().command});
    Replaced other = std::move(from.back());
    from.pop_back();
    replaceBy(std::move(other.drawing),
              [&] { tzhost::Variables::instance().restore(other.variables); });
    to.back().drawing = std::move(retired_.back());
    retired_.pop_back();
    return other.command;
}

std::optional<std::wstring> ProgramSession::undo() {
    std::wstring const name = drawing_->undoLog().nextBack();
    return drawing_->undoLog().takeBack() ? name : pass(replaced_, takenBack_);
}

std::optional<std::wstring> ProgramSession::redo() {
    std::wstring const name = drawing_->undoLog().nextAgain();
    return drawing_->undoLog().doAgain() ? name : pass(takenBack_, replaced_);
}

bool ProgramSession::save(std::filesystem::path const& file,
                          std::string& error,
                          tzhost::IfReadOnly ifReadOnly) {
    error = tzhost::writeDrawing(*drawing_, file, ifReadOnly);
    if (!error.empty()) return false;
    drawing_->setFile(file);
    drawing_->undoLog().noteSaved();
    ownFiles_.note(file);
    return true;
}

void ProgramSession::setPlotting(tzhost::PageChoice const& page, tzhost::PlotSpace space) {
    page_ = page;
    space_ = space;
}

bool ProgramSession::plot(std::filesystem::path const& file,
                          std::string& error,
                          std::vector<std::string>& remarks,
                          tzhost::IfReadOnly ifReadOnly) {
    TzString ending = TzString::fromUtf8(file.extension().string());
    ending.makeLower();
    auto const at = std::find_if(kPlotEndings.begin(), kPlotEndings.end(),
                                 [&](PlotEnding const& each) { return ending == each.ending; });
    if (at == kPlotEndings.end()) {
        error = file.string() + ": " + localText("a plot's name ends in .svg, .png or .pdf");
        return false;
    }
    return plotAs(at->format, file, error, remarks, ifReadOnly);
}

bool ProgramSession::plotAs(tzhost::PlotFormat format,
                            std::filesystem::path const& file,
                            std::string& error,
                            std::vector<std::string>& remarks,
                            tzhost::IfReadOnly ifReadOnly) {
    tzhost::PlotReport const report =
        tzhost::plotDrawing(*drawing_, {format, file.string(), page_, space_, ifReadOnly});
    remarks = report.remarks;
    if (report.problem) {
        error = *report.problem;
        return false;
    }
    // A person may look at the wrong space, or at one whose layers are off.
    if (report.isEmpty && tzhost::commandLine().isPerson())
        remarks.push_back(file.string() + ": " + localText("nothing is drawn there"));
    ownFiles_.note(file);
    return true;
}

TzString ProgramSession::moduleName() const {
    return TzString::fromUtf8(module_.filename().string());
}

std::filesystem::path ProgramSession::moduleCalled(std::filesystem::path const& name) const {
    std::error_code gone;  // of a working folder: the loader then says that nothing is there
    return name.has_parent_path() ? std::filesystem::absolute(name, gone)
                                  : module_.parent_path() / name;
}

void ProgramSession::loadLater(std::filesystem::path const& name) {
    postponed_.emplace_back([file = moduleCalled(name)] {
        std::string error;
        if (!tzhost::dynamicLinker().load(file, error))
            tzhost::commandLine().sayFailure(tzhost::fromUtf8(error));
        else
            tellPerson(localText(L"Loaded: %ls."), file);
    });
}

void ProgramSession::unloadLater() {
    postponed_.emplace_back([] {
        auto const& modules = tzhost::dynamicLinker().modules();
        std::string error = localText("No module is loaded.");
        std::filesystem::path const file = modules.empty() ? "" : modules.back()->file;
        if (modules.empty() || !tzhost::dynamicLinker().unload(file, error))
            tzhost::commandLine().sayProblem(tzhost::fromUtf8(error));
        else
            tellPerson(localText(L"Unloaded: %ls."), file);
    });
}

void ProgramSession::doPostponed() {
    for (auto const& action : std::exchange(postponed_, {}))
        action();
}

void ProgramSession::beginCommand(std::wstring name) {
    isInCommand_ = true;
    command_ = std::move(name);
    drawing_->undoLog().begin(command_);
}

void ProgramSession::endCommand() {
    if (drawing_->undoLog().end()) takenBack_.clear();
    retired_.clear();
    if (replaced_.size() > kMostReplaced) replaced_.pop_front();
    isInCommand_ = false;
}

}  // namespace tzdraft
