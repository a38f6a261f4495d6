#pragma once

#include "tz/db/entity.h"
#include "tz/db/text_columns.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/text/array.h"

namespace TzDb {
enum LineSpacingStyle : int { kAtLeast = 1, kExactly = 2 };
}

// A multi-line text: contents in the host's markup, laid out in a box of a given width (0: no
// wrapping) from a location to which one of nine points of the box is attached. The text height is
// the height of capitals; the distance of baselines at factor 1 is 5/3 of it.
//
//   TzDbMText* text = new TzDbMText;
//   text->setDatabaseDefaults();
//   text->setContents(L"First\\PSecond");
//   text->setWidth(10);
//
// Getters [any]; setters [write-open]. A setter refuses, with a status and nothing changed, a value
// that is not finite, a zero normal or direction, and a direction parallel to the normal. Measuring
// an entity that is in no database uses the style that its id names.
class TZ_API TzDbMText : public TzDbEntity {
public:
    // 1 to 9, top left to bottom right, row by row.
    enum AttachmentPoint : int {
        kTopLeft = 1,
        kTopCenter,
        kTopRight,
        kMiddleLeft,
        kMiddleCenter,
        kMiddleRight,
        kBottomLeft,
        kBottomCenter,
        kBottomRight,
    };
    enum FlowDirection : int { kLtoR = 1, kTtoB = 3 };
    enum ColumnType : int { kNoColumns = 0, kStaticColumns = 1, kDynamicColumns = 2 };

    TzDbMText();
    ~TzDbMText() override;

    [[nodiscard]] TzGePoint3d location() const;
    Tzad::ErrorStatus setLocation(TzGePoint3d const& location);
    // Unit vectors. Setting the normal turns the direction with it where it would no longer be
    // perpendicular.
    [[nodiscard]] TzGeVector3d normal() const;
    Tzad::ErrorStatus setNormal(TzGeVector3d const& normal);
    [[nodiscard]] TzGeVector3d direction() const;
    Tzad::ErrorStatus setDirection(TzGeVector3d const& direction);
    // The direction's angle in radians from the X axis of the user system, about the normal.
    [[nodiscard]] double rotation() const;
    Tzad::ErrorStatus setRotation(double radians);
    [[nodiscard]] double textHeight() const;
    Tzad::ErrorStatus setTextHeight(double height);
    // The width to wrap at; 0 for none.
    [[nodiscard]] double width() const;
    Tzad::ErrorStatus setWidth(double width);
    // The height of the columns; 0 for none.
    [[nodiscard]] double height() const;
    Tzad::ErrorStatus setHeight(double height);
    [[nodiscard]] AttachmentPoint attachment() const;
    // The text moves about its location; with ...MovingLocation the location moves and the text
    // stays.
    Tzad::ErrorStatus setAttachment(AttachmentPoint point);
    Tzad::ErrorStatus setAttachmentMovingLocation(AttachmentPoint point);
    [[nodiscard]] TzDbObjectId textStyle() const;
    Tzad::ErrorStatus setTextStyle(TzDbObjectId style);
    [[nodiscard]] TzDb::LineSpacingStyle lineSpacingStyle() const;
    Tzad::ErrorStatus setLineSpacingStyle(TzDb::LineSpacingStyle style);
    // 0.25 to 4.
    [[nodiscard]] double lineSpacingFactor() const;
    Tzad::ErrorStatus setLineSpacingFactor(double factor);

    // Markup, with fields evaluated; setContents finds the fields in it, which come to life when
    // the entity is added to a database.
    [[nodiscard]] TzString contents() const;
    Tzad::ErrorStatus setContents(wchar_t const* contents);
    // The markup of a paragraph's end.
    [[nodiscard]] static wchar_t const* paragraphBreak();

    // Widths, gutters and heights from 0, 1 to 1000 static columns, columns counted from 0 up to
    // 999; eOutOfRange for others. A height holds for one column, with dynamic columns that have no
    // automatic height.
    [[nodiscard]] ColumnType columnType() const;
    [[nodiscard]] TextEditorColumns columns() const;
    Tzad::ErrorStatus setStaticColumns(double width, double gutter, int count);
    Tzad::ErrorStatus setDynamicColumns(double width, double gutter, bool autoHeight);
    Tzad::ErrorStatus setColumnGutterWidth(double gutter);
    Tzad::ErrorStatus setColumnHeight(int column, double height);

    // What is painted behind the text.
    [[nodiscard]] bool backgroundFillOn() const;
    Tzad::ErrorStatus setBackgroundFill(bool on);
    [[nodiscard]] TzCmColor backgroundFillColor() const;
    Tzad::ErrorStatus setBackgroundFillColor(TzCmColor const& color);
    // The box's height over the text's, 1 to 5; 1.5 at first.
    [[nodiscard]] double backgroundScaleFactor() const;
    Tzad::ErrorStatus setBackgroundScaleFactor(double factor);
    [[nodiscard]] TzCmTransparency backgroundTransparency() const;
    Tzad::ErrorStatus setBackgroundTransparency(TzCmTransparency const& transparency);
    [[nodiscard]] bool useBackgroundColorOn() const;
    Tzad::ErrorStatus setUseBackgroundColor(bool use);

    // Of the text as it is laid out. `draw` is the drawing in progress and may be null.
    [[nodiscard]] double actualWidth(TzGiWorldDraw* draw = nullptr) const;
    [[nodiscard]] double actualHeight(TzGiWorldDraw* draw = nullptr) const;
    // World points: top left, top right, bottom left, bottom right of the text.
    void getBoundingPoints(TzArray<TzGePoint3d>& points) const;

    [[nodiscard]] bool isPlanar() const override;
    [[nodiscard]] Tzad::ErrorStatus getPlane(TzGePlane& plane,
                                             TzDb::Planarity& planarity) const override;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    [[nodiscard]] Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix) override;
};

// [write-open] Sets the whole background of a text at once.
TZ_API Tzad::ErrorStatus tzdbSetMTextBackground(TzDbMText* text,
                                                bool fill,
                                                TzCmColor const& color,
                                                double scale,
                                                TzCmTransparency const& transparency);
