#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tz/db/object_id.h"

struct resbuf;

// The conditions of a filter list, all of which an entity must meet. Codes 0 and 5020 name the kind
// of the entity, 8 its layer, 7 its text style; names may be patterns, without regard to case.
namespace tzhost {

class ListFilter {
public:
    // Null is a list without conditions. Nothing for a list with another code.
    [[nodiscard]] static std::optional<ListFilter> read(resbuf const* list);
    // Opens nothing.
    [[nodiscard]] bool lets(TzDbObjectId id) const;

private:
    struct Condition {
        int code;
        std::wstring pattern;
    };
    std::vector<Condition> conditions_;
};

}  // namespace tzhost
