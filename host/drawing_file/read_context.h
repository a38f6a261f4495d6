#pragma once

#include <string>
#include <vector>

#include "host/database/drawing.h"
#include "host/drawing_file/json_stream.h"

namespace tzhost::drawingfile {

// What the readers of a drawing's parts share: the drawing, and the first problem that was met. A
// reader goes on with defaults after a problem; its caller looks for one at the end of each part.
struct ReadContext {
    Drawing& drawing;
    bool failed = false;
    Problem problem;                    // when it failed
    std::vector<std::string> warnings;  // "line: what"

    void complain(int line, std::string member, std::string what) {
        if (failed) return;
        failed = true;
        problem = {line, std::move(member), std::move(what)};
    }
};

}  // namespace tzhost::drawingfile
