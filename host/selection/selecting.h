#pragma once

#include <unordered_set>

#include "host/selection/entity_list.h"
#include "host/selection/list_filter.h"
#include "host/selection/selection_mode.h"
#include "host/selection/selection_report.h"

// A selection while it is being made: what was added so far, by the rules of its mode and filters.
//
//   Selecting selecting(mode, filter);
//   selecting.add(ids);
//   int status = selecting.finish(Tzad::ePromptNormal);   // filters have their last word
//   nameNewSet(selecting.entities(), name);
namespace tzhost {

class Selecting {
public:
    Selecting(SelectionMode mode, ListFilter filter);

    // Adds what is new, or takes out what is there, of ids that each stand there once.
    Added add(EntityIds const& ids);
    Removed remove(EntityIds const& ids);
    // Ends the selection: 5100 when something is selected, else -5001, or the status of a cancel or
    // a keyword, which leaves nothing selected.
    [[nodiscard]] int finish(int status);
    [[nodiscard]] EntityIds const& entities() const { return entities_; }

private:
    using Records = std::unordered_set<TzDbObjectRecord const*>;

    // The members as a set, which the first answer does without.
    [[nodiscard]] Records& members();

    SelectionMode mode_;
    ListFilter filter_;
    EntityIds entities_;  // in the order in which they were added
    Records members_;     // the first `indexed_` of them
    int indexed_ = 0;
};

}  // namespace tzhost
