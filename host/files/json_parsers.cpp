#include "host/files/json_parsers.h"

#include <charconv>
#include <cmath>
#include <cstdlib>
#include <iterator>
#include <new>

#include <nlohmann/json.hpp>
#include <rapidjson/reader.h>

#include "host/text/filled.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

// Memory for the fast parser that throws when it runs short, which the library does not look at.
struct Memory {
    void* Malloc(std::size_t size) { return Realloc(nullptr, 0, size); }
    void* Realloc(void* old, std::size_t /*oldSize*/, std::size_t size) {
        void* const made = size > 0 ? std::realloc(old, size) : nullptr;
        if (size > 0 && made == nullptr) throw std::bad_alloc();
        if (size == 0) std::free(old);
        return made;
    }
    static void Free(void* old) { std::free(old); }
};

// The source as the fast parser's stream.
struct Stream {
    using Ch = char;
    JsonSource& source;

    char Peek() { return source.peek(); }
    char Take() { return source.take(); }
    [[nodiscard]] std::size_t Tell() const { return 0; }
    // For streams that are written to; the parser names them.
    char* PutBegin() { return nullptr; }
    void Put(char) {}
    void Flush() {}
    std::size_t PutEnd(char*) { return 0; }
};

// The nearest double, as the careful parser reads it; infinite beyond doubles.
double numberOf(std::string_view digits) {
    double value = 0.0;
    auto const [end, problem] =
        std::from_chars(digits.data(), digits.data() + digits.size(), value);
    if (problem == std::errc()) return value;
    return std::strtod(std::string(digits).c_str(), nullptr);  // too small or too large
}

// Half of a pair that was escaped alone: no UTF-8, and the one such text that the fast parser
// makes.
bool holdsHalfPair(std::string_view text) {
    constexpr char kLead = '\xED';
    for (std::size_t at = text.find(kLead); at != text.npos; at = text.find(kLead, at + 1)) {
        if (at + 1 < text.size() && static_cast<unsigned char>(text[at + 1]) >= 0xA0) return true;
    }
    return false;
}

// Hands the fast parser's events over and counts them.
class FastEvents {
public:
    explicit FastEvents(JsonEvents& events) : events_(events) {}

    [[nodiscard]] std::size_t count() const { return count_; }
    // Whether whoever takes the events stopped the parser.
    [[nodiscard]] bool stopped() const { return stopped_; }

    bool Null() { return after(events_.null()); }
    bool Bool(bool value) { return after(events_.flag(value)); }
    bool RawNumber(char const* digits, unsigned size, bool) {
        std::string_view const text(digits, size);
        double const value = numberOf(text);
        if (std::isinf(value)) return false;
        // A whole number has no sign of its zero.
        return after(events_.number(text == "-0" ? 0.0 : value, text == "-0" ? "0" : text));
    }
    bool String(char const* text, unsigned size, bool) {
        std::string_view const utf8(text, size);
        return !holdsHalfPair(utf8) && after(events_.text(utf8));
    }
    bool Key(char const* text, unsigned size, bool) {
        std::string_view const utf8(text, size);
        return !holdsHalfPair(utf8) && after(events_.key(utf8));
    }
    bool StartObject() { return after(events_.open(JsonKind::object)); }
    bool EndObject(unsigned) { return after(events_.close()); }
    bool StartArray() { return after(events_.open(JsonKind::array)); }
    bool EndArray(unsigned) { return after(events_.close()); }
    // Numbers come as digits.
    bool Int(int) { return false; }
    bool Uint(unsigned) { return false; }
    bool Int64(std::int64_t) { return false; }
    bool Uint64(std::uint64_t) { return false; }
    bool Double(double) { return false; }

private:
    bool after(bool goesOn) {
        ++count_;
        stopped_ = !goesOn;
        return goesOn;
    }

    JsonEvents& events_;
    std::size_t count_ = 0;
    bool stopped_ = false;
};

// The characters of a source as an input iterator; all copies stand at the same one.
class Characters {
public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = char const*;
    using reference = char;

    explicit Characters(JsonSource* source = nullptr) : source_(source) {}
    reference operator*() const { return source_->peek(); }
    Characters& operator++() {
        (void)source_->take();
        return *this;
    }
    Characters operator++(int) {
        Characters const before = *this;
        ++*this;
        return before;
    }
    // Only the end is told apart from other places.
    [[nodiscard]] bool operator==(Characters const& other) const {
        return isEnd() == other.isEnd();
    }
    [[nodiscard]] bool operator!=(Characters const& other) const { return !(*this == other); }

private:
    [[nodiscard]] bool isEnd() const { return !source_ || source_->atEnd(); }

    JsonSource* source_;
};

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

// What its sentences are put together of: whole ones before those that have parts.
constexpr char const* kSentences[] = {
    forLocalText("end of input"),
    forLocalText("true literal"),
    forLocalText("false literal"),
    forLocalText("null literal"),
    forLocalText("string literal"),
    forLocalText("number literal"),
    forLocalText("'[', '{', or a literal"),
    forLocalText("digit after '-'"),
    forLocalText("digit after '.'"),
    forLocalText("digit after exponent sign"),
    forLocalText("'+', '-', or digit after exponent"),
    forLocalText("invalid literal"),
    forLocalText("invalid number"),
    forLocalText("invalid string: missing closing quote"),
    forLocalText("invalid string: '\\u' must be followed by 4 hex digits"),
    forLocalText("invalid string: surrogate U+D800..U+DBFF must be followed by U+DC00..U+DFFF"),
    forLocalText("invalid string: surrogate U+DC00..U+DFFF must follow U+D800..U+DBFF"),
    forLocalText("invalid string: forbidden character after backslash"),
    forLocalText("%s; expected %s"),
    forLocalText("unexpected %s"),
    forLocalText("invalid string: control character %s must be escaped to %s"),
    forLocalText("%s or %s"),
};

std::string inWords(std::string const& sentence) {
    return localMessage(sentence, kSentences, inWords);
}

std::string explain(nlohmann::json::exception const& error) {
    std::string_view const message = error.what();
    if (message.find("UTF-8") != message.npos)
        return localText("is not UTF-8, expected UTF-8 text");
    if (message.find("out_of_range") != message.npos) {
        return localText("is too large a number, expected one below 1.8e308");
    }
    return localText("is no JSON here: ") + inWords(sentenceOf(message));
}

// Hands the careful parser's events over, but for the first `known` of them.
class CarefulEvents {
public:
    using Json = nlohmann::json;

    CarefulEvents(JsonEvents& events, std::size_t known) : events_(events), known_(known) {}

    bool null() { return isKnown() || events_.null(); }
    bool boolean(bool value) { return isKnown() || events_.flag(value); }
    bool number_integer(Json::number_integer_t number) { return whole(number); }
    bool number_unsigned(Json::number_unsigned_t number) { return whole(number); }
    bool number_float(double number, std::string const& digits) {
        return isKnown() || events_.number(number, digits);
    }
    bool string(std::string const& text) { return isKnown() || events_.text(text); }
    bool binary(Json::binary_t const&) { return false; }
    bool key(std::string const& name) { return isKnown() || events_.key(name); }
    bool start_object(std::size_t) { return isKnown() || events_.open(JsonKind::object); }
    bool end_object() { return isKnown() || events_.close(); }
    bool start_array(std::size_t) { return isKnown() || events_.open(JsonKind::array); }
    bool end_array() { return isKnown() || events_.close(); }
    bool parse_error(std::size_t, std::string const&, Json::exception const& error) {
        return events_.fail(explain(error));
    }

private:
    bool isKnown() {
        if (known_ == 0) return false;
        --known_;
        return true;
    }
    template <class Number>
    bool whole(Number number) {
        return isKnown() || events_.number(static_cast<double>(number), std::to_string(number));
    }

    JsonEvents& events_;
    std::size_t known_;
};

// Whether the document begins as the careful parser takes it: with a byte order mark, a part of
// one, or neither.
void skipByteOrderMark(JsonSource& source) {
    for (char const c : {'\xEF', '\xBB', '\xBF'}) {
        if (source.peek() != c) return;
        (void)source.take();
    }
}

}  // namespace

// The library calls itself for each level; the events refuse more than some 200.
bool parseJson(JsonSource& source, JsonEvents& events) {
    constexpr unsigned kHow = rapidjson::kParseNumbersAsStringsFlag;
    using Utf8 = rapidjson::UTF8<>;
    Memory memory;
    rapidjson::GenericReader<Utf8, Utf8, Memory> reader(&memory);
    Stream stream{source};
    FastEvents fast(events);
    skipByteOrderMark(source);
    bool const isWhole = !reader.Parse<kHow>(stream, fast).IsError() && !source.isCut();
    if (isWhole || fast.stopped() || source.failed()) return isWhole;
    source.startAnew();
    CarefulEvents careful(events, fast.count());
    return nlohmann::json::sax_parse(Characters(&source), Characters(), &careful);
}

}  // namespace tzhost
