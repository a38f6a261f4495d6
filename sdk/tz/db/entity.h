#pragma once

#include "tz/db/object.h"
#include "tz/ge/matrix3d.h"
#include "tz/ge/plane.h"
#include "tz/gi/color.h"
#include "tz/text/string.h"

namespace TzDb {
enum Visibility : int { kVisible = 0, kInvisible = 1 };
enum Planarity : int { kNonPlanar = 0, kPlanar = 1, kLinear = 2 };
}  // namespace TzDb

// A part of an entity; the null one means the whole.
struct TzDbFullSubentPath {};
inline constexpr TzDbFullSubentPath kNullSubent{};

// What can be drawn and stand in a space. Modules derive from it for previews: such an entity
// overrides subWorldDraw, never enters a database, and counts as open for write. Coordinates are
// world coordinates.
class TZ_API TzDbEntity : public TzDbObject {
public:
    ~TzDbEntity() override;

    // [write-open] Layer and text style from the database's current ones, the layer's colour, and
    // visible; `database()` stays null. A null database means the working one; without any the
    // entity is left alone.
    void setDatabaseDefaults(TzDbDatabase* database = nullptr);

    // [any], setters [write-open]; a setter fails with a status for an id of another class.
    [[nodiscard]] TzDbObjectId layerId() const;
    Tzad::ErrorStatus setLayer(TzDbObjectId layer);
    [[nodiscard]] TzString layer() const;
    [[nodiscard]] TzCmColor color() const;
    [[nodiscard]] int colorIndex() const;
    Tzad::ErrorStatus setColor(TzCmColor const& color);
    Tzad::ErrorStatus setColorIndex(int index);
    [[nodiscard]] TzDb::Visibility visibility() const;
    Tzad::ErrorStatus setVisibility(TzDb::Visibility visibility, bool doSubents = true);

    // [read-open] Shows or stops showing the entity as selected.
    Tzad::ErrorStatus highlight(TzDbFullSubentPath const& path = kNullSubent,
                                bool all = false) const;
    Tzad::ErrorStatus unhighlight(TzDbFullSubentPath const& path = kNullSubent,
                                  bool all = false) const;

    // [any] Whether the entity lies in one plane, and in which.
    [[nodiscard]] virtual bool isPlanar() const;
    [[nodiscard]] virtual Tzad::ErrorStatus getPlane(TzGePlane& plane,
                                                     TzDb::Planarity& planarity) const;
    // [write-open] Moves, turns or scales the entity; refused, with nothing changed, when a
    // coordinate would not be finite or a direction would vanish.
    Tzad::ErrorStatus transformBy(TzGeMatrix3d const& matrix);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    explicit TzDbEntity(TzDbObjectImp* imp = nullptr);

    [[nodiscard]] virtual Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix);
    // Passes colour and layer to the traits, and sets solid lines, no fill and no transparency.
    // Returns 0.
    unsigned int subSetAttributes(TzGiDrawableTraits* traits) override;
    // The body in this class draws nothing.
    bool subWorldDraw(TzGiWorldDraw* draw) override = 0;
    void subViewportDraw(TzGiViewportDraw* draw) override;
};
