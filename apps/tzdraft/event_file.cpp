#include "apps/tzdraft/event_file.h"

#include "apps/tzdraft/program_texts.h"
#include "host/base/event_sink.h"

namespace tzdraft {
namespace {

constexpr std::size_t kBlock = 1 << 16;

std::string problemWith(std::filesystem::path const& name, tzhost::SafeFile const& file) {
    return name.string() + ": " + localText("the events cannot be written") + ": " + file.reason();
}

}  // namespace

bool EventFile::begin(std::filesystem::path const& file, std::string& error) {
    name_ = file;
    file_.emplace(file);
    if (!file_->isOpen()) {
        error = problemWith(name_, *file_);
        file_.reset();
        return false;
    }
    tzhost::setEventSink([this](tzhost::Event const& event) {
        // What is no UTF-8 is shown as such rather than lost.
        pending_ += event.dump(-1, ' ', false, tzhost::Event::error_handler_t::replace) + '\n';
        if (pending_.size() < kBlock) return;
        (void)file_->write(pending_);  // a failure makes finish fail
        pending_.clear();
    });
    return true;
}

bool EventFile::finish(std::string& error) {
    if (!file_) return true;
    tzhost::setEventSink({});
    bool const written = file_->write(pending_) && file_->commit();
    if (!written) error = problemWith(name_, *file_);
    file_.reset();
    return written;
}

EventFile::~EventFile() {
    if (file_) tzhost::setEventSink({});
}

}  // namespace tzdraft
