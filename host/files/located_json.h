#pragma once

// A JSON document whose values know their line, for short files that people write by hand: a
// complaint about a value can say where it stands. Files of many entries are better read as a
// stream over a LineCounter.
//
//   LocatedJson::Result const read = LocatedJson::read(bytes);
//   if (!read.error.empty()) complain(file, read.line, read.error);
//   if (LocatedJson const* const color = read.root.find("color")) ...

#include <cstddef>
#include <iterator>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace tzhost {

// Reads characters for a parser and knows the line of the last one that was not a line end.
// The copies of an iterator share their counter, which outlives them.
class LineCounter {
public:
    explicit LineCounter(std::string_view bytes) : bytes_(bytes) {}
    // The line of the last character read, from 1.
    [[nodiscard]] int line() const { return line_; }

    class Iterator {
    public:
        using iterator_category = std::input_iterator_tag;
        using value_type = char;
        using difference_type = std::ptrdiff_t;
        using pointer = char const*;
        using reference = char const&;

        Iterator(LineCounter* counter, std::size_t at) : counter_(counter), at_(at) {}
        reference operator*() const { return counter_->read(at_); }
        Iterator& operator++() {
            ++at_;
            return *this;
        }
        Iterator operator++(int) {
            Iterator const before = *this;
            ++at_;
            return before;
        }
        [[nodiscard]] bool operator==(Iterator const& other) const { return at_ == other.at_; }
        [[nodiscard]] bool operator!=(Iterator const& other) const { return at_ != other.at_; }

    private:
        LineCounter* counter_;
        std::size_t at_;
    };

    [[nodiscard]] Iterator begin() { return {this, 0}; }
    [[nodiscard]] Iterator end() { return {this, bytes_.size()}; }

private:
    [[nodiscard]] char const& read(std::size_t at);

    std::string_view bytes_;
    std::size_t counted_ = 0;  // characters before this one are counted
    int line_ = 1;
    int ends_ = 0;  // line ends after the last character
};

class LocatedJson {
public:
    enum class Kind { null, boolean, number, text, array, object };

    struct Result;
    // Never fails but for memory: what is wrong stands in the result. Objects with the same member
    // twice are refused, and so is nesting beyond 64 levels.
    [[nodiscard]] static Result read(std::string_view bytes);

    [[nodiscard]] Kind kind() const { return kind_; }
    [[nodiscard]] int line() const { return line_; }
    [[nodiscard]] bool boolean() const { return boolean_; }
    [[nodiscard]] double number() const { return number_; }
    [[nodiscard]] std::string const& text() const { return text_; }  // UTF-8
    // Elements of an array.
    [[nodiscard]] std::vector<LocatedJson> const& items() const { return items_; }
    // Members of an object, as the file orders them.
    using Member = std::pair<std::string, LocatedJson>;
    [[nodiscard]] std::vector<Member> const& members() const { return members_; }
    // The member of that name, or null.
    [[nodiscard]] LocatedJson const* find(std::string_view name) const;

private:
    friend class LocatedJsonBuilder;

    Kind kind_ = Kind::null;
    int line_ = 1;
    bool boolean_ = false;
    double number_ = 0;
    std::string text_;
    std::vector<LocatedJson> items_;
    std::vector<Member> members_;
};

struct LocatedJson::Result {
    LocatedJson root;
    std::string error;  // empty: the document was read
    int line = 0;       // of the error
};

// What a kind is called in a complaint: "a number".
[[nodiscard]] std::string nameOf(LocatedJson::Kind kind);

}  // namespace tzhost
