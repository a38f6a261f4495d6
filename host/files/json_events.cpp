#include "host/files/json_events.h"

#include <algorithm>
#include <bitset>
#include <iterator>

#include "host/files/file_bytes.h"
#include "host/files/json_parsers.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

constexpr std::size_t kDeepest = 200;

// Whether names that may be the same make it necessary to compare them: names with different sums
// are different.
bool mayHoldTwins(JsonList<JsonMember> const& members) {
    constexpr std::size_t kSums = 4096;
    std::bitset<kSums> sums;
    for (auto const& [name, value] : members) {
        std::size_t sum = name.size();
        for (char const c : name)
            sum = sum * 33 + static_cast<unsigned char>(c);
        if (sums.test(sum % kSums)) return true;
        sums.set(sum % kSums);
    }
    return false;
}

// The second value of a name that an object has twice, and that name; null when there is none.
JsonMember const* secondOfName(JsonList<JsonMember> const& members) {
    if (!mayHoldTwins(members)) return nullptr;
    using Member = JsonMember const*;
    std::vector<Member> sorted;
    sorted.reserve(members.size());
    for (auto const& member : members)
        sorted.push_back(&member);
    std::stable_sort(sorted.begin(), sorted.end(),
                     [](Member a, Member b) { return a->first < b->first; });
    auto const at = std::adjacent_find(sorted.begin(), sorted.end(),
                                       [](Member a, Member b) { return a->first == b->first; });
    return at == sorted.end() ? nullptr : *std::next(at);
}

// Keeps the one value of a document.
class DocumentReader final : public JsonEvents {
public:
    using JsonEvents::JsonEvents;
    [[nodiscard]] JsonValue const& root() const { return root_; }

protected:
    bool take(JsonValue const& value) override {
        root_ = value;
        return true;
    }

private:
    JsonValue root_;
};

}  // namespace

bool JsonEvents::readAll() {
    bool const isRead = parseJson(source_, *this);
    if (source_.failed()) {
        failed_ = true;
        problem_ = {source_.line(), "", localText("cannot be read") + ": " + systemReason()};
    }
    return isRead && !failed_;
}

bool JsonEvents::flag(bool value) {
    JsonValue made;
    made.kind = JsonKind::flag;
    made.flag = value;
    return scalar(made);
}

bool JsonEvents::text(std::string_view utf8) {
    JsonValue value;
    value.kind = JsonKind::text;
    value.text = store_.keep(utf8);
    return scalar(value);
}

bool JsonEvents::number(double value, std::string_view digits) {
    JsonValue made;
    made.kind = JsonKind::number;
    made.number = value;
    made.text = store_.keep(digits);
    return scalar(made);
}

bool JsonEvents::key(std::string_view name) {
    if (!open_.empty()) {
        key_ = store_.keep(name);
        return true;
    }
    walkedKey_ = name;
    key_ = walkedKey_;
    return enterMember();
}

bool JsonEvents::fail(std::string what) {
    failed_ = true;
    problem_ = {source_.line(), std::string(key_), std::move(what)};
    return false;
}

bool JsonEvents::failTwiceAt(int line) {
    (void)fail(localText("stands twice, expected each member once"));
    problem_.line = line;
    return false;
}

bool JsonEvents::deliver(JsonValue const& value) {
    if (open_.empty()) return take(value);
    pending_.push_back({key_, value});
    return true;
}

bool JsonEvents::scalar(JsonValue value) {
    value.line = source_.line();
    if (open_.empty() && !allow(value)) return false;
    return deliver(value);
}

bool JsonEvents::open(JsonKind kind) {
    if (open_.size() == kDeepest)
        return fail(localText("is nested too deeply, expected at most 200 levels"));
    bool walked = false;
    if (open_.empty() && !enter(kind, walked)) return false;
    if (!walked) open_.push_back({key_, kind, source_.line(), pending_.size()});
    return true;
}

bool JsonEvents::close() {
    if (open_.empty()) return leave();
    Open const closed = open_.back();
    open_.pop_back();
    JsonValue value;
    value.kind = closed.kind;
    value.line = closed.line;
    JsonMember const* const parts = pending_.data() + closed.first;
    std::size_t const count = pending_.size() - closed.first;
    if (closed.kind == JsonKind::object) {
        value.members = store_.keep(parts, count);
    } else {
        items_.clear();
        std::transform(parts, parts + count, std::back_inserter(items_),
                       [](JsonMember const& part) { return part.second; });
        value.items = store_.keep(items_.data(), count);
    }
    pending_.resize(closed.first);
    if (JsonMember const* const twice = secondOfName(value.members)) {
        key_ = twice->first;
        return failTwiceAt(twice->second.line);
    }
    key_ = closed.key;
    return deliver(value);
}

JsonDocument readJson(std::string_view bytes) {
    JsonSource source(bytes);
    JsonDocument document;
    DocumentReader reader(source, *document.store);
    document.failed = !reader.readAll();
    document.problem = reader.problem();
    if (!document.failed) document.root = reader.root();
    return document;
}

}  // namespace tzhost
