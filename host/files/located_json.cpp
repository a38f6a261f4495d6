#include "host/files/located_json.h"

#include "host/text/local_text.h"

#include <algorithm>

#include <nlohmann/json.hpp>

namespace tzhost {

namespace {
constexpr std::size_t kDeepest = 64;
}

char const& LineCounter::read(std::size_t at) {
    for (; counted_ <= at; ++counted_) {
        if (bytes_[counted_] == '\n') {
            ++ends_;
        } else {
            line_ += std::exchange(ends_, 0);
        }
    }
    return bytes_[at];
}

// Takes the parser's events and builds the document; false from an event stops the parser.
class LocatedJsonBuilder {
public:
    using number_integer_t = nlohmann::json::number_integer_t;
    using number_unsigned_t = nlohmann::json::number_unsigned_t;
    using number_float_t = nlohmann::json::number_float_t;
    using string_t = nlohmann::json::string_t;
    using binary_t = nlohmann::json::binary_t;

    explicit LocatedJsonBuilder(LineCounter& counter) : counter_(counter) {}

    bool null() { return place(LocatedJson::Kind::null) != nullptr; }
    bool boolean(bool value) {
        LocatedJson* const here = place(LocatedJson::Kind::boolean);
        if (here != nullptr) here->boolean_ = value;
        return here != nullptr;
    }
    bool number_integer(number_integer_t value) { return number(static_cast<double>(value)); }
    bool number_unsigned(number_unsigned_t value) { return number(static_cast<double>(value)); }
    bool number_float(number_float_t value, string_t const&) { return number(value); }
    bool string(string_t& value) {
        LocatedJson* const here = place(LocatedJson::Kind::text);
        if (here != nullptr) here->text_ = std::move(value);
        return here != nullptr;
    }
    bool binary(binary_t&) { return false; }
    bool start_object(std::size_t) { return open(LocatedJson::Kind::object); }
    bool start_array(std::size_t) { return open(LocatedJson::Kind::array); }
    bool end_object() { return close(); }
    bool end_array() { return close(); }
    bool key(string_t& name) {
        if (open_.back()->find(name) != nullptr) {
            return fail(localText("the member \"") + name + localText("\" stands here twice"));
        }
        key_ = std::move(name);
        return true;
    }
    bool parse_error(std::size_t, std::string const&, nlohmann::json::exception const& error) {
        // The parser's text begins with a number in brackets and the place, which are left out.
        std::string const text = error.what();
        std::size_t const colon = text.find(": ");
        return fail(colon == text.npos ? text : text.substr(colon + 2));
    }

    LocatedJson::Result take() { return std::move(result_); }

private:
    bool number(double value) {
        LocatedJson* const here = place(LocatedJson::Kind::number);
        if (here != nullptr) here->number_ = value;
        return here != nullptr;
    }

    bool open(LocatedJson::Kind kind) {
        if (open_.size() == kDeepest) return fail(localText("nested too deeply"));
        LocatedJson* const here = place(kind);
        if (here != nullptr) open_.push_back(here);
        return here != nullptr;
    }

    bool close() {
        open_.pop_back();
        return true;
    }

    // A new value where the document has grown to. Values that are open are the last of their
    // parents, so adding after the innermost one moves none of them.
    LocatedJson* place(LocatedJson::Kind kind) {
        LocatedJson* here = &result_.root;
        if (!open_.empty() && open_.back()->kind_ == LocatedJson::Kind::object) {
            here = &open_.back()->members_.emplace_back(std::move(key_), LocatedJson()).second;
        } else if (!open_.empty()) {
            here = &open_.back()->items_.emplace_back();
        }
        here->kind_ = kind;
        here->line_ = counter_.line();
        return here;
    }

    bool fail(std::string what) {
        result_.error = std::move(what);
        result_.line = counter_.line();
        return false;
    }

    LineCounter& counter_;
    LocatedJson::Result result_;
    std::vector<LocatedJson*> open_;
    std::string key_;
};

LocatedJson::Result LocatedJson::read(std::string_view bytes) {
    LineCounter counter(bytes);
    LocatedJsonBuilder builder(counter);
    bool const isRead = nlohmann::json::sax_parse(counter.begin(), counter.end(), &builder);
    Result result = builder.take();
    if (!isRead && result.error.empty()) result.error = localText("no JSON document");
    return result;
}

LocatedJson const* LocatedJson::find(std::string_view name) const {
    auto const at = std::find_if(members_.begin(), members_.end(),
                                 [name](Member const& each) { return each.first == name; });
    return at == members_.end() ? nullptr : &at->second;
}

std::string nameOf(LocatedJson::Kind kind) {
    switch (kind) {
    case LocatedJson::Kind::null: return "null";
    case LocatedJson::Kind::boolean: return localText("true or false");
    case LocatedJson::Kind::number: return localText("a number");
    case LocatedJson::Kind::text: return localText("a text");
    case LocatedJson::Kind::array: return localText("an array");
    case LocatedJson::Kind::object: break;
    }
    return localText("an object");
}

}  // namespace tzhost
