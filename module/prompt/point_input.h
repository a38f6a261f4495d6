#pragma once

#include "module/prompt/input.h"

// Three coordinates that may be missing; what an input copies of its base point.
class BasePoint {
public:
    BasePoint() = default;
    // Null means none.
    explicit BasePoint(double const* point);
    // Null when there is no point.
    [[nodiscard]] double const* pointer() const { return isGiven_ ? point_ : nullptr; }

private:
    double point_[3] = {0, 0, 0};
    bool isGiven_ = false;
};

// Asks for a point.
//
//   CTzsPointInput input(0, none, gStringTable[1065], nullptr);
//   double world[3];
//   if (input.Prompt() == statusNormal) input.GetPointInWorldCS(world);
class CTzsPointInput : public CTzsInput {
public:
    // The base point, in user coordinates, may be null.
    CTzsPointInput(unsigned int theFlags,
                   CKeywordTable& table,
                   TzString const& prompt,
                   double const* basePoint);

    // The answer, in user or in world coordinates; the origin before one.
    virtual void GetPoint(double* point) const;
    virtual void GetPointInWorldCS(double* point) const;

    [[nodiscard]] TzString PromptString() const override;
    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

private:
    BasePoint basePoint_;
    double result_[3] = {0, 0, 0};
};
