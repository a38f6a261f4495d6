#pragma once

#include "tz/ed/selection.h"
#include "tz/rx/status.h"

namespace tzdraft {

// A selection set, freed at the end, also when nothing was selected.
class SelectionSet {
public:
    SelectionSet() = default;
    SelectionSet(SelectionSet const&) = delete;
    SelectionSet& operator=(SelectionSet const&) = delete;
    ~SelectionSet() { (void)tzedSSFree(name_); }

    // As tzedSSGet of that mode; true when it holds something.
    [[nodiscard]] bool select(wchar_t const* mode) {
        (void)tzedSSFree(name_);
        return tzedSSGet(mode, nullptr, nullptr, nullptr, name_) == Tzad::ePromptNormal;
    }
    [[nodiscard]] long long const* name() const { return name_; }

private:
    long long name_[2] = {0, 0};
};

}  // namespace tzdraft
