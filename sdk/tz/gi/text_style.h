#pragma once

#include "tz/db/object_id.h"
#include "tz/export.h"
#include "tz/ge/point2d.h"
#include "tz/rx/status.h"
#include "tz/text/string.h"

class TzGiWorldDraw;

// How a line of text is drawn: a plain value, made by hand or from a text style of the drawing.
//
//   TzGiTextStyle style;
//   if (fromTzDbTextStyle(style, id) == Tzad::eOk) style.setTextSize(2.5);
//   TzGePoint2d const size = style.extents(L"abc", true, 3, true, draw);
//
// Sizes in the units of the drawing, angles in radians.
class TZ_API TzGiTextStyle {
public:
    [[nodiscard]] TzString const& fileName() const { return fileName_; }
    void setFileName(TzString const& file) { fileName_ = file; }
    [[nodiscard]] TzString const& bigFontFileName() const { return bigFontFileName_; }
    void setBigFontFileName(TzString const& file) { bigFontFileName_ = file; }
    // An empty typeface leaves the font to the file name.
    void setFont(TzString const& typeface, bool bold, bool italic, int charset, int pitchAndFamily);
    [[nodiscard]] TzString const& typeface() const { return typeface_; }
    [[nodiscard]] bool isBold() const { return bold_; }
    [[nodiscard]] bool isItalic() const { return italic_; }
    [[nodiscard]] int charset() const { return charset_; }
    [[nodiscard]] int pitchAndFamily() const { return pitchAndFamily_; }
    // The height of capitals; 1 at first.
    [[nodiscard]] double textSize() const { return textSize_; }
    void setTextSize(double size) { textSize_ = size; }
    [[nodiscard]] double xScale() const { return xScale_; }
    void setXScale(double scale) { xScale_ = scale; }
    [[nodiscard]] double obliquingAngle() const { return obliquingAngle_; }
    void setObliquingAngle(double radians) { obliquingAngle_ = radians; }
    // The distance of characters over the ordinary one.
    [[nodiscard]] double trackingPercent() const { return tracking_; }
    void setTrackingPercent(double factor) { tracking_ = factor; }
    [[nodiscard]] bool isBackward() const { return backward_; }
    void setBackward(bool backward) { backward_ = backward; }
    [[nodiscard]] bool isUpsideDown() const { return upsideDown_; }
    void setUpsideDown(bool upsideDown) { upsideDown_ = upsideDown; }
    [[nodiscard]] bool isVertical() const { return vertical_; }
    void setVertical(bool vertical) { vertical_ = vertical; }

    // [any] Width and height of a line of text in this style; `length` -1 means up to the zero.
    // Without `raw` the codes of single-line texts in it are read. `penUps`, for hosts that draw
    // with pens, and `draw`, which may be null, change nothing here.
    [[nodiscard]] TzGePoint2d extents(wchar_t const* text,
                                      bool penUps,
                                      int length,
                                      bool raw,
                                      TzGiWorldDraw* draw = nullptr) const;

private:
    TzString fileName_;
    TzString bigFontFileName_;
    TzString typeface_;
    double textSize_ = 1;
    double xScale_ = 1;
    double obliquingAngle_ = 0;
    double tracking_ = 1;
    int charset_ = 0;
    int pitchAndFamily_ = 0;
    bool bold_ = false;
    bool italic_ = false;
    bool backward_ = false;
    bool upsideDown_ = false;
    bool vertical_ = false;
};

// [any] Fills a style from a text style of the drawing; on failure the style is left alone.
[[nodiscard]] TZ_API Tzad::ErrorStatus fromTzDbTextStyle(TzGiTextStyle& style, TzDbObjectId id);
