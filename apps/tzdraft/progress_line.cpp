#include "apps/tzdraft/progress_line.h"

#include <algorithm>
#include <utility>

#include "host/text/utf8.h"
#include "tz/text/string.h"

namespace tzdraft {

namespace {

constexpr std::chrono::milliseconds kPatience(1000);
constexpr std::chrono::milliseconds kPause(100);  // between two lines

std::wstring lineOf(wchar_t const* job, std::size_t done, std::size_t total) {
    if (total == 0) return TzString::formatted(L"%ls: %zu", job, done).str();
    constexpr std::size_t kWhole = 100;
    int const percent = static_cast<int>(std::min(done, total) * kWhole / total);
    return TzString::formatted(L"%ls: %d %%", job, percent).str();
}

}  // namespace

ProgressLine::ProgressLine(std::function<void(std::string_view)> write,
                           std::function<void()> toLineStart,
                           std::function<Clock::time_point()> now)
    : write_(std::move(write)), toLineStart_(std::move(toLineStart)), now_(std::move(now)) {}

void ProgressLine::began() {
    next_ = now_() + kPatience;
}

void ProgressLine::reached(wchar_t const* job, std::size_t done, std::size_t total) {
    Clock::time_point const now = now_();
    if (now < next_) return;
    next_ = now + kPause;
    show(lineOf(job, done, total));
}

// Blanks cover what is left of a longer line before.
void ProgressLine::show(std::wstring const& text) {
    if (width_ == 0) toLineStart_();
    std::size_t const covered = std::max(width_, text.size());
    std::wstring const line = text + std::wstring(covered - text.size(), L' ');
    width_ = text.size();
    write_("\r" + tzhost::toUtf8(line));
}

void ProgressLine::clear() noexcept try {
    if (width_ == 0) return;
    std::string const blanks(std::exchange(width_, 0), ' ');
    write_("\r" + blanks + "\r");
} catch (std::bad_alloc const&) {
    return;  // the line stays until another is written over it
}

}  // namespace tzdraft
