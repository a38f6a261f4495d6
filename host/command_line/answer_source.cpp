#include "host/command_line/answer_source.h"

#include <array>

namespace tzhost {

namespace {

// In the order of QuestionKind.
constexpr std::array kNames{
    "command", "keyword",     "string",   "symbol",    "point",  "real", "integer",
    "angle",   "orientation", "distance", "selection", "entity", "drag",
};
static_assert(kNames.size() == static_cast<std::size_t>(QuestionKind::drag) + 1);

}  // namespace

char const* nameOf(QuestionKind kind) {
    return kNames[static_cast<std::size_t>(kind)];
}

}  // namespace tzhost
