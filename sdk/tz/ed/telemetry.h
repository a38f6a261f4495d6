#pragma once

#include "tz/export.h"
#include "tz/text/string.h"

struct TzEdJigInputData;

// Reports on one run of a command. Numbers are the host's: `phase` 0 begin and 1 success, `value`
// what the command adds. Nothing leaves the machine; the host's event file shows them.
class TZ_API TzTelemetryCmdHelper {
public:
    // The part of the host and the command that each report names.
    TzTelemetryCmdHelper(int component, wchar_t const* name);

    // [command] `data` may be null.
    void SendEvent(int phase, int value, wchar_t const* data = nullptr) const;
    // [command] The first and the last point of the command, as its drags learned them.
    void set_start_point(TzEdJigInputData const& data);
    void set_end_point(TzEdJigInputData const& data);

private:
    int component_;
    TzString name_;
};
