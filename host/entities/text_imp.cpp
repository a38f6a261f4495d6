#include "host/entities/text_imp.h"

#include <algorithm>

#include "host/database/exact_values.h"
#include "host/database/geometry.h"
#include "host/database/symbol_imp.h"
#include "host/entities/justification.h"
#include "host/entities/mtext_imp.h"
#include "host/entities/style_look.h"
#include "host/layout/line_layout.h"

namespace tzhost {

std::unique_ptr<TzDbObjectImp> TextImp::copy() const {
    return std::make_unique<TextImp>(*this);
}

bool TextImp::isSameAs(TzDbObjectImp const& other) const {
    return TextStyledImp::isSameAs(other) &&
           agree(*this, static_cast<TextImp const&>(other), &TextImp::text,
                 &TextImp::alignmentPoint, &TextImp::justification, &TextImp::normal,
                 &TextImp::rotation, &TextImp::height, &TextImp::widthFactor, &TextImp::oblique);
}

bool TextImp::showFieldText(std::wstring const& shown) {
    text = shown;
    forgetComputed();
    return true;
}

LineLayout TextImp::layout() const {
    LineLayoutInput input;
    input.text = decodeLineText(shownText());
    input.textHeight = height;
    input.style = lookOfStyle(style);
    input.style.widthFactor = widthFactor;
    input.style.oblique = oblique;
    return layOutLine(input);
}

TzGePoint3d TextImp::position() const {
    if (justification == TzDbText::kLeft || !isOneLine()) return alignmentPoint;
    LayoutPoint const anchor = anchorOf(box(), lookOfStyle(style), justification);
    TzGeVector3d const along = directionAt(normal, rotation);
    TzGePoint3d const start =
        alignmentPoint - along * anchor.x - normal.crossProduct(along) * anchor.y;
    return isFinite(start) ? start : alignmentPoint;  // of a text larger than numbers are
}

LayoutBox TextImp::box() const {
    if (looks_ != looksGeneration()) {
        box_ = layout().box;
        looks_ = looksGeneration();
    }
    return box_;
}

std::unique_ptr<TzDbObjectImp> AttributeImp::copy() const {
    return std::make_unique<AttributeImp>(*this);
}

bool AttributeImp::isSameAs(TzDbObjectImp const& other) const {
    return TextImp::isSameAs(other) &&
           agree(*this, static_cast<AttributeImp const&>(other), &AttributeImp::tag);
}

DefinitionImp::DefinitionImp(DefinitionImp const& other)
    : TextImp(other), tag(other.tag), prompt(other.prompt) {
    if (!other.lines) return;
    lines = std::make_unique<TzDbMText>();
    TzDbObjectAccess::exchange(*lines, TzDbObjectAccess::imp(*other.lines)->copy());
}

DefinitionImp::~DefinitionImp() = default;

std::unique_ptr<TzDbObjectImp> DefinitionImp::copy() const {
    return std::make_unique<DefinitionImp>(*this);
}

bool DefinitionImp::isSameAs(TzDbObjectImp const& other) const {
    auto const& same = static_cast<DefinitionImp const&>(other);
    if (!TextImp::isSameAs(other)) return false;
    if (!agree(*this, same, &DefinitionImp::tag, &DefinitionImp::prompt)) return false;
    if (!lines || !same.lines) return lines == same.lines;
    return TzDbObjectAccess::imp(*lines)->isSameAs(*TzDbObjectAccess::imp(*same.lines));
}

void DefinitionImp::settle(TzDbObject& object) {
    if (lines) TzDbObjectAccess::imp(*lines)->embedder = &object;
}

bool DefinitionImp::refersTo(TzDbObjectRecord const* named) const {
    return TextImp::refersTo(named) || (lines && TzDbObjectAccess::imp(*lines)->refersTo(named));
}

// Of a multi-line definition, the box around its lines.
LayoutBox DefinitionImp::box() const {
    if (!lines) return TextImp::box();
    TzArray<TzGePoint3d> corners;
    lines->getBoundingPoints(corners);
    TzGeVector3d const along = directionAt(normal, rotation);
    TzGeVector3d const up = normal.crossProduct(along);
    LayoutBox box;
    for (int i = 0; i < corners.length(); ++i) {
        TzGeVector3d const offset = corners[i] - alignmentPoint;
        double const x = offset.dotProduct(along);
        double const y = offset.dotProduct(up);
        if (i == 0) box = {x, y, x, y};
        box = {std::min(box.left, x), std::min(box.bottom, y), std::max(box.right, x),
               std::max(box.top, y)};
    }
    return box;
}

}  // namespace tzhost
