#pragma once

#include <optional>
#include <string>
#include <string_view>

class TzDbObject;

// Values of entities as fields show them.
namespace tzhost {

// The property of that name, without regard to case; nothing when the entity has none such. Names
// are those of the members in drawing files; numbers take the shortest form that reads back the
// same.
[[nodiscard]] std::optional<std::wstring> propertyText(TzDbObject const& object,
                                                       std::wstring_view name);

}  // namespace tzhost
