#include "module/markup/shared/string_stream.h"

#include <limits>
#include <stdexcept>

namespace {

constexpr int kStep = 1024;

}  // namespace

void CStringStream::Append(std::wstring_view text) {
    if (text.empty()) return;
    m_sBuffer.append(text);
    setLength();
}

void CStringStream::Append(wchar_t c) {
    m_sBuffer.push_back(c);
    setLength();
}

CStdStrW& CStringStream::Close() {
    m_pNext = nullptr;
    return m_sBuffer;
}

void CStringStream::Grow() {
    m_nCapacity += kStep;
    m_pNext = m_sBuffer.data() + m_sBuffer.size();
}

// Counts are 32-bit numbers: a longer text is refused as one that memory cannot hold.
void CStringStream::setLength() {
    if (m_sBuffer.size() > static_cast<std::size_t>(std::numeric_limits<int>::max() - kStep))
        throw std::length_error("CStringStream");
    m_nLength = static_cast<int>(m_sBuffer.size());
    m_pNext = m_sBuffer.data() + m_sBuffer.size();
    if (m_nLength > m_nCapacity)
        m_nCapacity =
            static_cast<int>((static_cast<unsigned int>(m_nLength) + kStep - 1) / kStep * kStep);
}
