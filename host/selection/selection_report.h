#pragma once

#include <string>
#include <string_view>

// What the user is told about an answer at a selection.
//
// A person is told what the set has come to. A script is told what it always was: whoever compares
// the transcripts of scripts must not find new numbers in them.
namespace tzhost {

// What an answer added.
struct Added {
    int fresh = 0;
    int alreadyThere = 0;
    int onLockedLayers = 0;  // left out for that
    int leftOut = 0;         // by filters
    int total = 0;           // in the set now
};

// "3 found", to a person "3 found (1 duplicate), 5 total".
[[nodiscard]] std::wstring reportOf(Added const& added);

struct Removed {
    int count = 0;
    int total = 0;  // in the set still
};

// "1 removed", to a person "1 removed, 4 total".
[[nodiscard]] std::wstring reportOf(Removed const& removed);

// That an answer selects nothing; to a person also which handle is wrong, or else what does.
[[nodiscard]] std::wstring refusedSelection(std::wstring_view answer);

}  // namespace tzhost
