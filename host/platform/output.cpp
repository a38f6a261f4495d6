#include "host/platform/output.h"

#include <utility>

#include "host/base/event_sink.h"
#include "host/text/utf8.h"
#include "tz/ed/print.h"
#include "tz/pal/diagnostics.h"
#include "tz/pal/message_box.h"
#include "tz/rx/status.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {
PrintSink* printSink = nullptr;
DebugSink* debugSink = nullptr;
NotificationSink* notificationSink = nullptr;
}  // namespace

PrintSink* setPrintSink(PrintSink* sink) noexcept {
    return std::exchange(printSink, sink);
}

DebugSink* setDebugSink(DebugSink* sink) noexcept {
    return std::exchange(debugSink, sink);
}

NotificationSink* setNotificationSink(NotificationSink* sink) noexcept {
    return std::exchange(notificationSink, sink);
}

void print(std::wstring_view text) {
    if (printSink != nullptr) printSink->print(text);
}

void debug(std::wstring_view text) {
    reportEvent([&] { return Event{{"event", "debug"}, {"text", toUtf8(text)}}; });
    if (debugSink != nullptr) debugSink->debug(text);
}

void notify(Notification const& notification) {
    bool const isWarning = notification.kind == NotificationKind::warning;
    reportEvent([&] {
        return Event{{"event", isWarning ? "warning" : "messageBox"},
                     {"id", toUtf8(notification.id)},
                     {"text", toUtf8(notification.text)},
                     {"style", notification.style}};
    });
    if (notificationSink != nullptr) notificationSink->notify(notification);
}

}  // namespace tzhost

namespace {

std::wstring orEmpty(wchar_t const* text) {
    return text ? text : L"";
}

}  // namespace

int tzutPrintf(wchar_t const* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    std::wstring const text = tzFormatV(format, arguments);
    va_end(arguments);
    tzhost::print(text);
    return Tzad::ePromptNormal;
}

int tzedTextScr() {
    if (tzhost::printSink != nullptr) tzhost::printSink->showTextScreen();
    return Tzad::ePromptNormal;
}

int MessageBox(void*, wchar_t const* text, wchar_t const* caption, unsigned style) {
    constexpr int kSeen = 1;
    tzhost::notify({.id = {}, .text = orEmpty(text), .caption = orEmpty(caption), .style = style});
    return kSeen;
}

int TwHostMessageBox::simple(wchar_t const* text, unsigned style) {
    return MessageBox(nullptr, text, nullptr, style);
}

void OutputDebugString(wchar_t const* text) {
    tzhost::debug(orEmpty(text));
}

void Tzworks::Tzdraft::PAL::Diagnostics::outputDebugString(wchar_t const* text) {
    OutputDebugString(text);
}
