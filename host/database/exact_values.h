#pragma once

#include <algorithm>
#include <memory>

#include "tz/db/text_columns.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// Values compared to the last bit: points and vectors have a tolerance of their own, which would
// let a small change in a small drawing pass for none.
namespace tzhost {

template <class Value>
[[nodiscard]] bool isExactly(Value const& a, Value const& b) {
    return a == b;
}

[[nodiscard]] inline bool isExactly(TzGePoint3d const& a, TzGePoint3d const& b) {
    return a.x == b.x && a.y == b.y && a.z == b.z;
}

[[nodiscard]] inline bool isExactly(TzGeVector3d const& a, TzGeVector3d const& b) {
    return a.x == b.x && a.y == b.y && a.z == b.z;
}

[[nodiscard]] inline bool isExactly(TextEditorColumns const& a, TextEditorColumns const& b) {
    return a.columnType == b.columnType && a.autoHeight == b.autoHeight &&
           a.columnCount == b.columnCount && a.columnWidth == b.columnWidth &&
           a.columnGutter == b.columnGutter && a.flowReversed == b.flowReversed &&
           std::equal(a.heights.begin(), a.heights.end(), b.heights.begin(), b.heights.end());
}

// Parts that may be missing; a missing one is that of a new object.
template <class Value>
[[nodiscard]] bool isExactly(std::unique_ptr<Value> const& a, std::unique_ptr<Value> const& b) {
    if (!a && !b) return true;
    Value const fresh = Value();
    return isExactly(a ? *a : fresh, b ? *b : fresh);
}

// Whether two objects have the same values in all these members.
template <class Object, class... Members>
[[nodiscard]] bool agree(Object const& a, Object const& b, Members... members) {
    return (isExactly(a.*members, b.*members) && ...);
}

}  // namespace tzhost
