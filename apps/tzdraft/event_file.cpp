#include "apps/tzdraft/event_file.h"

#include <system_error>

#include "apps/tzdraft/local_text.h"
#include "host/base/event_sink.h"

namespace tzdraft {

bool EventFile::begin(std::filesystem::path const& file, std::string& error) {
    file_ = file;
    part_ = file.string() + ".part";
    out_.open(part_, std::ios::binary | std::ios::trunc);
    if (!out_) {
        error = file.string() + ": " + localText("the events cannot be written");
        part_.clear();
        return false;
    }
    tzhost::setEventSink([this](tzhost::Event const& event) {
        // What is no UTF-8 is shown as such rather than lost.
        out_ << event.dump(-1, ' ', false, tzhost::Event::error_handler_t::replace) << '\n';
    });
    return true;
}

bool EventFile::finish(std::string& error) {
    if (part_.empty()) return true;
    tzhost::setEventSink({});
    out_.close();
    std::error_code problem;
    if (out_) std::filesystem::rename(part_, file_, problem);
    bool const written = out_ && !problem;
    if (written) {
        part_.clear();
    } else {
        error = file_.string() + ": " + localText("the events cannot be written");
    }
    return written;
}

EventFile::~EventFile() {
    if (part_.empty()) return;
    tzhost::setEventSink({});
    out_.close();
    std::error_code ignored;  // nothing more can be done about a file that will not go
    std::filesystem::remove(part_, ignored);
}

}  // namespace tzdraft
