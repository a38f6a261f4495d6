#include "host/files/json_source.h"

#include <cstring>

#include "host/text/utf8.h"

namespace tzhost {

namespace {

constexpr std::size_t kBlockSize = std::size_t{1} << 16;
constexpr std::size_t kLongestCharacter = 4;

char const* firstLineEnd(char const* from, char const* end) {
    void const* const found = std::memchr(from, '\n', static_cast<std::size_t>(end - from));
    return found ? static_cast<char const*>(found) : end;
}

}  // namespace

JsonSource::JsonSource(std::FILE* file)
    : file_(file), start_(std::ftell(file)), block_(new char[kBlockSize + 1]) {
    begin();
}

JsonSource::JsonSource(std::string_view bytes) : bytes_(bytes), block_(new char[kBlockSize + 1]) {
    begin();
}

void JsonSource::begin() {
    at_ = end_ = lineEnd_ = block_.get();
    hidden_.clear();
    block_[0] = '\0';
    isCut_ = false;
    line_ = 1;
}

void JsonSource::startAnew() {
    // A file that cannot go back seems to end, which its parser then complains about.
    if (file_ != nullptr) (void)std::fseek(file_, start_, SEEK_SET);
    next_ = 0;
    showsAll_ = true;
    begin();
}

int JsonSource::line() {
    while (lineEnd_ + 1 < at_) {
        ++line_;
        lineEnd_ = firstLineEnd(lineEnd_ + 1, end_);
    }
    return line_;
}

std::size_t JsonSource::read(char* into, std::size_t size) {
    if (file_ != nullptr) return std::fread(into, 1, size, file_);
    std::size_t const count = bytes_.copy(into, size, next_);
    next_ += count;
    return count;
}

bool JsonSource::fill() {
    (void)line();
    bool const endedLine = lineEnd_ < end_;  // the last character shown
    while (at_ == end_ && !isCut_) {
        std::size_t const known = hidden_.copy(block_.get(), hidden_.size());
        hidden_.clear();
        std::size_t const count = read(block_.get() + known, kBlockSize - known);
        at_ = block_.get();
        end_ = at_ + known + count;
        if (!showsAll_) hideBad(count == 0);
        if (known + count == 0) break;
    }
    block_[static_cast<std::size_t>(end_ - block_.get())] = '\0';
    lineEnd_ = firstLineEnd(at_, end_);
    if (at_ == end_) return false;
    if (endedLine) ++line_;
    return true;
}

void JsonSource::hideBad(bool isLast) {
    std::string_view const block(at_, static_cast<std::size_t>(end_ - at_));
    std::size_t const bad = firstBadByte(block);
    if (bad == kAllUtf8) return;
    end_ = at_ + bad;
    // The rest of an unfinished character may come with the next block.
    isCut_ = isLast || block.size() - bad >= kLongestCharacter;
    if (!isCut_) hidden_ = block.substr(bad);
}

}  // namespace tzhost
