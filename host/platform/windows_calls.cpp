#include "tz/pal/windows_calls.h"

#include <chrono>
#include <climits>
#include <cstdlib>
#include <cwchar>

#include "host/base/fault_point.h"
#include "host/platform/desktop.h"
#include "tz/text/string.h"

// A window is one of the screen's rectangles.
struct TzWindow {
    RECT tzhost::Screen::*rectangle;
};

namespace {

constexpr TzWindow kDesktop{&tzhost::Screen::desktop};
constexpr TzWindow kApplication{&tzhost::Screen::application};
constexpr TzWindow kDrawingArea{&tzhost::Screen::drawingArea};

// The codes of StringFromCLSID for a wrong argument and for no memory.
constexpr int kInvalidArgument = static_cast<int>(0x80070057U);
constexpr int kOutOfMemory = static_cast<int>(0x8007000EU);

}  // namespace

tzhost::Screen& tzhost::screen() {
    static Screen numbers;
    return numbers;
}

HWND GetDesktopWindow() {
    return &kDesktop;
}

HWND GetApplicationWindow() {
    return &kApplication;
}

HWND GetDrawingAreaWindow() {
    return &kDrawingArea;
}

int GetWindowRect(HWND window, RECT* rect) {
    if (tzhost::faultAt("GetWindowRect") || window == nullptr || rect == nullptr) return 0;
    *rect = tzhost::screen().*window->rectangle;
    return 1;
}

int ClientToScreen(HWND window, POINT* point) {
    if (tzhost::faultAt("ClientToScreen") || window == nullptr || point == nullptr) return 0;
    RECT const& rect = tzhost::screen().*window->rectangle;
    point->x += rect.left;
    point->y += rect.top;
    return 1;
}

std::uint32_t GetTickCount() {
    using Clock = std::chrono::steady_clock;
    static Clock::time_point const start = Clock::now();
    auto const since = std::chrono::duration_cast<std::chrono::milliseconds>(Clock::now() - start);
    return static_cast<std::uint32_t>(since.count());
}

int MulDiv(int number, int numerator, int denominator) {
    if (denominator == 0) return -1;
    long long const product = static_cast<long long>(number) * numerator;
    long long const divisor = denominator < 0 ? -static_cast<long long>(denominator) : denominator;
    long long const half = product < 0 ? -(divisor / 2) : divisor / 2;
    long long const quotient = (product + half) / divisor;
    long long const result = denominator < 0 ? -quotient : quotient;
    return result < INT_MIN || result > INT_MAX ? -1 : static_cast<int>(result);
}

int CloseHandle(void* handle) {
    if (tzhost::faultAt("CloseHandle")) return 0;
    constexpr auto kInvalid = static_cast<std::uintptr_t>(-1);
    return handle != nullptr && reinterpret_cast<std::uintptr_t>(handle) != kInvalid ? 1 : 0;
}

int StringFromCLSID(_GUID const& id, wchar_t** text) {
    if (text == nullptr) return kInvalidArgument;
    *text = nullptr;
    if (auto const fault = tzhost::faultAt("StringFromCLSID", kOutOfMemory)) return *fault;
    std::uint8_t const* const d = id.Data4;
    TzString const form =
        TzString::formatted(L"{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}", id.Data1,
                            id.Data2, id.Data3, d[0], d[1], d[2], d[3], d[4], d[5], d[6], d[7]);
    std::size_t const size = form.str().size() + 1;
    *text = static_cast<wchar_t*>(std::malloc(size * sizeof(wchar_t)));
    if (*text == nullptr) return kOutOfMemory;
    std::wmemcpy(*text, form.kwszPtr(), size);
    return 0;
}

void CoTaskMemFree(void* memory) {
    std::free(memory);
}
