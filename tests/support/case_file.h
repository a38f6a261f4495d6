#pragma once

#include <filesystem>
#include <iosfwd>
#include <string>
#include <vector>

// Files of session cases: for each a script and what is to be seen of it, line by line. A file
// reads
//
//   # A comment. What stands before the first case holds for all of them:
//   from 2               events before the second question are not shown
//   show frames          what is drawn during drags is shown too
//   hide telemetry       lines that begin so are not shown; repeatable
//   var AUNITS=3         a variable of the run, as --var takes it; repeatable
//   begin -MTEXT         a line that every script begins with
//   end 4,-2             a line that every script ends with
//
//   case Name
//   var TEXTSIZE=5       for this case; so are `fail NAME:K=STATUS`, as --fail takes it,
//   settings {...}       the settings file, and
//   drawing {...}        the drawing that is open, and
//   patch {...}          members that differ in it
//   stop                 the lines of `end` are left out
//   > R                  a line of the script; ">" alone is Enter
//   | print ...          a line that is expected
//
// Names of files are relative to tests/.
namespace tztest {

struct SessionCase {
    std::string name;
    std::string file;
    std::vector<std::string> variables;
    std::vector<std::string> faults;
    std::string settings;
    std::string drawing;
    std::string drawingPatch;
    std::vector<std::string> script;  // begin and end included
    std::vector<std::string> expected;
    int from = 0;
    std::vector<std::string> hidden;
    bool showsFrames = false;
};

// Throws std::runtime_error, with file and line, for what cannot be read.
[[nodiscard]] std::vector<SessionCase> readCases(std::string const& file);
// Replaces what a case expects in its file.
void storeExpectation(SessionCase const& changed, std::vector<std::string> const& lines);

// What a failing test shows.
void PrintTo(SessionCase const& session, std::ostream* out);

}  // namespace tztest
