#pragma once

// Answers from the strings that were sent to a document's command line, as if they had been typed:
// a line end ends an answer, and so does a blank that does not follow a comma. The end of the
// strings ends the last answer. The character 3 cancels.

#include <string>
#include <string_view>

#include "host/command_line/answer_source.h"

namespace tzhost {

class SentStrings {
public:
    void push(std::wstring_view text) { rest_ += text; }
    [[nodiscard]] bool isEmpty() const { return rest_.empty(); }
    // The next answer; `end` when nothing is left.
    [[nodiscard]] Answer next();
    void clear() { rest_.clear(); }

private:
    std::wstring rest_;
};

}  // namespace tzhost
