#pragma once

#include <memory>

#include "host/database/entity_imp.h"
#include "host/database/object_list.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// The values of lines, circles and block references.
namespace tzhost {

struct LineImp final : EntityImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    TzGePoint3d start;
    TzGePoint3d end;
};

struct CircleImp final : EntityImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    TzGePoint3d center;
    TzGeVector3d normal = TzGeVector3d::kZAxis;
    double radius = 1.0;
};

struct InsertImp final : EntityImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    [[nodiscard]] bool refersTo(TzDbObjectRecord const* named) const override {
        return block.record() == named || EntityImp::refersTo(named);
    }

    [[nodiscard]] ObjectList* list() override { return attributes.get(); }
    // A copy draws the original's attributes, which its own list names.
    void loosen() override;
    void onErase(bool erasing) override;

    TzDbObjectId block;
    TzGePoint3d position;
    TzGeVector3d normal = TzGeVector3d::kZAxis;
    double rotation = 0.0;
    double scale = 1.0;
    std::shared_ptr<ObjectList> attributes = std::make_shared<ObjectList>();
};

}  // namespace tzhost
