#include "tz/db/host_services.h"

#include "host/database/drawing.h"
#include "host/database/user_system.h"
#include "host/runtime/notification.h"
#include "host/settings/settings.h"

namespace tzhost {
namespace {

Drawing* theWorkingDrawing = nullptr;

class Services final : public TzDbHostApplicationServices {
public:
    [[nodiscard]] TzDbDatabase* workingDatabase() const override { return theWorkingDrawing; }
    [[nodiscard]] TzDbWorkingGlobals* workingGlobals() const override { return theWorkingDrawing; }
    void textEditorStarting() override { reportNotification("textEditorStarting"); }
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
