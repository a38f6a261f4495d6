#include "apps/tzdraft/session.h"

#include <algorithm>
#include <array>

#include "host/base/utf8.h"
#include "host/command_line/command_line.h"
#include "host/database/user_system.h"
#include "host/display/plot.h"
#include "host/drawing_file/drawing_file.h"
#include "host/runtime/documents.h"

namespace tzdraft {
namespace {

Session* running = nullptr;

struct PlotEnding {
    char const* ending;
    tzhost::PlotFormat format;
};
constexpr std::array kPlotEndings{
    PlotEnding{".svg", tzhost::PlotFormat::svg},
    PlotEnding{".png", tzhost::PlotFormat::png},
    PlotEnding{".pdf", tzhost::PlotFormat::pdf},
};

}  // namespace

Session::Session() {
    running = this;
}

Session::~Session() {
    if (drawing_) {
        tzhost::documents().close();
        tzhost::setWorkingDrawing(nullptr);
    }
    running = nullptr;
}

Session& Session::current() {
    return *running;
}

void Session::replaceBy(std::unique_ptr<tzhost::Drawing> drawing) {
    if (drawing_) tzhost::documents().close();
    if (isInCommand_) drawing->undoLog().begin();
    std::swap(drawing_, drawing);
    // The command that replaced a drawing may still hold something of it.
    if (drawing) retired_.push_back(std::move(drawing));
    tzhost::setWorkingDrawing(drawing_.get());
    tzhost::noteUserSystem();
    tzhost::documents().open(drawing_.get());
}

void Session::makeNew() {
    tzhost::setKeptVariables({});
    replaceBy(tzhost::Drawing::create());
}

bool Session::open(std::filesystem::path const& file, std::string& error) {
    tzhost::DrawingRead read = tzhost::readDrawing(file);
    if (!read.drawing) {
        error = read.error;
        return false;
    }
    for (std::string const& warning : read.warnings) {
        tzhost::commandLine().say(tzhost::fromUtf8(warning));
    }
    tzhost::setKeptVariables(read.variables);
    replaceBy(std::move(read.drawing));
    return true;
}

bool Session::save(std::filesystem::path const& file, std::string& error) {
    error = tzhost::writeDrawing(*drawing_, file);
    if (error.empty()) drawing_->setFile(file);
    return error.empty();
}

bool Session::plot(std::filesystem::path const& file, std::string& error) const {
    auto const at =
        std::find_if(kPlotEndings.begin(), kPlotEndings.end(),
                     [&](PlotEnding const& each) { return file.extension() == each.ending; });
    if (at == kPlotEndings.end()) {
        error = file.string() + ": a plot's name ends in .svg, .png or .pdf";
        return false;
    }
    return plotAs(at->format, file, error);
}

bool Session::plotAs(tzhost::PlotFormat format,
                     std::filesystem::path const& file,
                     std::string& error) const {
    auto const problem = tzhost::plotDrawing(*drawing_, format, file.string());
    if (problem) error = *problem;
    return !problem;
}

void Session::beginCommand() {
    isInCommand_ = true;
    drawing_->undoLog().begin();
}

void Session::endCommand() {
    drawing_->undoLog().end();
    retired_.clear();
    isInCommand_ = false;
}

}  // namespace tzdraft
