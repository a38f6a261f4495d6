#pragma once

#include "tz/db/object_id.h"
#include "tz/export.h"
#include "tz/ge/matrix3d.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/gi/color.h"
#include "tz/gi/drawable.h"
#include "tz/gi/text_style.h"

// One drawing in progress. Everything is valid only during the call that hands it over. Coordinates
// are world coordinates, or those of the innermost pushed transform.

// How what is drawn next looks.
class TZ_API TzGiSubEntityTraits : public TzRxObject {
public:
    // A colour index: 0 by block, 256 by layer.
    virtual void setColor(int index) = 0;
    virtual void setTrueColor(TzCmEntityColor const& color) = 0;
    // The index in force; for a true colour the nearest one.
    [[nodiscard]] virtual int color() const = 0;
    [[nodiscard]] virtual TzCmEntityColor trueColor() const = 0;
    // The null id is taken as it is and draws solid lines.
    virtual void setLineType(TzDbObjectId linetype) = 0;
    // Hundredths of a millimetre, 0 the thinnest.
    virtual void setLineWeight(int weight) = 0;
    virtual void setLayer(TzDbObjectId layer) = 0;
    // 0 outlines, 1 fills closed outlines.
    virtual void setFillType(int fill) = 0;
    virtual void setTransparency(TzCmTransparency const& transparency) = 0;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// The traits to which a drawable gives its attributes.
class TZ_API TzGiDrawableTraits : public TzGiSubEntityTraits {
public:
    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// The drawing itself. Its operations give true when the host took what was drawn; the embedded one
// takes everything.
class TZ_API TzGiGeometry {
public:
    virtual ~TzGiGeometry() = default;
    // Lines through `count` points. `normal` may be null; the marker -1 marks nothing.
    virtual bool polyline(int count,
                          TzGePoint3d const* points,
                          TzGeVector3d const* normal = nullptr,
                          long long marker = -1) = 0;
    // A closed outline, filled when the traits say so.
    virtual bool polygon(int count, TzGePoint3d const* points) = 0;
    virtual bool circle(TzGePoint3d const& center, double radius, TzGeVector3d const& normal) = 0;
    // A line of text with its baseline from `position`; `length` -1 means up to the zero. With
    // `raw` no code in the text is looked at.
    virtual bool text(TzGePoint3d const& position,
                      TzGeVector3d const& normal,
                      TzGeVector3d const& direction,
                      wchar_t const* text,
                      int length,
                      bool raw,
                      TzGiTextStyle const& style) = 0;
    // Another drawable, with its own attributes.
    virtual bool draw(TzGiDrawable* drawable) = 0;
    // Until the pop, what is drawn has coordinates of its own; the matrix maps them to the ones in
    // force before the push.
    virtual void pushModelTransform(TzGeMatrix3d const& matrix) = 0;
    virtual void popModelTransform() = 0;
};

// What a drawing is made in.
class TZ_API TzGiContext {
public:
    virtual ~TzGiContext() = default;
    // The drawing that what is drawn belongs to; may be null.
    [[nodiscard]] virtual class TzDbDatabase* database() const = 0;
};

class TZ_API TzGiCommonDraw {
public:
    virtual ~TzGiCommonDraw() = default;
    [[nodiscard]] virtual TzGiGeometry& geometry() = 0;
    [[nodiscard]] virtual TzGiSubEntityTraits& subEntityTraits() = 0;
    [[nodiscard]] virtual TzGiContext* context() = 0;
    // Whether the picture is for a drag, where speed counts.
    [[nodiscard]] virtual bool isDragging() const = 0;
};

class TZ_API TzGiWorldDraw : public TzGiCommonDraw {};
class TZ_API TzGiViewportDraw : public TzGiCommonDraw {};

// Services that entities of several modules share when they draw.
namespace ShareDB {
// [draw] Lines drawn next keep clear of what the visual style does to edges: jitter, overhang, and
// so on. The host's styles have none, so the traits stay as they are.
TZ_API void disableVisualStyleEdgeModifiers(
    TzGiSubEntityTraits& traits, TzGiContext* context, bool jitter, bool overhang, bool halo);
}  // namespace ShareDB
