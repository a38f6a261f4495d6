#pragma once

#include <deque>
#include <memory>
#include <vector>

#include "host/runtime/functions.h"
#include "tz/ap/document.h"
#include "tz/ap/gesture.h"
#include "tz/text/string.h"

class TzEdSSGetFilter;

namespace tzhost {

// Gestures of the one view of a document.
class GestureProcessor : public Tzworks::Tzdraft::TzApGesture::GestureProcessor {
public:
    using Handler = Tzworks::Tzdraft::TzApGesture::GestureOverruleHandler;
    bool addOverruleHandler(Handler* handler) override;
    bool removeOverruleHandler(Handler* handler) override;

private:
    std::vector<Handler*> handlers_;
};

class View : public Tzworks::Tzdraft::TzApView {
public:
    [[nodiscard]] GestureProcessor* gestureProcessor() override { return &gestures_; }

private:
    GestureProcessor gestures_;
};

// A selection filter with the flags that it was installed with; not owned.
struct InputFilter {
    TzEdSSGetFilter* filter = nullptr;
    int flags = 0;
};

// An open drawing. The database is made and owned by whoever opens the document.
class Document : public TzApDocument {
public:
    explicit Document(TzDbDatabase* database) : database_(database) {}
    [[nodiscard]] TzDbDatabase* database() const override { return database_; }
    [[nodiscard]] View* view() const override { return &view_; }

    FunctionTable functions;
    std::vector<InputFilter> filters;  // installed on its input
    std::deque<TzString> typed;        // texts that were sent to its command line

private:
    TzDbDatabase* database_;
    mutable View view_;
};

// The open drawings of this host: one at a time.
class Documents : public TzApDocManager {
public:
    [[nodiscard]] Document* curDocument() const override { return current_.get(); }
    [[nodiscard]] Document* current() const { return current_.get(); }
    void redraw() override;
    int sendStringToExecute(TzApDocument* document,
                            wchar_t const* text,
                            bool activate,
                            bool wrapUp,
                            bool echo) override;

    // Opens a document on a database, closing the one before; modules hear of both.
    void open(TzDbDatabase* database);
    // Closes it; modules hear of it while it is still there.
    void close();
    // Nothing of the document points into that module any more.
    void forgetModule(LoadedModule const& module);

private:
    std::unique_ptr<Document> current_;
};

[[nodiscard]] Documents& documents();

}  // namespace tzhost
