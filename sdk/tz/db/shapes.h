#pragma once

#include "tz/db/entity.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/text/array.h"

// The plain entities beside texts. Getters [any]; setters [write-open], refusing what is not
// finite.
class TZ_API TzDbLine : public TzDbEntity {
public:
    TzDbLine();
    ~TzDbLine() override;
    [[nodiscard]] TzGePoint3d startPoint() const;
    [[nodiscard]] TzGePoint3d endPoint() const;
    Tzad::ErrorStatus setStartPoint(TzGePoint3d const& point);
    Tzad::ErrorStatus setEndPoint(TzGePoint3d const& point);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    [[nodiscard]] Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix) override;
};

class TZ_API TzDbCircle : public TzDbEntity {
public:
    TzDbCircle();
    ~TzDbCircle() override;
    [[nodiscard]] TzGePoint3d center() const;
    Tzad::ErrorStatus setCenter(TzGePoint3d const& center);
    [[nodiscard]] TzGeVector3d normal() const;
    Tzad::ErrorStatus setNormal(TzGeVector3d const& normal);
    // Above 0.
    [[nodiscard]] double radius() const;
    Tzad::ErrorStatus setRadius(double radius);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    [[nodiscard]] Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix) override;
};

// A block drawn at a place, with its attributes.
class TZ_API TzDbBlockReference : public TzDbEntity {
public:
    TzDbBlockReference();
    ~TzDbBlockReference() override;
    [[nodiscard]] TzDbObjectId blockTableRecord() const;
    Tzad::ErrorStatus setBlockTableRecord(TzDbObjectId block);
    [[nodiscard]] TzGePoint3d position() const;
    Tzad::ErrorStatus setPosition(TzGePoint3d const& position);
    [[nodiscard]] TzGeVector3d normal() const;
    Tzad::ErrorStatus setNormal(TzGeVector3d const& normal);
    [[nodiscard]] double rotation() const;
    Tzad::ErrorStatus setRotation(double radians);
    // One factor for all axes, not 0.
    [[nodiscard]] double scale() const;
    Tzad::ErrorStatus setScale(double factor);
    // Block coordinates to world.
    [[nodiscard]] TzGeMatrix3d blockTransform() const;
    // [write-open] Takes an attribute over as appendTzDbEntity does.
    [[nodiscard]] Tzad::ErrorStatus appendAttribute(TzDbObjectId& id,
                                                    class TzDbAttribute* attribute);
    // [any] Fills `ids` with the attributes in the order in which they came, without erased ones.
    void attributes(TzArray<TzDbObjectId>& ids) const;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    [[nodiscard]] Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix) override;
};
