#pragma once

#include <memory>

#include "tz/db/entity.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// How the program's commands put new entities into the drawing, from answers in user coordinates.
namespace tzdraft {

[[nodiscard]] TzGePoint3d toWorld(TzGePoint3d const& user);

// The plane of the user system, for entities that lie in it.
struct UserPlane {
    TzGeVector3d xAxis;
    TzGeVector3d normal;

    // The rotation, counted as entities count it, of what is turned by `radians` from the X axis.
    [[nodiscard]] double rotation(double radians) const;
};
[[nodiscard]] UserPlane userPlane();

// An entity with the drawing's current layer, colour and style, not in the drawing yet.
template <class Entity>
[[nodiscard]] std::unique_ptr<Entity> newEntity() {
    auto entity = std::make_unique<Entity>();
    entity->setDatabaseDefaults();
    return entity;
}

// Adds it to the active space and leaves it open for write; null when the space cannot be opened.
[[nodiscard]] TzDbEntity* postOpen(std::unique_ptr<TzDbEntity> entity);
// The same, and closes it.
void post(std::unique_ptr<TzDbEntity> entity);

}  // namespace tzdraft
