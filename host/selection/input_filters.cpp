#include "host/selection/input_filters.h"

#include <algorithm>
#include <functional>

#include "host/base/audit.h"
#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "host/runtime/documents.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

// Marks entries of an array and takes them all out at the end, so that indices stay as they were.
class Remover : public TzEdSelectionSetService {
public:
    explicit Remover(int length) : isRemoved_(static_cast<std::size_t>(length)) {}

    int remove(int index) override {
        if (auto const fault = faultAt("TzEdSelectionSetService::remove", Tzad::eInvalidIndex)) {
            return *fault;
        }
        return mark(index);
    }
    int remove(TzArray<int> const& indices) override {
        if (auto const fault = faultAt("TzEdSelectionSetService::remove", Tzad::eInvalidIndex)) {
            return *fault;
        }
        int status = Tzad::eOk;
        for (int const index : indices) {
            if (int const each = mark(index); each != Tzad::eOk) status = each;
        }
        return status;
    }
    void apply(EntityIds& ids) const {
        int kept = 0;
        for (int i = 0; i < ids.length(); ++i) {
            if (!isRemoved_[static_cast<std::size_t>(i)]) ids[kept++] = ids[i];
        }
        ids.setLogicalLength(kept);
    }

private:
    int mark(int index) {
        if (index < 0 || static_cast<std::size_t>(index) >= isRemoved_.size()) {
            return Tzad::eInvalidIndex;
        }
        isRemoved_[static_cast<std::size_t>(index)] = true;
        return Tzad::eOk;
    }

    std::vector<bool> isRemoved_;
};

using Filters = std::vector<InputFilter>;

Filters::iterator findFilter(Filters& filters, TzEdSSGetFilter const* filter) {
    return std::find_if(filters.begin(), filters.end(),
                        [filter](InputFilter const& each) { return each.filter == filter; });
}

using Hook = std::function<void(InputFilter const&, TzEdSelectionSetService&)>;

void runFilters(int wanted, EntityIds& ids, Hook const& hook) {
    Document* const document = documents().current();
    if (document == nullptr) return;
    Filters const installed = document->filters;  // hooks may change it
    for (InputFilter const& each : installed) {
        bool const isThere = findFilter(document->filters, each.filter) != document->filters.end();
        if (!isThere || (each.flags & wanted) == 0) continue;
        Remover remover(ids.length());
        hook(each, remover);
        remover.apply(ids);
    }
}

void reportFilter(char const* action, int flags) {
    reportEvent([&] { return Event{{"event", "filter"}, {"action", action}, {"flags", flags}}; });
}

// Only a document that is open has input.
Document* asOpen(TzApDocument* document) {
    Document* const open = documents().current();
    return document != nullptr && document == open ? open : nullptr;
}

}  // namespace

void filterAdded(EntityIds const& set, EntityIds& ids) {
    runFilters(kAsksAboutAdding, ids, [&](InputFilter const& each, auto& remover) {
        each.filter->ssgetAddFilter(each.flags, remover, set, ids);
    });
}

void filterRemoved(EntityIds const& set, EntityIds& ids) {
    runFilters(kAsksAboutRemoving, ids, [&](InputFilter const& each, auto& remover) {
        each.filter->ssgetRemoveFilter(each.flags, remover, set, ids);
    });
}

void filterAtEnd(int status, EntityIds& set) {
    runFilters(kAsksAboutTheEnd, set, [&](InputFilter const& each, auto& remover) {
        each.filter->endSSGet(status, each.flags, remover, set);
    });
}

}  // namespace tzhost

void TzEdSSGetFilter::ssgetAddFilter(int,
                                     TzEdSelectionSetService&,
                                     TzArray<TzDbObjectId> const&,
                                     TzArray<TzDbObjectId> const&) {}

void TzEdSSGetFilter::ssgetRemoveFilter(int,
                                        TzEdSelectionSetService&,
                                        TzArray<TzDbObjectId> const&,
                                        TzArray<TzDbObjectId> const&) {}

void TzEdSSGetFilter::endSSGet(int, int, TzEdSelectionSetService&, TzArray<TzDbObjectId> const&) {}

bool addSSgetFilterInputContextReactor(TzApDocument* document, TzEdSSGetFilter* filter, int flags) {
    if (tzhost::faultAt("addSSgetFilterInputContextReactor")) return false;
    tzhost::Document* const open = tzhost::asOpen(document);
    if (open == nullptr || filter == nullptr) return false;
    if (tzhost::findFilter(open->filters, filter) != open->filters.end()) return false;
    // All that may lack memory comes first, so that a filter is either there or not.
    open->filters.reserve(open->filters.size() + 1);
    tzhost::reportFilter("add", flags);
    open->filters.push_back({filter, flags});
    ++tzhost::audit().filters;
    return true;
}

// Takes the filter back even when the plan makes it report a failure; destructors call it.
bool removeSSgetFilterInputContextReactor(TzApDocument* document, TzEdSSGetFilter* filter) {
    tzhost::MemoryFaultPause const givesBack;
    bool const isFaulty = tzhost::faultAt("removeSSgetFilterInputContextReactor").has_value();
    tzhost::Document* const open = tzhost::asOpen(document);
    if (open == nullptr) return false;
    auto const at = tzhost::findFilter(open->filters, filter);
    if (at == open->filters.end()) return false;
    int const flags = at->flags;
    open->filters.erase(at);
    --tzhost::audit().filters;
    tzhost::reportFilter("remove", flags);
    return !isFaulty;
}
