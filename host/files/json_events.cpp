#include "host/files/json_events.h"

#include <algorithm>
#include <iterator>
#include <string_view>

#include "host/files/file_bytes.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

constexpr std::size_t kDeepest = 200;

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

// Keeps the one value of a document.
class DocumentReader final : public JsonEvents {
public:
    using JsonEvents::JsonEvents;
    [[nodiscard]] JsonValue takeRoot() { return std::move(root_); }

protected:
    bool take(JsonValue value) override {
        root_ = std::move(value);
        return true;
    }

private:
    JsonValue root_;
};

}  // namespace

bool JsonEvents::readAll() {
    bool const isRead = nlohmann::json::sax_parse(source_.begin(), source_.end(), this);
    if (source_.failed()) {
        failed_ = true;
        problem_ = {source_.line(), "", localText("cannot be read") + ": " + systemReason()};
    }
    return isRead && !failed_;
}

bool JsonEvents::boolean(bool flag) {
    JsonValue value;
    value.kind = JsonKind::flag;
    value.flag = flag;
    return scalar(std::move(value));
}

bool JsonEvents::string(string_t& text) {
    JsonValue value;
    value.kind = JsonKind::text;
    value.text = std::move(text);
    return scalar(std::move(value));
}

bool JsonEvents::numberValue(double number, std::string digits) {
    JsonValue value;
    value.kind = JsonKind::number;
    value.number = number;
    value.text = std::move(digits);
    return scalar(std::move(value));
}

bool JsonEvents::key(string_t& name) {
    key_ = std::move(name);
    return !open_.empty() || enterMember();
}

bool JsonEvents::parse_error(std::size_t,
                             std::string const&,
                             nlohmann::json::exception const& error) {
    return fail(explain(error));
}

bool JsonEvents::fail(std::string what) {
    failed_ = true;
    problem_ = {source_.line(), key_, std::move(what)};
    return false;
}

bool JsonEvents::failTwiceAt(int line) {
    (void)fail(localText("stands twice, expected each member once"));
    problem_.line = line;
    return false;
}

bool JsonEvents::deliver(JsonValue value) {
    if (open_.empty()) return take(std::move(value));
    JsonValue& outer = open_.back().second;
    if (outer.kind == JsonKind::array) {
        outer.items.push_back(std::move(value));
    } else {
        outer.members.push_back({key_, std::move(value)});
    }
    return true;
}

bool JsonEvents::scalar(JsonValue value) {
    value.line = source_.line();
    if (open_.empty() && !allow(value)) return false;
    return deliver(std::move(value));
}

bool JsonEvents::open(JsonKind kind) {
    if (open_.size() == kDeepest)
        return fail(localText("is nested too deeply, expected at most 200 levels"));
    bool walked = false;
    if (open_.empty() && !enter(kind, walked)) return false;
    if (walked) return true;
    open_.emplace_back(key_, JsonValue());
    open_.back().second.kind = kind;
    open_.back().second.line = source_.line();
    return true;
}

bool JsonEvents::close() {
    if (open_.empty()) return leave();
    auto [name, value] = std::move(open_.back());
    open_.pop_back();
    key_ = std::move(name);
    if (JsonValue const* const twice = secondOfName(value, key_)) return failTwiceAt(twice->line);
    return deliver(std::move(value));
}

JsonDocument readJson(std::string_view bytes) {
    JsonSource source(bytes);
    DocumentReader reader(source);
    JsonDocument document;
    document.failed = !reader.readAll();
    document.problem = reader.problem();
    if (!document.failed) document.root = reader.takeRoot();
    return document;
}

}  // namespace tzhost
