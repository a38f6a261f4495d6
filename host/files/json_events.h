#pragma once

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include <nlohmann/json.hpp>

#include "host/files/json_source.h"
#include "host/files/json_value.h"

// What is shared by all readers of JSON: values that know their line, each member once, nesting up
// to 200 levels, and one sentence about what is wrong.
namespace tzhost {

// What is wrong with a file; `member` is empty where none is meant.
struct JsonProblem {
    int line = 1;
    std::string member;
    std::string what;
};

// Takes the events of the parser and builds values of them. A derived class gets each value that
// stands in no other one, and may walk through arrays and objects instead of having them built.
class JsonEvents {
public:
    using number_integer_t = nlohmann::json::number_integer_t;
    using number_unsigned_t = nlohmann::json::number_unsigned_t;
    using number_float_t = nlohmann::json::number_float_t;
    using string_t = nlohmann::json::string_t;
    using binary_t = nlohmann::json::binary_t;

    explicit JsonEvents(JsonSource& source) : source_(source) {}
    JsonEvents(JsonEvents const&) = delete;
    JsonEvents& operator=(JsonEvents const&) = delete;
    virtual ~JsonEvents() = default;

    // Reads the whole source; false when something is wrong or an operation below stopped it.
    [[nodiscard]] bool readAll();
    [[nodiscard]] bool failed() const { return failed_; }
    [[nodiscard]] JsonProblem const& problem() const { return problem_; }

    // The parser's events.
    bool null() { return scalar({}); }
    bool boolean(bool flag);
    bool number_integer(number_integer_t number) {
        return numberValue(static_cast<double>(number), std::to_string(number));
    }
    bool number_unsigned(number_unsigned_t number) {
        return numberValue(static_cast<double>(number), std::to_string(number));
    }
    bool number_float(number_float_t number, string_t const& digits) {
        return numberValue(number, digits);
    }
    bool string(string_t& text);
    bool binary(binary_t&) { return false; }
    bool key(string_t& name);
    bool start_object(std::size_t) { return open(JsonKind::object); }
    bool end_object() { return close(); }
    bool start_array(std::size_t) { return open(JsonKind::array); }
    bool end_array() { return close(); }
    bool parse_error(std::size_t, std::string const&, nlohmann::json::exception const& error);

protected:
    // Each gives false to stop the reading.
    // A whole value that stands in no built one, under `name()` when in an object.
    virtual bool take(JsonValue value) = 0;
    // A scalar is about to be taken.
    virtual bool allow(JsonValue const& /*scalar*/) { return true; }
    // An array or object begins: `walked` says that its parts come one by one.
    virtual bool enter(JsonKind /*kind*/, bool& /*walked*/) { return true; }
    // The last array or object that is walked through ends.
    virtual bool leave() { return true; }
    // A member of an object that is walked through begins.
    virtual bool enterMember() { return true; }

    [[nodiscard]] std::string const& name() const { return key_; }
    [[nodiscard]] int line() const { return source_.line(); }
    // Keeps what is wrong here and stops.
    bool fail(std::string what);
    bool failTwice() { return failTwiceAt(source_.line()); }

private:
    bool numberValue(double number, std::string digits);
    bool scalar(JsonValue value);
    bool open(JsonKind kind);
    bool close();
    // Hands a finished value over, or into the value around it.
    bool deliver(JsonValue value);
    bool failTwiceAt(int line);

    JsonSource& source_;
    bool failed_ = false;
    JsonProblem problem_;
    std::vector<std::pair<std::string, JsonValue>> open_;  // with the key that each stands under
    std::string key_;
};

// A whole document.
struct JsonDocument {
    JsonValue root;
    bool failed = false;
    JsonProblem problem;  // when it failed
};
[[nodiscard]] JsonDocument readJson(std::string_view bytes);

}  // namespace tzhost
