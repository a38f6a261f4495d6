#pragma once

#include <functional>
#include <string>
#include <vector>

#include "host/display/plot_sheet.h"

// The glyphs of letters as both kinds of documents write them.
namespace tzhost {

// Glyphs of one font, size and direction of reading.
using AlikeGlyphs = std::vector<PlotGlyph>;

// What the glyphs stand for that the page shows, in the order of reading.
[[nodiscard]] std::string wordsOf(PlotShape const& letters, PlotSheet const& sheet);

// Hands over the glyphs that the page shows, those alike that follow each other together.
// `separates` is asked for each and parts those that differ in the answer.
void eachAlike(PlotShape const& letters,
               PlotSheet const& sheet,
               std::function<bool(PlotGlyph const&)> const& separates,
               std::function<void(AlikeGlyphs const&)> const& take);

}  // namespace tzhost
