#pragma once

class TzDbEntity;

namespace tzhost {

// Whether the entity's layer is off.
[[nodiscard]] bool isOnLayerOff(TzDbEntity const& entity);
// Whether an entity can be seen: it is visible, and its layer is not off. Nothing is opened.
[[nodiscard]] bool isShown(TzDbEntity const& entity);

}  // namespace tzhost
