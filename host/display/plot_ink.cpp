#include "host/display/plot_ink.h"

#include <algorithm>
#include <cmath>

#include "host/base/entity_drawing.h"
#include "host/display/record_access.h"
#include "tz/db/symbol_table.h"

namespace tzhost {
namespace {

constexpr unsigned int kWhite = 0xFFFFFF;
constexpr int kPageContrast = 7;
constexpr double kMillimetresPerWeight = 0.01;

// The colour itself, once "as the block" and "as the layer" are followed. Outside blocks, and on
// layers that say nothing better, that is the colour which stands out from the page.
TzCmEntityColor colorOf(DrawPen const& pen) {
    TzCmEntityColor const contrast = TzCmEntityColor::fromIndex(kPageContrast);
    bool const byBlock = pen.color.isByBlock();
    TzCmEntityColor const color = byBlock ? pen.blockColor : pen.color;
    if (color.isByBlock()) return contrast;
    if (!color.isByLayer()) return color;
    auto const* const layer = objectOf<TzDbLayerTableRecord>(byBlock ? pen.blockLayer : pen.layer);
    if (!layer) return contrast;
    TzCmEntityColor const ofLayer = layer->color();
    return ofLayer.isByLayer() || ofLayer.isByBlock() ? contrast : ofLayer;
}

}  // namespace

PlotColor inkOf(DrawPen const& pen, PlotKind kind) {
    bool const isPage = kind == PlotKind::fill && pen.fill == kFillPage;
    unsigned int rgb = isPage ? kWhite : colorOf(pen).getCOLORREF();
    if (rgb == kWhite && kind == PlotKind::stroke) rgb = 0;
    auto const part = [rgb](int shift) { return ((rgb >> shift) & 0xFF) / 255.0; };
    return {part(0), part(8), part(16), pen.transparency.alpha() / 255.0};
}

double lineWeightOf(DrawPen const& pen) {
    return std::max(pen.lineWeight, 0) * kMillimetresPerWeight;
}

std::vector<double> dashesOf(DrawPen const& pen) {
    std::vector<double> dashes;
    auto const* const linetype = objectOf<TzDbLinetypeTableRecord>(pen.linetype);
    for (int i = 0; linetype && i < linetype->numDashes(); ++i) {
        dashes.push_back(std::fabs(linetype->dashLengthAt(i)));
    }
    return dashes;
}

}  // namespace tzhost
