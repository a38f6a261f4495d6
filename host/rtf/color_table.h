#pragma once

// The colours of a document by number, as its table gives them word by word.

#include <deque>
#include <optional>
#include <string_view>

namespace tzhost {

class RtfColorTable {
public:
    void takeWord(std::string_view word, int value);
    // Ends a colour. One without components is the automatic colour.
    void endColor();
    // Forgets the colours of an earlier table.
    void clear() { colors_.clear(); }

    // The colour as 0x00BBGGRR; nothing for the automatic one and a number that no colour has.
    [[nodiscard]] std::optional<unsigned int> find(int number) const;

private:
    static constexpr unsigned int kAutomatic = 0xFF000000;

    unsigned int color_ = kAutomatic;
    std::deque<unsigned int> colors_;
};

}  // namespace tzhost
