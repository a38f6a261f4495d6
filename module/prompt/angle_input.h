#pragma once

#include "module/prompt/point_input.h"
#include "module/prompt/real_input.h"

// Asks for an angle in radians, as a number or by a point from the base point.
//
//   CTzsAngleInput input(1, none, gStringTable[1066], firstCornerUcs);
//   input.SetDefault(0.0);
//   if (input.Prompt() != statusCancel) use(input.GetAngle());
class CTzsAngleInput : public CTzsRealInput {
public:
    // The base point, in user coordinates, may be null.
    CTzsAngleInput(unsigned int theFlags,
                   CKeywordTable& table,
                   TzString const& prompt,
                   double const* basePoint);

    // In the drawing's angular units.
    [[nodiscard]] TzString FormattedReal() const override;
    // The angle of the last answer, or the default after an empty one; GetReal by another name.
    [[nodiscard]] virtual double GetAngle() const;

    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

protected:
    BasePoint basePoint_;
};

// The same, asked as an orientation.
class CTzsOrientationInput : public CTzsAngleInput {
public:
    using CTzsAngleInput::CTzsAngleInput;

    [[nodiscard]] int OnPrompt(TzString const& prompt) override;
};
