#include "module/uncalled/elapsed_time.h"

#include "tz/pal/diagnostics.h"
#include "tz/pal/windows_calls.h"
#include "tz/text/string.h"

std::uint32_t CElapsedTime::m_uInstanceCount = 0;
std::uint32_t CElapsedTime::m_dwLastMark = 0;

CElapsedTime::CElapsedTime(wchar_t const* blockLabel)
    : label(blockLabel), startTick(GetTickCount()), lastTick(startTick), depth(m_uInstanceCount) {
    ++m_uInstanceCount;
    Mark(L"begin");
}

CElapsedTime::~CElapsedTime() {
    Mark(L"end");
    --m_uInstanceCount;
}

void CElapsedTime::Mark(wchar_t const* text) {
    auto const milliseconds = [](std::uint32_t ticks) { return static_cast<unsigned long>(ticks); };
    std::uint32_t const now = GetTickCount();
    if (m_dwLastMark == 0) m_dwLastMark = now;
    PrintMessage(TzString::formatted(L"%s (%s) %lu(+%lu) [%lu / %lu]", label, text ? text : L"none",
                                     milliseconds(now), milliseconds(now - m_dwLastMark),
                                     milliseconds(now - lastTick), milliseconds(now - startTick)));
    m_dwLastMark = now;
    lastTick = now;
}

void CElapsedTime::PrintMessage(wchar_t const* text) const {
    for (std::uint32_t level = 0; level < depth; ++level)
        OutputDebugString(L"  ");
    OutputDebugString(text);
    OutputDebugString(L"\n");
}
