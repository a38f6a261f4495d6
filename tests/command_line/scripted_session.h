#pragma once

// One session at the command line: a script, the transcript of what was asked and answered, the
// events.

#include <string>
#include <string_view>

#include "host/base/event_sink.h"
#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "host/settings/variables.h"

namespace tzhost::test {

class ScriptedSession {
public:
    explicit ScriptedSession(std::string_view script) : source_(script) {
        Variables::instance().resetKept(KeptIn::drawing);
        commandLine().reset();
        commandLine().attach();
        commandLine().setSource(&source_);
        commandLine().setScreen([this](Shown kind, std::wstring_view text) {
            (kind == Shown::error ? errors_ : transcript_) += text;
        });
        setEventSink([this](Event const& event) { events_ += event.dump() + "\n"; });
    }
    ScriptedSession(ScriptedSession const&) = delete;
    ScriptedSession& operator=(ScriptedSession const&) = delete;
    ~ScriptedSession() {
        setEventSink({});
        commandLine().reset();
    }

    [[nodiscard]] std::wstring const& transcript() const { return transcript_; }
    [[nodiscard]] std::wstring const& errors() const { return errors_; }
    [[nodiscard]] std::string const& events() const { return events_; }

private:
    ScriptSource source_;
    std::wstring transcript_;
    std::wstring errors_;
    std::string events_;
};

}  // namespace tzhost::test
