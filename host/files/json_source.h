#pragma once

#include <cstddef>
#include <cstdio>
#include <memory>
#include <string>
#include <string_view>

// The bytes of a file one after the other for a JSON parser, in blocks of a fixed size, with the
// line of the last one: a line end itself still belongs to the line that it ends, since a parser
// reads one character past a number.
//
// It is read in one of two ways. At first only whole characters of UTF-8 are shown, so that a
// parser need not look: the bytes end before the first that is none. After `startAnew` it begins
// again with every byte as it stands.
namespace tzhost {

class JsonSource {
public:
    // Does not own the file; it is read from where it stands, and has a place to go back to.
    explicit JsonSource(std::FILE* file);
    // The bytes of a document that was read already.
    explicit JsonSource(std::string_view bytes);

    // The line of the last character taken, from 1.
    [[nodiscard]] int line();
    // Whether reading ended with an error of the system.
    [[nodiscard]] bool failed() const { return file_ != nullptr && std::ferror(file_) != 0; }
    // Whether all was taken up to a byte that is no UTF-8.
    [[nodiscard]] bool isCut() const { return isCut_ && at_ == end_; }
    void startAnew();

    // What a parser calls: the next character, 0 at the end, and the same taken.
    [[nodiscard]] char peek() { return *at_ != 0 || !atEnd() ? *at_ : '\0'; }
    char take() { return *at_++; }
    // Tells a zero character from the end.
    [[nodiscard]] bool atEnd() { return at_ == end_ && !fill(); }

private:
    // Gets the next block; false when there is none.
    bool fill();
    // Hides what is no whole character of UTF-8 at the end of the block.
    void hideBad(bool isLast);
    void begin();
    [[nodiscard]] std::size_t read(char* into, std::size_t size);

    std::FILE* file_ = nullptr;  // null when `bytes_` holds all
    long start_ = 0;             // of the document in the file
    std::string_view bytes_;
    std::size_t next_ = 0;  // of `bytes_`
    bool showsAll_ = false;
    bool isCut_ = false;
    std::unique_ptr<char[]> block_;
    char const* at_;       // the next character; a zero character follows the last one
    char const* end_;      // of what is shown
    std::string hidden_;   // the start of a character that ends in the next block
    char const* lineEnd_;  // the first line end of the block that is not counted yet, or end_
    int line_ = 1;
};

}  // namespace tzhost
