#include "mark_preview.h"

#include "tz/gi/draw.h"
#include "tz/gi/text_style.h"
#include "tz/rx/class.h"

namespace marks {
namespace {

constexpr wchar_t const* kClassName = L"SheetMarkPreview";
constexpr int kYellow = 2;

TzRxObject* makePreview() {
    return new MarkPreview;
}

}  // namespace

TzRxClass* MarkPreview::descriptor_ = nullptr;

bool Mark::hasLine() const {
    return target.distanceTo(centre) > radius;
}

TzGePoint3d Mark::lineStart() const {
    return hasLine() ? centre + (target - centre).normal() * radius : centre;
}

void MarkPreview::registerClass() {
    descriptor_ = newTzRxClass(kClassName, L"TzDbEntity", 0, makePreview, nullptr, nullptr);
}

void MarkPreview::unregisterClass() {
    deleteTzRxClass(descriptor_);
    descriptor_ = nullptr;
}

TzRxClass* MarkPreview::isA() const {
    return descriptor_;
}

bool MarkPreview::subWorldDraw(TzGiWorldDraw* draw) {
    draw->subEntityTraits().setColor(kYellow);
    TzGiGeometry& geometry = draw->geometry();
    geometry.circle(mark.centre, mark.radius, mark.normal);
    if (mark.hasLine()) {
        TzGePoint3d const line[] = {mark.lineStart(), mark.target};
        geometry.polyline(2, line);
    }
    TzGiTextStyle style;
    style.setFileName(L"txt.shx");
    style.setTextSize(mark.radius);
    TzGePoint2d const size = style.extents(mark.number, false, -1, true, draw);
    TzGeVector3d const up = mark.normal.crossProduct(mark.direction);
    TzGePoint3d const corner = mark.centre - mark.direction * (size.x / 2) - up * (size.y / 2);
    geometry.text(corner, mark.normal, mark.direction, mark.number, -1, true, style);
    return true;
}

}  // namespace marks
