#include "host/drawing_file/json_source.h"

#include <utility>

namespace tzhost::drawingfile {

namespace {
constexpr std::size_t kBlockSize = std::size_t{1} << 16;
}

JsonSource::JsonSource(std::FILE* file) : file_(file) {}

bool JsonSource::atEnd() {
    if (at_ < block_.size()) return false;
    at_ = 0;
    block_.resize(kBlockSize);
    block_.resize(std::fread(block_.data(), 1, kBlockSize, file_));
    return block_.empty();
}

char const& JsonSource::current() {
    char const& c = block_[at_];
    if (!std::exchange(counted_, true)) {
        if (std::exchange(lineEnded_, c == '\n')) ++line_;
    }
    return c;
}

void JsonSource::next() {
    ++at_;
    counted_ = false;
}

}  // namespace tzhost::drawingfile
