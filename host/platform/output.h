#pragma once

// Where the texts of the host and its modules go. Each kind has one receiver, which whoever drives
// the host installs; without one the texts are dropped. Receivers are not owned and are taken out,
// by installing null, before they end.
//
//   class Screen : public tzhost::PrintSink { void print(std::wstring_view text) override; ... };
//   Screen screen;
//   tzhost::setPrintSink(&screen);

#include <string>
#include <string_view>

namespace tzhost {

// Receives what is printed at the command line, in pieces, line ends included.
class PrintSink {
public:
    virtual ~PrintSink() = default;
    virtual void print(std::wstring_view text) = 0;
    // Shows the user the text screen; does nothing where there is only one screen.
    virtual void showTextScreen() {}
};

// Receives texts for developers.
class DebugSink {
public:
    virtual ~DebugSink() = default;
    virtual void debug(std::wstring_view text) = 0;
};

enum class NotificationKind { messageBox, warning };

// A message that waits for the user. Warnings have an id by which a user may silence them, message
// boxes have a caption and a style of icons and buttons.
struct Notification {
    NotificationKind kind = NotificationKind::messageBox;
    std::wstring id;
    std::wstring text;
    std::wstring caption;
    unsigned style = 0;
    bool printed = false;  // the text also goes to the command line
};

class NotificationSink {
public:
    virtual ~NotificationSink() = default;
    virtual void notify(Notification const& notification) = 0;
};

// Each returns the receiver that was there before.
PrintSink* setPrintSink(PrintSink* sink) noexcept;
DebugSink* setDebugSink(DebugSink* sink) noexcept;
NotificationSink* setNotificationSink(NotificationSink* sink) noexcept;

// Hands a text to the receiver of its kind. Texts for developers and messages are reported as
// events too, whether or not there is a receiver.
void print(std::wstring_view text);
void debug(std::wstring_view text);
void notify(Notification const& notification);

}  // namespace tzhost
