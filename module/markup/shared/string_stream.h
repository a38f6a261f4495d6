#pragma once

#include <string_view>

#include "tz/text/std_str.h"

// The growing text that a conversion writes.
//
//   CStringStream out;
//   out.Append(L"\\par ");
//   CStdStrW const& text = out.Close();   // nothing is appended any more, unless it grows again
//
// Capacity is counted in steps of 1024 characters; the memory beneath grows as the string does.
class CStringStream {
public:
    CStringStream() { Grow(); }
    virtual ~CStringStream() = default;
    CStringStream(CStringStream const&) = delete;
    CStringStream& operator=(CStringStream const&) = delete;

    void Append(wchar_t const* text) { Append(std::wstring_view(text)); }
    // `text` must not be part of the stream's own.
    void Append(std::wstring_view text);
    void Append(wchar_t c);
    // The text; a second call changes nothing. It lives as long as the stream.
    CStdStrW& Close();
    // Opens the stream again if it is closed, and adds a step of capacity.
    void Grow();
    // Takes memory for a text of that many characters at once.
    void reserve(std::size_t length) { m_sBuffer.reserve(length); }

    [[nodiscard]] int capacity() const { return m_nCapacity; }
    [[nodiscard]] bool isOpen() const { return m_pNext != nullptr; }

private:
    void setLength();

    CStdStrW m_sBuffer;
    int m_nCapacity = 0;
    int m_nLength = 0;
    wchar_t* m_pNext = nullptr;  // after the last character; null while the stream is closed
};
