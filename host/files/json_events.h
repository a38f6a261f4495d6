#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "host/files/json_source.h"
#include "host/files/json_store.h"
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

// Takes the events of a parser and builds values of them. A derived class gets each value that
// stands in no other one, and may walk through arrays and objects instead of having them built.
class JsonEvents {
public:
    // Values lie in the store, which whoever takes them clears.
    JsonEvents(JsonSource& source, JsonStore& store) : source_(source), store_(store) {}
    JsonEvents(JsonEvents const&) = delete;
    JsonEvents& operator=(JsonEvents const&) = delete;
    virtual ~JsonEvents() = default;

    // Reads the whole source; false when something is wrong or an operation below stopped it.
    [[nodiscard]] bool readAll();
    [[nodiscard]] bool failed() const { return failed_; }
    [[nodiscard]] JsonProblem const& problem() const { return problem_; }

    // The parser's events; each gives false to stop the reading.
    bool null() { return scalar({}); }
    bool flag(bool value);
    bool number(double value, std::string_view digits);
    bool text(std::string_view utf8);
    bool key(std::string_view name);
    bool open(JsonKind kind);
    bool close();
    // Keeps what is wrong here and stops.
    bool fail(std::string what);

protected:
    // Each gives false to stop the reading.
    // A whole value that stands in no built one, under `name()` when in an object.
    virtual bool take(JsonValue const& value) = 0;
    // A scalar is about to be taken.
    virtual bool allow(JsonValue const& /*scalar*/) { return true; }
    // An array or object begins: `walked` says that its parts come one by one.
    virtual bool enter(JsonKind /*kind*/, bool& /*walked*/) { return true; }
    // The last array or object that is walked through ends.
    virtual bool leave() { return true; }
    // A member of an object that is walked through begins.
    virtual bool enterMember() { return true; }

    [[nodiscard]] std::string_view name() const { return key_; }
    [[nodiscard]] int line() const { return source_.line(); }
    bool failTwice() { return failTwiceAt(source_.line()); }

private:
    // An array or object that is being built, with the key that it stands under.
    struct Open {
        std::string_view key;
        JsonKind kind;
        int line;
        std::size_t first;  // of its parts among those pending
    };

    bool scalar(JsonValue value);
    // Hands a finished value over, or to the value around it.
    bool deliver(JsonValue const& value);
    bool failTwiceAt(int line);

    JsonSource& source_;
    JsonStore& store_;
    bool failed_ = false;
    JsonProblem problem_;
    std::vector<Open> open_;
    std::vector<JsonMember> pending_;  // parts of values that are open; items have no names
    std::vector<JsonValue> items_;     // of the array that ends, kept for its memory
    std::string walkedKey_;            // the last key of an object that is walked through
    std::string_view key_;             // that one, or one in the store
};

// A whole document, with what its values name.
struct JsonDocument {
    std::unique_ptr<JsonStore> store = std::make_unique<JsonStore>();
    JsonValue root;
    bool failed = false;
    JsonProblem problem;  // when it failed
};
[[nodiscard]] JsonDocument readJson(std::string_view bytes);

}  // namespace tzhost
