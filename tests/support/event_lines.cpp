#include "tests/support/event_lines.h"

#include <cstdio>
#include <functional>
#include <map>

namespace tztest {

namespace {

using Json = nlohmann::ordered_json;

std::string number(double value) {
    char text[40];
    std::snprintf(text, sizeof text, "%.9g", value == 0 ? 0.0 : value);
    return text;
}

std::string oneLine(std::string const& text) {
    std::string result;
    for (char const c : text) {
        if (c == '\n')
            result += "\\n";
        else
            result += c;
    }
    return result;
}

std::string compact(Json const& value) {
    if (value.is_string()) return "\"" + oneLine(value.get<std::string>()) + "\"";
    if (value.is_number_float()) {
        // What rounding leaves of a zero depends on the compiler.
        double const real = value.get<double>();
        return number(real > -1e-12 && real < 1e-12 ? 0.0 : real);
    }
    if (value.is_array()) {
        std::string text;
        for (Json const& item : value) {
            if (!text.empty()) text += item.is_array() ? " " : ",";
            text += compact(item);
        }
        return text;
    }
    if (value.is_object()) {
        std::string text;
        for (auto const& [key, item] : value.items())
            text += (text.empty() ? "" : " ") + key + " " + compact(item);
        return "{" + text + "}";
    }
    return value.dump();
}

std::string textOf(Json const& event, char const* key) {
    return oneLine(event.value(key, std::string()));
}

std::string memberOf(Json const& event, char const* key) {
    auto const found = event.find(key);
    return found == event.end() ? std::string() : compact(*found);
}

bool isClean(Json const& audit) {
    for (auto const& [key, value] : audit.items()) {
        if (key != "event" && value != Json(0) && value != Json(false)) return false;
    }
    return true;
}

using Line = std::function<std::string(Json const&)>;

// Kinds of events without a row are not shown.
std::map<std::string, Line> const& lineOfEvent() {
    static std::map<std::string, Line> const lines = {
        {"prompt",
         [](Json const& e) {
             return "? " + textOf(e, "kind") + "/" + memberOf(e, "flags") + " " + textOf(e, "text");
         }},
        {"print",
         [](Json const& e) {
             // The line end after each answer is left out.
             std::string const text = textOf(e, "text");
             return text == "\\n" ? std::string() : "print " + text;
         }},
        {"variable",
         [](Json const& e) { return "set " + textOf(e, "name") + " " + memberOf(e, "value"); }},
        {"telemetry",
         [](Json const& e) {
             return "telemetry " + textOf(e, "name") + " " + memberOf(e, "phase") + " " +
                    memberOf(e, "value");
         }},
        {"telemetryPoint",
         [](Json const& e) {
             return "telemetry " + textOf(e, "which") + " " + memberOf(e, "point");
         }},
        {"messageBox", [](Json const& e) { return "box " + textOf(e, "text"); }},
        {"warning",
         [](Json const& e) { return "warning " + textOf(e, "id") + " " + textOf(e, "text"); }},
        {"editor",
         [](Json const& e) {
             return "editor " + textOf(e, "kind") + " accepted " + memberOf(e, "accepted") + " " +
                    memberOf(e, "settings");
         }},
        {"highlight",
         [](Json const& e) {
             return "highlight " + textOf(e, "handle") + " " + memberOf(e, "on");
         }},
        {"audit", [](Json const& e) { return isClean(e) ? std::string() : "audit " + compact(e); }},
    };
    return lines;
}

// What a member of an entity is when it needs no mention.
Json const& defaults() {
    static Json const values = Json::parse(R"({
        "space": "model", "layer": "0", "color": 256, "visible": true, "normal": [0, 0, 1],
        "direction": [1, 0, 0], "height": 0, "attachment": 1, "style": "Standard",
        "lineSpacingStyle": 1, "lineSpacingFactor": 1, "annotative": false,
        "paperOrientation": false, "field": null, "inWorkingSet": true})");
    return values;
}

bool isMentioned(std::string const& key, Json const& value) {
    if (key == "handle" || key == "type" || key == "measured") return false;
    if (key == "columns") return value.value("type", 0) != 0;
    if (key == "background") return value.value("fill", false);
    auto const found = defaults().find(key);
    return found == defaults().end() || compact(*found) != compact(value);
}

}  // namespace

void EventLines::add(Json const& event) {
    std::string const kind = textOf(event, "event");
    if (kind == "prompt") ++questions_;
    if (questions_ < from_) return;
    if (kind == "answer") {
        std::string const answer =
            " <- " + textOf(event, "line") + " => " + memberOf(event, "status");
        if (!lines_.empty() && lines_.back().starts_with("? "))
            lines_.back() += answer;
        else
            lines_.push_back(answer.substr(1));
        return;
    }
    if (kind == "frame") {
        addFrame(event);
        return;
    }
    auto const found = lineOfEvent().find(kind);
    if (found == lineOfEvent().end()) return;
    std::string const line = found->second(event);
    if (!line.empty()) lines_.push_back(line);
}

void EventLines::addFrame(Json const& frame) {
    if (frames_ == Frames::left) return;
    lines_.push_back("frame");
    for (Json const& stroke : frame["draw"]) {
        std::string line = "  " + textOf(stroke, "op");
        for (auto const& [key, value] : stroke.items()) {
            if (key != "op") line += " " + key + " " + compact(value);
        }
        lines_.push_back(line);
    }
}

std::vector<std::string> entityLines(Json const& drawing) {
    std::vector<std::string> lines;
    for (Json const& entity : drawing["entities"]) {
        std::string line = textOf(entity, "type");
        for (auto const& [key, value] : entity.items()) {
            if (isMentioned(key, value)) line += " " + key + " " + compact(value);
        }
        lines.push_back(line);
    }
    return lines;
}

}  // namespace tztest
