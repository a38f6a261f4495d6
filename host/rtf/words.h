#pragma once

// The control words that the normaliser acts on. Others are stepped over.

#include <string_view>

#include "host/rtf/document.h"

namespace tzhost {

struct RtfWords {
    struct Row {
        std::string_view word;
        void (RtfDocument::*handler)(RtfToken const&, int argument);
        int argument;

        // Whether a style may hold it.
        [[nodiscard]] bool isSetting() const;
    };

    // Null for an unknown word.
    [[nodiscard]] static Row const* find(std::string_view word);
    // Whether it is the name of a character.
    [[nodiscard]] static bool isCharacter(std::string_view word);
    // Whether it numbers a style of the style sheet.
    [[nodiscard]] static bool beginsStyle(RtfToken const& token);

private:
    struct Table;
};

}  // namespace tzhost
