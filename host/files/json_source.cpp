#include "host/files/json_source.h"

#include <utility>

namespace tzhost {

namespace {
constexpr std::size_t kBlockSize = std::size_t{1} << 16;
}

JsonSource::JsonSource(std::FILE* file) : file_(file) {}

JsonSource::JsonSource(std::string_view bytes) : block_(bytes) {}

bool JsonSource::atEnd() {
    if (at_ < block_.size()) return false;
    if (file_ == nullptr) return true;
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

}  // namespace tzhost
