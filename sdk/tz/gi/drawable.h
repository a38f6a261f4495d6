#pragma once

#include "tz/export.h"
#include "tz/rx/object.h"

class TzGiDrawableTraits;
class TzGiViewportDraw;
class TzGiWorldDraw;

// What can be drawn. The host calls the plain operations, a class overrides the sub operations:
//   1. setAttributes
//   2. worldDraw; true when nothing is left for single views
//   3. viewportDraw, after false
class TZ_API TzGiDrawable : public TzRxObject {
public:
    // Bits by which the class describes its drawing, 0 for none; this host looks at none of them.
    unsigned int setAttributes(TzGiDrawableTraits* traits) { return subSetAttributes(traits); }
    bool worldDraw(TzGiWorldDraw* draw) { return subWorldDraw(draw); }
    void viewportDraw(TzGiViewportDraw* draw) { subViewportDraw(draw); }

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    virtual unsigned int subSetAttributes(TzGiDrawableTraits* traits) = 0;
    virtual bool subWorldDraw(TzGiWorldDraw* draw) = 0;
    virtual void subViewportDraw(TzGiViewportDraw* draw) = 0;
};
