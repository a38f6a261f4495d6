#pragma once

#include "host/database/object_imp.h"
#include "tz/gi/color.h"

// The values that every entity has, and those that all texts share.
namespace tzhost {

struct EntityImp : TzDbObjectImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    [[nodiscard]] TzDbObjectRecord* lockingLayer() const override { return layer.record(); }
    [[nodiscard]] bool refersTo(TzDbObjectRecord const* named) const override {
        return layer.record() == named;
    }

    TzDbObjectId layer;  // null means "0"
    TzCmColor color;
    bool visible = true;
};

struct TextStyledImp : EntityImp {
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    [[nodiscard]] bool refersTo(TzDbObjectRecord const* named) const override {
        return style.record() == named || EntityImp::refersTo(named);
    }

    TzDbObjectId style;  // null means the style in force in the working drawing
    bool annotative = false;
    bool paperOrientation = false;
};

}  // namespace tzhost
