#pragma once

#include <filesystem>

// Questions that keep a person from losing work. Each says what would be lost and returns whether
// to go on; Enter and Ctrl-C stay. A script means what it says, so that nothing asks there.
namespace tzdraft {

// Whether the session may end. The file of --save is written for that; only when this fails is
// there anything to ask.
[[nodiscard]] bool mayLeave();
// Whether another drawing may take the place of the open one. Only the oldest one that U could
// bring back is lost by that, if there are as many as are kept.
[[nodiscard]] bool mayReplace();
// Whether a file may be written over: it is not there yet, this session was the last to write to it
// or has opened it since and it is not read-only, or the person says so.
[[nodiscard]] bool mayOverwrite(std::filesystem::path const& file);

}  // namespace tzdraft
