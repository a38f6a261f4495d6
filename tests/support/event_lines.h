#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

// Events and drawings in a compact notation, a line each:
//
//   ? drag/1 Specify opposite corner or [Height]:  <- h => 1
//   print \nCurrent text style: "Standard"
//   set TEXTSIZE 0.2
//   telemetry MText 1 152
//   MTEXT location 0,0,0 textHeight 0.2 contents "abc"
namespace tztest {

// Turns events into lines as they happen.
class EventLines {
public:
    enum class Frames { left, shown };
    // Events before the question with that number are passed over; 0 shows all.
    EventLines(int fromQuestion, Frames frames) : from_(fromQuestion), frames_(frames) {}

    void add(nlohmann::ordered_json const& event);
    [[nodiscard]] std::vector<std::string> const& lines() const { return lines_; }

private:
    void addFrame(nlohmann::ordered_json const& frame);

    int from_;
    int questions_ = 0;
    Frames frames_;
    std::vector<std::string> lines_;
};

// The entities of a saved drawing; members that stand at their defaults are left out.
[[nodiscard]] std::vector<std::string> entityLines(nlohmann::ordered_json const& drawing);

}  // namespace tztest
