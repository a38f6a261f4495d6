#include "host/command_line/sent_strings.h"

namespace tzhost {

namespace {

constexpr wchar_t kCancelCharacter = 3;

// The length of the first answer, what ends it left out.
std::size_t lengthOfFirst(std::wstring_view text) {
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == L'\n' || text[i] == L'\r' || text[i] == kCancelCharacter) return i;
        if (text[i] == L' ' && (i == 0 || text[i - 1] != L',')) return i;
    }
    return text.size();
}

}  // namespace

Answer SentStrings::next() {
    if (rest_.empty()) return {};
    if (rest_.front() == kCancelCharacter) {
        rest_.erase(0, 1);
        return {Answer::Kind::cancel, {}};
    }
    std::size_t const length = lengthOfFirst(rest_);
    Answer answer{Answer::Kind::line, rest_.substr(0, length)};
    if (rest_.compare(length, 2, L"\r\n") == 0) {
        rest_.erase(0, length + 2);
    } else {
        bool const isCancelled = length < rest_.size() && rest_[length] == kCancelCharacter;
        rest_.erase(0, isCancelled ? length : length + 1);
    }
    if (answer.text.size() > kLongestAnswer) return {Answer::Kind::tooLong, {}};
    return answer;
}

}  // namespace tzhost
