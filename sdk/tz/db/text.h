#pragma once

#include "tz/db/entity.h"
#include "tz/db/mtext.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

struct resbuf;

// A single-line text along the X axis of its plane turned by the rotation. Its justification says
// which part of it lies at its alignment point; it stays there whatever becomes of the letters.
// Getters [any]; setters [write-open] with the refusals of TzDbMText.
class TZ_API TzDbText : public TzDbEntity {
public:
    TzDbText();
    ~TzDbText() override;

    // Points on the baseline, and on the box from there to the top of capitals, whose foot is the
    // baseline.
    enum Justification : int {
        kLeft,
        kCenter,
        kRight,
        kTopLeft,
        kTopCenter,
        kTopRight,
        kMiddleLeft,
        kMiddleCenter,
        kMiddleRight,
        kBottomLeft,
        kBottomCenter,
        kBottomRight,
    };
    static constexpr int kJustifications = 12;

    // The start of the baseline. Setting it moves the alignment point with the text.
    [[nodiscard]] TzGePoint3d position() const;
    Tzad::ErrorStatus setPosition(TzGePoint3d const& position);
    // The alignment point stays where it is. A definition of several lines has it at their
    // attachment, whatever its justification.
    [[nodiscard]] Justification justification() const;
    Tzad::ErrorStatus setJustification(Justification justification);
    // That of a text justified to the left is its position.
    [[nodiscard]] TzGePoint3d alignmentPoint() const;
    Tzad::ErrorStatus setAlignmentPoint(TzGePoint3d const& point);
    [[nodiscard]] TzGeVector3d normal() const;
    Tzad::ErrorStatus setNormal(TzGeVector3d const& normal);
    // Radians from the X axis of the plane, which the arbitrary axis rule gives.
    [[nodiscard]] double rotation() const;
    Tzad::ErrorStatus setRotation(double radians);
    [[nodiscard]] double height() const;
    Tzad::ErrorStatus setHeight(double height);
    [[nodiscard]] double widthFactor() const;
    Tzad::ErrorStatus setWidthFactor(double factor);
    [[nodiscard]] double oblique() const;
    Tzad::ErrorStatus setOblique(double radians);
    [[nodiscard]] TzDbObjectId textStyle() const;
    Tzad::ErrorStatus setTextStyle(TzDbObjectId style);
    [[nodiscard]] TzString textString() const;
    Tzad::ErrorStatus setTextString(wchar_t const* text);

    [[nodiscard]] bool isPlanar() const override;
    [[nodiscard]] Tzad::ErrorStatus getPlane(TzGePlane& plane,
                                             TzDb::Planarity& planarity) const override;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    explicit TzDbText(TzDbObjectImp* imp);
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    [[nodiscard]] Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix) override;
};

// The definition of an attribute: shows its tag, or its multi-line default.
class TZ_API TzDbAttributeDefinition : public TzDbText {
public:
    TzDbAttributeDefinition();
    ~TzDbAttributeDefinition() override;

    [[nodiscard]] TzString tag() const;
    Tzad::ErrorStatus setTag(wchar_t const* tag);
    [[nodiscard]] TzString prompt() const;
    Tzad::ErrorStatus setPrompt(wchar_t const* prompt);
    [[nodiscard]] bool isMTextAttributeDefinition() const;
    // [any] The text of a multi-line definition, null for a single-line one; owned by this. It is
    // open as this object is.
    [[nodiscard]] TzDbMText const* getMTextAttributeDefinitionConst() const;
    // [write-open] The same, to be changed.
    [[nodiscard]] TzDbMText* getMTextAttributeDefinition();
    // [write-open] Takes a text over as its multi-line default; null makes it single-line.
    // eInvalidInput for a text that belongs to another definition; it stays there.
    Tzad::ErrorStatus setMTextAttributeDefinition(TzDbMText* text);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    [[nodiscard]] Tzad::ErrorStatus subTransformBy(TzGeMatrix3d const& matrix) override;
};

// An attribute of a block reference.
class TZ_API TzDbAttribute : public TzDbText {
public:
    TzDbAttribute();
    ~TzDbAttribute() override;
    [[nodiscard]] TzString tag() const;
    Tzad::ErrorStatus setTag(wchar_t const* tag);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// [any] The data of an entity as a list, type first, owned by the caller (tzutRelRb); null for a
// name of no entity.
[[nodiscard]] TZ_API resbuf* tzdbEntGet(long long const* name);
// [any] Two corners of a text in its own frame, lower left and upper right, from the data that
// tzdbEntGet gives: 5100, or -5001 for what is no text.
[[nodiscard]] TZ_API int tzedTextBox(resbuf const* data, double* lowerLeft, double* upperRight);
