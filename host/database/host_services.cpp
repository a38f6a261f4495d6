#include "tz/db/host_services.h"

#include "host/base/event_sink.h"
#include "host/base/settings.h"
#include "host/database/drawing.h"
#include "host/database/user_system.h"

namespace tzhost {
namespace {

Drawing* theWorkingDrawing = nullptr;

void notify(char const* name) {
    reportEvent([&] {
        return Event{
            {"event", "notify"},
            {"name",  name    }
        };
    });
}

class Services final : public TzDbHostApplicationServices {
public:
    [[nodiscard]] TzDbDatabase* workingDatabase() const override { return theWorkingDrawing; }
    [[nodiscard]] TzDbWorkingGlobals* workingGlobals() const override { return theWorkingDrawing; }
    void textEditorStarting() override { notify("textEditorStarting"); }
    [[nodiscard]] TzString getProductRegistryKey() const override { return settings().productKey; }
};

class DefaultGlobals final : public TzDbWorkingGlobals {
public:
    [[nodiscard]] bool hasWorkingSet() const override { return false; }
    [[nodiscard]] bool isWorkingSetActive() const override { return false; }
    [[nodiscard]] double workingAngle() const override { return 0.0; }
};

}  // namespace

Drawing* workingDrawing() {
    return theWorkingDrawing;
}

void setWorkingDrawing(Drawing* drawing) {
    theWorkingDrawing = drawing;
    if (!drawing) return;
    drawing->setSettings(drawing->settings());  // TEXTSTYLE shows this drawing's style
    watchUserSystem();
    noteUserSystem();
}

}  // namespace tzhost

TzDbHostApplicationServices* tzdbHostApplicationServices() {
    static tzhost::Services services;
    return &services;
}

TzDbWorkingGlobals* tzdbDefaultWorkingGlobals() {
    static tzhost::DefaultGlobals globals;
    return &globals;
}
