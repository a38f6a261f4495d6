#pragma once

// What the dialog editor can change of a text besides its words, by the names and in the values of
// the drawing file. A value is read first, and stored when nothing else is wrong.
//
//   DialogValue const* const row = findDialogValue(L"attachment");
//   if (DialogChange const change = row->read(state, L"5")) change(state);

#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tz/mte/editor_interface.h"

namespace tzhost {

using DialogChange = std::function<void(CMTextEditorInterface&)>;

struct DialogValue {
    wchar_t const* name;      // as files have it; questions show its local text
    wchar_t const* expected;  // what a value is, to be looked up among the local texts
    std::wstring (*shown)(CMTextEditorInterface const& state);
    // What stores the value that the text says; empty when the text says none.
    DialogChange (*read)(CMTextEditorInterface const& state, std::wstring_view text);
};

// In the order in which they are asked for.
[[nodiscard]] std::span<DialogValue const> dialogValues();
// Null for a name that no value has.
[[nodiscard]] DialogValue const* findDialogValue(std::wstring_view name);

// Changes that are stored all together, or not at all.
class DialogChanges {
public:
    [[nodiscard]] bool areNone() const { return changes_.empty(); }
    void add(DialogChange change) { changes_.push_back(std::move(change)); }
    void store(CMTextEditorInterface& state) const;

private:
    std::vector<DialogChange> changes_;
};

}  // namespace tzhost
