#pragma once

#include "tz/ed/telemetry.h"

// Reports one run of a command that edits texts: that it began, and that it changed them.
class EditReport {
public:
    explicit EditReport(wchar_t const* command) : telemetry_(kComponent, command) {}

    void begin() const { telemetry_.SendEvent(kBegin, 0); }
    void success() const { telemetry_.SendEvent(kSuccess, kEdited); }

private:
    static constexpr int kComponent = 0;
    static constexpr int kBegin = 0;
    static constexpr int kSuccess = 1;
    static constexpr int kEdited = 128;

    TzTelemetryCmdHelper telemetry_;
};
