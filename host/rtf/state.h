#pragma once

// What holds at a place of a rich text document: numbers by name, which the end of a group gives
// back.
//
//   RtfState state;
//   state.open();
//   state.set(RtfField::bold, 1);
//   (void)state.close();          // bold is what it was
//
// Groups may nest as deep as memory goes. One that changes nothing costs none, and each number that
// a group changes costs a few bytes, however often it does.

#include <array>
#include <cstddef>
#include <cstdint>
#include <deque>

namespace tzhost {

enum class RtfField : std::uint8_t {
    // The look of characters, and then the settings of a paragraph. Both may come from a style.
    font,
    size,
    color,
    bold,
    italic,
    underline,
    strike,
    caps,
    hidden,
    firstIndent,
    leftIndent,
    tabs,  // a list of RtfTabs
    // What no style has.
    paragraphStyle,
    characterStyle,
    inTable,
    inListText,   // the number or bullet of a list
    stackMark,    // the characters are a mark of a stack
    substitutes,  // characters after a `\u` for readers that do not know it
    destination,
    // What characters of East Asia have instead, where a writer keeps that apart.
    isWide,  // what follows is such text
    wideSize,
    wideBold,
    wideItalic,
};

inline constexpr std::size_t kRtfLookFields = 9;
inline constexpr std::size_t kRtfStyleFields = 12;  // a style has those up to here
inline constexpr std::size_t kRtfFields = 23;

// Of a field that nothing has set.
inline constexpr int kRtfUnset = -2147483647 - 1;

class RtfState {
public:
    RtfState();

    [[nodiscard]] int get(RtfField field) const { return values_[indexOf(field)]; }
    void set(RtfField field, int value);

    void open();
    // False when no group is open.
    [[nodiscard]] bool close();
    [[nodiscard]] std::uint32_t depth() const { return depth_; }

    // Counts the changes of looks and styles, so that who keeps what they make knows when to look.
    [[nodiscard]] std::uint64_t changes() const { return changes_; }

private:
    // A number before a group changed it. Those of a group stand after those of the groups around.
    struct Saved {
        std::uint32_t depth;       // of the group that changed it
        std::uint32_t olderDepth;  // of the one that had changed it last
        int value;
        RtfField field;
    };
    [[nodiscard]] static std::size_t indexOf(RtfField field) {
        return static_cast<std::size_t>(field);
    }

    std::array<int, kRtfFields> values_;
    std::array<std::uint32_t, kRtfFields> savedAt_{};  // the depth of the last group that saved it
    std::deque<Saved> saved_;
    std::uint32_t depth_ = 0;
    std::uint64_t changes_ = 0;
};

}  // namespace tzhost
