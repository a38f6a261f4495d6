#pragma once

#include <set>
#include <string>

#include "host/selection/entity_list.h"
#include "host/selection/list_filter.h"
#include "host/selection/selection_mode.h"

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

    // Adds what is new, or takes out what is there. What the user is told about it: "2 found".
    std::wstring add(EntityIds const& ids);
    std::wstring remove(EntityIds const& ids);
    // Ends the selection: 5100 when something is selected, else -5001, or the status of a cancel or
    // a keyword, which leaves nothing selected.
    [[nodiscard]] int finish(int status);
    [[nodiscard]] EntityIds const& entities() const { return entities_; }

private:
    SelectionMode mode_;
    ListFilter filter_;
    EntityIds entities_;              // in the order in which they were added
    std::set<TzDbObjectId> members_;  // the same
};

}  // namespace tzhost
