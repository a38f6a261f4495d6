#include "host/runtime/documents.h"

#include <algorithm>

#include "host/base/audit.h"
#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "host/runtime/module_linker.h"
#include "host/runtime/notification.h"
#include "tz/rx/status.h"

namespace tzhost {

bool GestureProcessor::addOverruleHandler(Handler* handler) {
    if (faultAt("GestureProcessor::addOverruleHandler")) return false;
    if (!handler || std::find(handlers_.begin(), handlers_.end(), handler) != handlers_.end())
        return false;
    handlers_.push_back(handler);
    ++audit().gestureHandlers;
    return true;
}

bool GestureProcessor::removeOverruleHandler(Handler* handler) {
    tzhost::MemoryFaultPause const givesBack;
    bool const removed = std::erase(handlers_, handler) > 0;
    if (removed) --audit().gestureHandlers;
    return removed && !faultAt("GestureProcessor::removeOverruleHandler");
}

void Documents::redraw() {
    reportNotification("redraw");
}

int Documents::sendStringToExecute(TzApDocument* document,
                                   wchar_t const* text,
                                   bool /*activate*/,
                                   bool /*wrapUp*/,
                                   bool /*echo*/) {
    if (auto const fault = faultAt("TzApDocManager::sendStringToExecute", Tzad::eNoDocument))
        return *fault;
    if (!document || document != current_.get()) return Tzad::eNoDocument;
    current_->typed.emplace_back(text);
    return Tzad::eOk;
}

void Documents::open(TzDbDatabase* database) {
    close();
    current_ = std::make_unique<Document>(database);
    dynamicLinker().broadcast(TzRx::kLoadDwgMsg);
}

void Documents::close() {
    if (!current_) return;
    dynamicLinker().broadcast(TzRx::kUnloadDwgMsg);
    current_.reset();
}

void Documents::forgetModule(LoadedModule const& module) {
    if (current_) current_->functions.forgetModule(module);
}

Documents& documents() {
    static Documents all;
    return all;
}

}  // namespace tzhost

TzApDocManager* tzDocManagerPtr() {
    return &tzhost::documents();
}

namespace Tzworks::Tzdraft::TzApGesture {
DragGestureOverruleHandler::DragGestureOverruleHandler(TzApView* view) : view_(view) {}
}  // namespace Tzworks::Tzdraft::TzApGesture
