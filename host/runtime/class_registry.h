#pragma once

#include "tz/rx/class.h"

// The registry of runtime classes. Classes of the host are made on their first use and stay; the
// root is there from the start.
namespace tzhost {

// The descriptor of a class of the host, made on the first call and connected with its parent.
//
//   TzRxClass* TzDbLine::desc() {
//       static TzRxClass* const descriptor = tzhost::hostClass(L"TzDbLine", TzDbEntity::desc());
//       return descriptor;
//   }
[[nodiscard]] TzRxClass*
hostClass(wchar_t const* name, TzRxClass* parent, TzRxCreator creator = nullptr);

}  // namespace tzhost
