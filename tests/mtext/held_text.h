#pragma once

#include <memory>
#include <string_view>

#include "host/database/drawing.h"
#include "host/runtime/documents.h"
#include "host/settings/variables.h"
#include "tests/command_line/scripted_session.h"
#include "tz/mte/font_map_database.h"

// An open drawing with a script's answers, for tests that hold a text of their own and call the
// module's code directly.
//
//   OpenDrawing const drawing("3,4\nAbc\n\n");
//   TzDbMText text;
//   EXPECT_EQ(doMTextCommandForAttributeDlg(&text), 1);
class OpenDrawing {
public:
    explicit OpenDrawing(std::string_view script = {})
        : session_(script), drawing_(tzhost::Drawing::create()) {
        // An earlier test may have run the program with variables of its own.
        tzhost::Variables::instance().reset();
        tzhost::setWorkingDrawing(drawing_.get());
        tzhost::documents().open(drawing_.get());
    }
    OpenDrawing(OpenDrawing const&) = delete;
    OpenDrawing& operator=(OpenDrawing const&) = delete;
    ~OpenDrawing() {
        tzhost::documents().close();
        tzhost::setWorkingDrawing(nullptr);
        // An editing session may have loaded it.
        CMTextFontMapDatabase(0).ResetContents();
    }

    [[nodiscard]] std::string const& events() const { return session_.events(); }
    [[nodiscard]] std::wstring const& transcript() const { return session_.transcript(); }

private:
    tzhost::test::ScriptedSession session_;
    std::unique_ptr<tzhost::Drawing> drawing_;
};
