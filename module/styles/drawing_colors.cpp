#include "module/styles/drawing_colors.h"

#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/gi/color.h"
#include "tz/mte/easy_object.h"

namespace {

constexpr int kWhiteIndex = 7;

}  // namespace

unsigned int layerColor(TzDbObjectId layer) {
    EasyObject<TzDbLayerTableRecord> record;
    if (tzdbOpenObject(record.object, layer, TzDb::kForRead) != Tzad::eOk)
        return tzedGetRGB(kWhiteIndex);
    TzCmColor const color = record->color();
    return color.isByColor() ? color.getCOLORREF() : tzedGetRGB(color.colorIndex());
}

unsigned int GetCurrentDrawingByLayerColor() {
    TzDbDatabase const* const database = tzdbHostApplicationServices()->workingDatabase();
    return database ? layerColor(database->clayer()) : tzedGetRGB(kWhiteIndex);
}

unsigned int GetCurrentDrawingByBlockColor() {
    return tzedGetRGB(kWhiteIndex);
}
