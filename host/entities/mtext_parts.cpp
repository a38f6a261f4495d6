
#include "host/database/geometry.h"
#include "host/entities/mtext_imp.h"
#include "tz/db/mtext.h"

using tzhost::beginChange;
using tzhost::faultStatus;
using tzhost::MTextBackground;
using tzhost::MTextImp;
using tzhost::valuesOf;

// Columns and background of a multi-line text.
namespace {

constexpr int kMostColumns = 1000;

TextEditorColumns const& columnsOf(TzDbMText const& text) {
    static TextEditorColumns const kNone;
    auto const& columns = valuesOf<MTextImp>(text).columns;
    return columns ? *columns : kNone;
}

MTextBackground const& backgroundOf(TzDbMText const& text) {
    static MTextBackground const kNone;
    auto const& background = valuesOf<MTextImp>(text).background;
    return background ? *background : kNone;
}

// Changes the columns once everything is checked.
template <class Change>
Tzad::ErrorStatus
changeColumns(TzDbMText& text, char const* operation, bool valid, Change const& change) {
    if (auto const fault = faultStatus(operation)) return fault;
    if (!valid) return Tzad::eOutOfRange;
    if (auto const status = beginChange(text)) return status;
    MTextImp& values = valuesOf<MTextImp>(text);
    change(values.columnsForChange());
    values.forgetComputed();
    return Tzad::eOk;
}

template <class Change>
Tzad::ErrorStatus
changeBackground(TzDbMText& text, char const* operation, bool valid, Change const& change) {
    if (auto const fault = faultStatus(operation)) return fault;
    if (!valid) return Tzad::eOutOfRange;
    if (auto const status = beginChange(text)) return status;
    change(valuesOf<MTextImp>(text).backgroundForChange());
    return Tzad::eOk;
}

bool isScale(double factor) {
    constexpr double kLeast = 1.0;
    constexpr double kMost = 5.0;
    return factor >= kLeast && factor <= kMost;
}

}  // namespace

TzDbMText::ColumnType TzDbMText::columnType() const {
    return static_cast<ColumnType>(columnsOf(*this).columnType);
}

TextEditorColumns TzDbMText::columns() const {
    return columnsOf(*this);
}

Tzad::ErrorStatus TzDbMText::setStaticColumns(double width, double gutter, int count) {
    bool const valid =
        tzhost::isSize(width) && tzhost::isSize(gutter) && count >= 1 && count <= kMostColumns;
    return changeColumns(*this, "TzDbMText::setStaticColumns", valid,
                         [&](TextEditorColumns& columns) {
                             columns.columnType = kStaticColumns;
                             columns.columnWidth = width;
                             columns.columnGutter = gutter;
                             columns.columnCount = count;
                             columns.autoHeight = false;
                         });
}

Tzad::ErrorStatus TzDbMText::setDynamicColumns(double width, double gutter, bool autoHeight) {
    bool const valid = tzhost::isSize(width) && tzhost::isSize(gutter);
    return changeColumns(*this, "TzDbMText::setDynamicColumns", valid,
                         [&](TextEditorColumns& columns) {
                             columns.columnType = kDynamicColumns;
                             columns.columnWidth = width;
                             columns.columnGutter = gutter;
                             columns.autoHeight = autoHeight;
                         });
}

Tzad::ErrorStatus TzDbMText::setColumnGutterWidth(double gutter) {
    return changeColumns(*this, "TzDbMText::setColumnGutterWidth", tzhost::isSize(gutter),
                         [&](TextEditorColumns& columns) { columns.columnGutter = gutter; });
}

Tzad::ErrorStatus TzDbMText::setColumnHeight(int column, double height) {
    bool const valid = column >= 0 && column < kMostColumns && tzhost::isSize(height);
    return changeColumns(*this, "TzDbMText::setColumnHeight", valid,
                         [&](TextEditorColumns& columns) {
                             if (columns.heights.length() <= column)
                                 columns.heights.setLogicalLength(column + 1);
                             columns.heights[column] = height;
                         });
}

bool TzDbMText::backgroundFillOn() const {
    return backgroundOf(*this).fill;
}

Tzad::ErrorStatus TzDbMText::setBackgroundFill(bool on) {
    return changeBackground(*this, "TzDbMText::setBackgroundFill", true,
                            [&](MTextBackground& background) { background.fill = on; });
}

TzCmColor TzDbMText::backgroundFillColor() const {
    return backgroundOf(*this).color;
}

Tzad::ErrorStatus TzDbMText::setBackgroundFillColor(TzCmColor const& color) {
    return changeBackground(*this, "TzDbMText::setBackgroundFillColor", true,
                            [&](MTextBackground& background) { background.color = color; });
}

double TzDbMText::backgroundScaleFactor() const {
    return backgroundOf(*this).scale;
}

Tzad::ErrorStatus TzDbMText::setBackgroundScaleFactor(double factor) {
    return changeBackground(*this, "TzDbMText::setBackgroundScaleFactor", isScale(factor),
                            [&](MTextBackground& background) { background.scale = factor; });
}

TzCmTransparency TzDbMText::backgroundTransparency() const {
    return backgroundOf(*this).transparency;
}

Tzad::ErrorStatus TzDbMText::setBackgroundTransparency(TzCmTransparency const& transparency) {
    return changeBackground(
        *this, "TzDbMText::setBackgroundTransparency", true,
        [&](MTextBackground& background) { background.transparency = transparency; });
}

bool TzDbMText::useBackgroundColorOn() const {
    return backgroundOf(*this).useBackgroundColor;
}

Tzad::ErrorStatus TzDbMText::setUseBackgroundColor(bool use) {
    return changeBackground(
        *this, "TzDbMText::setUseBackgroundColor", true,
        [&](MTextBackground& background) { background.useBackgroundColor = use; });
}

Tzad::ErrorStatus tzdbSetMTextBackground(TzDbMText* text,
                                         bool fill,
                                         TzCmColor const& color,
                                         double scale,
                                         TzCmTransparency const& transparency) {
    if (!text) return Tzad::eNullObjectPointer;
    return changeBackground(*text, "tzdbSetMTextBackground", isScale(scale),
                            [&](MTextBackground& background) {
                                background.fill = fill;
                                background.color = color;
                                background.scale = scale;
                                background.transparency = transparency;
                            });
}
