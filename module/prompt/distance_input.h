#pragma once

#include "module/prompt/point_input.h"
#include "module/prompt/real_input.h"

// Asks for a length in drawing units, as a number or by points.
//
//   CTzsDistanceInput input(6, none, gStringTable[1070], firstCornerUcs);
//   input.SetDefault(0.2);
//   if (input.Prompt() != statusCancel) use(input.GetDistance());
class CTzsDistanceInput : public CTzsRealInput {
public:
    // The base point, in user coordinates, may be null.
    CTzsDistanceInput(unsigned int theFlags,
                      CKeywordTable& table,
                      TzString const& prompt,
                      double const* basePoint);

    // In the drawing's linear units.
    [[nodiscard]] TzString FormattedReal() const override;
    // The length of the last answer, or the default after an empty one; GetReal by another name.
    [[nodiscard]] virtual double GetDistance() const;

    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

private:
    BasePoint basePoint_;
};
