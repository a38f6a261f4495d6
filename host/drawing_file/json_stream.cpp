#include "host/drawing_file/json_stream.h"

#include <algorithm>
#include <set>
#include <string_view>
#include <utility>
#include <vector>

#include <nlohmann/json.hpp>

#include "host/drawing_file/json_source.h"
#include "host/files/file_bytes.h"
#include "host/text/local_text.h"

namespace tzhost::drawingfile {
namespace {

constexpr std::size_t kDeepest = 200;

// Where the parser stands outside the values that are handed over whole.
enum class Place { start, drawing, entities, blocks, block, blockEntities, end };

constexpr char const* kTwice = forLocalText("stands twice, expected each member once");

// The second value of a name that an object has twice, and that name; null when there is none.
JsonValue const* secondOfName(JsonValue const& object, std::string& name) {
    using Member = JsonMember const*;
    std::vector<Member> sorted;
    sorted.reserve(object.members.size());
    for (auto const& member : object.members)
        sorted.push_back(&member);
    std::stable_sort(sorted.begin(), sorted.end(),
                     [](Member a, Member b) { return a->first < b->first; });
    auto const at = std::adjacent_find(sorted.begin(), sorted.end(),
                                       [](Member a, Member b) { return a->first == b->first; });
    if (at == sorted.end()) return nullptr;
    name = (*at)->first;
    return &(*std::next(at))->second;
}

// The sentence that a parser's message holds, without places and the text that was read.
std::string sentenceOf(std::string_view message) {
    std::size_t const dash = message.find(" - ");
    if (dash != message.npos) message.remove_prefix(dash + 3);
    std::size_t const read = message.find("; last read:");
    if (read == message.npos) return std::string(message);
    std::size_t const expected = message.find("; expected", read);
    std::string text(message.substr(0, read));
    return expected == message.npos ? text : text + std::string(message.substr(expected));
}

std::string explain(nlohmann::json::exception const& error) {
    std::string_view const message = error.what();
    if (message.find("UTF-8") != message.npos)
        return localText("is not UTF-8, expected UTF-8 text");
    if (message.find("out_of_range") != message.npos) {
        return localText("is too large a number, expected one below 1.8e308");
    }
    return localText("is no JSON here: ") + sentenceOf(message);
}

}  // namespace

// Takes the parser's events.
class StreamParser {
public:
    using number_integer_t = nlohmann::json::number_integer_t;
    using number_unsigned_t = nlohmann::json::number_unsigned_t;
    using number_float_t = nlohmann::json::number_float_t;
    using string_t = nlohmann::json::string_t;
    using binary_t = nlohmann::json::binary_t;

    StreamParser(JsonSource& source, DrawingSink& sink) : source_(source), sink_(sink) {}

    bool null() { return scalar({}); }
    bool boolean(bool flag) {
        JsonValue value;
        value.kind = JsonKind::flag;
        value.flag = flag;
        return scalar(std::move(value));
    }
    bool number_integer(number_integer_t number) {
        return numberValue(static_cast<double>(number), std::to_string(number));
    }
    bool number_unsigned(number_unsigned_t number) {
        return numberValue(static_cast<double>(number), std::to_string(number));
    }
    bool number_float(number_float_t number, string_t const& digits) {
        return numberValue(number, digits);
    }
    bool string(string_t& text) {
        JsonValue value;
        value.kind = JsonKind::text;
        value.text = std::move(text);
        return scalar(std::move(value));
    }
    bool binary(binary_t&) { return false; }
    bool key(string_t& name);
    bool start_object(std::size_t) { return open(JsonKind::object); }
    bool end_object() { return close(); }
    bool start_array(std::size_t) { return open(JsonKind::array); }
    bool end_array() { return close(); }
    bool parse_error(std::size_t, std::string const&, nlohmann::json::exception const& error) {
        return fail(explain(error));
    }

    StreamResult take() { return std::move(result_); }

private:
    bool numberValue(double number, std::string digits) {
        JsonValue value;
        value.kind = JsonKind::number;
        value.number = number;
        value.text = std::move(digits);
        return scalar(std::move(value));
    }
    bool scalar(JsonValue value);
    bool open(JsonKind kind);
    bool close();
    // Opens the drawing itself, its streamed arrays and its blocks; `handled` says whether it was
    // one.
    bool openPlace(JsonKind kind, bool& handled);
    // Hands a finished value to the sink, or into the value around it.
    bool deliver(JsonValue value);
    bool hand(bool accepted) {
        result_.stopped = !accepted;
        return accepted;
    }
    bool fail(std::string what) {
        result_.failed = true;
        result_.problem = {source_.line(), key_, std::move(what)};
        return false;
    }

    JsonSource& source_;
    DrawingSink& sink_;
    StreamResult result_;
    Place place_ = Place::start;
    std::vector<std::pair<std::string, JsonValue>> open_;  // with the key that each stands under
    std::set<std::string> seen_[2];  // members of the drawing and of the block so far
    std::string key_;
};

bool StreamParser::key(string_t& name) {
    key_ = std::move(name);
    bool const isStreamed = open_.empty();
    if (!isStreamed || seen_[place_ == Place::block ? 1 : 0].insert(key_).second) return true;
    return fail(localText(kTwice));
}

bool StreamParser::deliver(JsonValue value) {
    if (!open_.empty()) {
        JsonValue& outer = open_.back().second;
        if (outer.kind == JsonKind::array) {
            outer.items.push_back(std::move(value));
        } else {
            outer.members.push_back({key_, std::move(value)});
        }
        return true;
    }
    switch (place_) {
    case Place::drawing: return hand(sink_.member(key_, std::move(value)));
    case Place::block: return hand(sink_.blockMember(key_, std::move(value)));
    case Place::entities:
    case Place::blockEntities: return hand(sink_.entity(std::move(value)));
    case Place::blocks:
        return fail(localText("holds ") + nameOf(value.kind) + localText(", expected an object"));
    case Place::start:
    case Place::end: break;
    }
    return fail(localText("is ") + nameOf(value.kind) + localText(", expected an object"));
}

bool StreamParser::scalar(JsonValue value) {
    value.line = source_.line();
    bool const isStreamed =
        open_.empty() && ((place_ == Place::drawing && (key_ == "entities" || key_ == "blocks")) ||
                          (place_ == Place::block && key_ == "entities"));
    if (isStreamed)
        return fail(localText("is ") + nameOf(value.kind) + localText(", expected an array"));
    return deliver(std::move(value));
}

bool StreamParser::openPlace(JsonKind kind, bool& handled) {
    bool const isArray = kind == JsonKind::array;
    handled = true;
    if (place_ == Place::start && !isArray) {
        place_ = Place::drawing;
    } else if (place_ == Place::drawing && (key_ == "entities" || key_ == "blocks")) {
        if (!isArray) return fail(localText("is an object, expected an array"));
        place_ = key_ == "blocks" ? Place::blocks : Place::entities;
        sink_.beginArray(key_);
    } else if (place_ == Place::blocks && !isArray) {
        place_ = Place::block;
        seen_[1].clear();
        return hand(sink_.beginBlock(source_.line()));
    } else if (place_ == Place::block && key_ == "entities") {
        if (!isArray) return fail(localText("is an object, expected an array"));
        place_ = Place::blockEntities;
    } else {
        handled = false;
    }
    return true;
}

bool StreamParser::open(JsonKind kind) {
    if (open_.size() == kDeepest)
        return fail(localText("is nested too deeply, expected at most 200 levels"));
    if (open_.empty()) {
        bool handled = false;
        if (!openPlace(kind, handled)) return false;
        if (handled) return true;
    }
    open_.emplace_back(key_, JsonValue());
    open_.back().second.kind = kind;
    open_.back().second.line = source_.line();
    return true;
}

bool StreamParser::close() {
    if (!open_.empty()) {
        auto [name, value] = std::move(open_.back());
        open_.pop_back();
        key_ = std::move(name);
        if (JsonValue const* const twice = secondOfName(value, key_)) {
            result_.failed = true;
            result_.problem = {twice->line, key_, localText(kTwice)};
            return false;
        }
        return deliver(std::move(value));
    }
    switch (place_) {
    case Place::blockEntities: place_ = Place::block; break;
    case Place::block: place_ = Place::blocks; return hand(sink_.endBlock());
    case Place::entities:
    case Place::blocks: place_ = Place::drawing; break;
    default: place_ = Place::end; break;
    }
    return true;
}

StreamResult readStream(std::FILE* file, DrawingSink& sink) {
    JsonSource source(file);
    StreamParser parser(source, sink);
    bool const isRead = nlohmann::json::sax_parse(source.begin(), source.end(), &parser);
    StreamResult result = parser.take();
    if (source.failed()) {
        result.failed = true;
        result.problem = {source.line(), "", localText("cannot be read") + ": " + systemReason()};
    } else if (!isRead && !result.failed && !result.stopped) {
        result.failed = true;
        result.problem = {source.line(), "", localText("is no JSON")};
    }
    return result;
}

}  // namespace tzhost::drawingfile
