#include "tz/ed/telemetry.h"

#include "host/base/event_sink.h"
#include "tz/ed/jig.h"

namespace {

// A drag that learned no point has none to report.
void reportPoint(int component,
                 TzString const& name,
                 char const* which,
                 TzEdJigInputData const& data) {
    if (!data.hasPoint) return;
    TzGePoint3d const& point = data.point;
    tzhost::reportEvent([&] {
        return tzhost::Event{{"event", "telemetryPoint"},
                             {"component", component},
                             {"name", tzhost::utf8(name)},
                             {"which", which},
                             {"point", tzhost::Event::array({point.x, point.y, point.z})}};
    });
}

}  // namespace

TzTelemetryCmdHelper::TzTelemetryCmdHelper(int component, wchar_t const* name)
    : component_(component), name_(name) {}

void TzTelemetryCmdHelper::SendEvent(int phase, int value, wchar_t const* /*data*/) const {
    tzhost::reportEvent([&] {
        return tzhost::Event{{"event", "telemetry"},
                             {"component", component_},
                             {"name", tzhost::utf8(name_)},
                             {"phase", phase},
                             {"value", value}};
    });
}

void TzTelemetryCmdHelper::set_start_point(TzEdJigInputData const& data) {
    reportPoint(component_, name_, "start", data);
}

void TzTelemetryCmdHelper::set_end_point(TzEdJigInputData const& data) {
    reportPoint(component_, name_, "end", data);
}
