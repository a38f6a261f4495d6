#pragma once

#include <cstdint>

// A tracing aid for developers: writes to the debug output how long a block took, and indents
// nested blocks. The module makes none: a developer who measures a block puts one into it for a
// while.
//
//   CElapsedTime const timer(L"LoadContents");
//   timer.Mark(L"files read");
//
// Times are milliseconds of the host's tick counter. Not thread-safe.
class CElapsedTime {
public:
    // Marks the begin; `label` must outlive the object.
    explicit CElapsedTime(wchar_t const* blockLabel);
    CElapsedTime(CElapsedTime const&) = delete;
    CElapsedTime& operator=(CElapsedTime const&) = delete;
    // Marks the end.
    virtual ~CElapsedTime();

    // Prints the label, `text` (null reads as "none"), the time, and how much of it passed since
    // the last mark of any object, since the last mark of this one and since its begin.
    void Mark(wchar_t const* text);
    // Sends an indented line to the debug output.
    void PrintMessage(wchar_t const* text) const;

    static std::uint32_t m_uInstanceCount;
    static std::uint32_t m_dwLastMark;  // 0 before the first mark of the process

private:
    wchar_t const* label;
    std::uint32_t startTick;
    std::uint32_t lastTick;
    std::uint32_t depth;
};
