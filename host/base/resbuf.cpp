#include "tz/rx/resbuf.h"

#include <cwchar>
#include <memory>
#include <utility>

#include "host/base/fault_point.h"
#include "tz/rx/status.h"

namespace {

// Group codes below this one name texts of an entity: its kind, its name, its style and so on.
constexpr int kFirstGroupCodeOfNumbers = 10;

}  // namespace

bool tzutHoldsString(int type) {
    return type == Tzad::eResultString || type == Tzad::eResultEntityKind ||
           (type >= 0 && type < kFirstGroupCodeOfNumbers);
}

resbuf* tzutNewRb(int type) {
    if (tzhost::faultAt("tzutNewRb")) return nullptr;
    return new resbuf{nullptr, static_cast<short>(type), {.rpoint = {0.0, 0.0, 0.0}}};
}

int tzutRelRb(resbuf* list) {
    while (list != nullptr) {
        resbuf* const record = std::exchange(list, list->rbnext);
        if (tzutHoldsString(record->restype)) tzutDelString(record->resval.rstring);
        delete record;
    }
    return Tzad::ePromptNormal;
}

wchar_t* tzutNewString(wchar_t const* text) {
    wchar_t const* const source = text ? text : L"";
    std::size_t const count = std::wcslen(source) + 1;
    auto copy = std::make_unique<wchar_t[]>(count);
    std::wmemcpy(copy.get(), source, count);
    return copy.release();
}

void tzutDelString(wchar_t*& text) {
    delete[] std::exchange(text, nullptr);
}

void tzutDelBuffer(wchar_t*& text) {
    tzutDelString(text);
}
