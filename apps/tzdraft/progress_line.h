#pragma once

#include <chrono>
#include <functional>
#include <string>
#include <string_view>

#include "host/base/job.h"

namespace tzdraft {

// The line at a terminal that tells how far a long job has come: "Saving: 45 %". A job of less than
// a second shows none. The line is written over itself and is gone at the end.
class ProgressLine final : public tzhost::JobWatcher {
public:
    using Clock = std::chrono::steady_clock;

    // `write` gets UTF-8; `toLineStart` brings the terminal's cursor to the start of a line.
    ProgressLine(std::function<void(std::string_view)> write,
                 std::function<void()> toLineStart,
                 std::function<Clock::time_point()> now = Clock::now);
    ProgressLine(ProgressLine const&) = delete;
    ProgressLine& operator=(ProgressLine const&) = delete;
    ~ProgressLine() override = default;

    void began() override;
    void reached(wchar_t const* job, std::size_t done, std::size_t total) override;
    void ended() noexcept override { clear(); }
    // Takes the line away, before anything else is shown.
    void clear() noexcept;

private:
    void show(std::wstring const& text);

    std::function<void(std::string_view)> write_;
    std::function<void()> toLineStart_;
    std::function<Clock::time_point()> now_;
    Clock::time_point next_;  // when the line may be written
    std::size_t width_ = 0;   // of the line that shows, in columns
};

}  // namespace tzdraft
