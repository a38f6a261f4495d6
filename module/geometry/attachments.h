#pragma once

#include <array>
#include <cstddef>

// The nine points at which a text can be attached to its location: 1 to 9, from the top left to the
// bottom right of its box, row by row.

// Both count from 0, so that half of the number is the share of the box that lies before the point.
enum class BoxColumn : int { left, centre, right };
enum class BoxRow : int { top, middle, bottom };

struct BoxPlace {
    BoxColumn column;
    BoxRow row;

    // How far the point stands from the left edge, in widths: 0, 0.5 or 1.
    [[nodiscard]] constexpr double across() const { return static_cast<int>(column) / 2.0; }
    // How far it stands from the top edge, in heights.
    [[nodiscard]] constexpr double down() const { return static_cast<int>(row) / 2.0; }
};

// In the order of the numbers, from 1.
inline constexpr std::array<BoxPlace, 9> kAttachmentPlaces{{
    {BoxColumn::left, BoxRow::top},
    {BoxColumn::centre, BoxRow::top},
    {BoxColumn::right, BoxRow::top},
    {BoxColumn::left, BoxRow::middle},
    {BoxColumn::centre, BoxRow::middle},
    {BoxColumn::right, BoxRow::middle},
    {BoxColumn::left, BoxRow::bottom},
    {BoxColumn::centre, BoxRow::bottom},
    {BoxColumn::right, BoxRow::bottom},
}};

[[nodiscard]] constexpr bool isAttachment(int number) {
    return number >= 1 && number <= 9;
}

// The place of an attachment; any other number counts as the top left.
[[nodiscard]] constexpr BoxPlace placeOfAttachment(int number) {
    return kAttachmentPlaces[isAttachment(number) ? static_cast<std::size_t>(number - 1) : 0];
}
