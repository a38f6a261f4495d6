#include "module/uncalled/drawing_colors.h"

#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/gi/color.h"
#include "tz/mte/easy_object.h"

namespace {

constexpr int kWhiteIndex = 7;

}  // namespace

unsigned int GetCurrentDrawingByLayerColor() {
    TzDbDatabase const* const database = tzdbHostApplicationServices()->workingDatabase();
    EasyObject<TzDbLayerTableRecord> layer;
    if (!database || tzdbOpenObject(layer.object, database->clayer(), TzDb::kForRead) != Tzad::eOk)
        return tzedGetRGB(kWhiteIndex);
    TzCmColor const color = layer->color();
    return color.isByColor() ? color.getCOLORREF() : tzedGetRGB(color.colorIndex());
}

unsigned int GetCurrentDrawingByBlockColor() {
    return tzedGetRGB(kWhiteIndex);
}
