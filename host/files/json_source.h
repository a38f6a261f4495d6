#pragma once

#include <cstddef>
#include <cstdio>
#include <iterator>
#include <string>
#include <string_view>

// The bytes of a file one after the other for a JSON parser, in blocks of a fixed size, with the
// line of the last one that was more than a line end: a parser reads one character past a number.
namespace tzhost {

class JsonSource {
public:
    // Does not own the file; it is read from where it stands.
    explicit JsonSource(std::FILE* file);
    // The bytes of a document that was read already.
    explicit JsonSource(std::string_view bytes);

    // The line of the last character read, from 1.
    [[nodiscard]] int line() const { return line_; }
    // Whether reading ended with an error of the system.
    [[nodiscard]] bool failed() const { return file_ != nullptr && std::ferror(file_) != 0; }

    // An input iterator; all copies stand at the same character.
    class Iterator {
    public:
        using iterator_category = std::input_iterator_tag;
        using value_type = char;
        using difference_type = std::ptrdiff_t;
        using pointer = char const*;
        using reference = char const&;

        explicit Iterator(JsonSource* source = nullptr) : source_(source) {}
        reference operator*() const { return source_->current(); }
        Iterator& operator++() {
            source_->next();
            return *this;
        }
        Iterator operator++(int) {
            Iterator const before = *this;
            source_->next();
            return before;
        }
        // Only the end is told apart from other places.
        [[nodiscard]] bool operator==(Iterator const& other) const {
            return isEnd() == other.isEnd();
        }
        [[nodiscard]] bool operator!=(Iterator const& other) const { return !(*this == other); }

    private:
        [[nodiscard]] bool isEnd() const { return !source_ || source_->atEnd(); }

        JsonSource* source_;
    };

    [[nodiscard]] Iterator begin() { return Iterator(this); }
    [[nodiscard]] Iterator end() { return Iterator(); }

private:
    [[nodiscard]] bool atEnd();
    [[nodiscard]] char const& current();
    void next();

    std::FILE* file_ = nullptr;  // null when the block holds all
    std::string block_;
    std::size_t at_ = 0;      // of the current character in the block
    bool counted_ = false;    // the current character is counted
    bool lineEnded_ = false;  // the last character counted was a line end
    int line_ = 1;
};

}  // namespace tzhost
