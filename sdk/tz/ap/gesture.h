#pragma once

#include "tz/export.h"

// What gestures with the pointer do in a view. A command that drags installs a handler of its own
// for the length of the prompt.
namespace Tzworks::Tzdraft {

class TzApView;

namespace TzApGesture {

// Says what a gesture does instead of the view's own motion.
class TZ_API GestureOverruleHandler {
public:
    virtual ~GestureOverruleHandler() = default;
};

// Lets a press and drag give the two corners of a box.
class TZ_API DragGestureOverruleHandler : public GestureOverruleHandler {
public:
    explicit DragGestureOverruleHandler(TzApView* view);
    [[nodiscard]] TzApView* view() const { return view_; }

private:
    TzApView* view_;  // not owned
};

// The gestures of one view.
class TZ_API GestureProcessor {
public:
    virtual ~GestureProcessor() = default;
    // [command] Installs or removes a handler; the processor does not own it. Adding a handler that
    // is already installed gives false, and so does removing one that is not.
    virtual bool addOverruleHandler(GestureOverruleHandler* handler) = 0;
    virtual bool removeOverruleHandler(GestureOverruleHandler* handler) = 0;
};

}  // namespace TzApGesture

// What a document shows.
class TZ_API TzApView {
public:
    virtual ~TzApView() = default;
    // [any] Owned by the view, never null.
    [[nodiscard]] virtual TzApGesture::GestureProcessor* gestureProcessor() = 0;
};

}  // namespace Tzworks::Tzdraft
