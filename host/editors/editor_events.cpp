#include "host/editors/editor_events.h"

#include <cstring>

#include "host/base/event_sink.h"

namespace tzhost {
namespace {

// How one number of the in-place editor's record is read.
enum class Field { byte, word, half, real };

struct SettingsField {
    std::size_t offset;
    Field field;
};

constexpr SettingsField kSettingsFields[] = {
    {0, Field::byte},   {4, Field::byte},   {5, Field::byte},   {6, Field::byte},
    {12, Field::word},  {16, Field::real},  {40, Field::real},  {192, Field::word},
    {196, Field::word}, {200, Field::word}, {204, Field::word}, {208, Field::word},
    {212, Field::half}, {216, Field::word}, {220, Field::word},
};

template <class Number>
Number readAt(IPESettings const& settings, std::size_t offset) {
    Number number;
    std::memcpy(&number, reinterpret_cast<char const*>(&settings) + offset, sizeof number);
    return number;
}

double numberAt(IPESettings const& settings, SettingsField const& row) {
    switch (row.field) {
    case Field::byte: return readAt<std::uint8_t>(settings, row.offset);
    case Field::half: return readAt<std::uint16_t>(settings, row.offset);
    case Field::word: return readAt<std::uint32_t>(settings, row.offset);
    case Field::real: return readAt<double>(settings, row.offset);
    }
    return 0;
}

// The record as an object from byte offset to number; zeros are left out.
Event describe(IPESettings const& settings) {
    Event numbers = Event::object();
    for (SettingsField const& row : kSettingsFields) {
        double const number = numberAt(settings, row);
        if (number == 0) continue;
        std::string const key = std::to_string(row.offset);
        if (row.field == Field::real) {
            numbers[key] = number;
        } else {
            numbers[key] = static_cast<std::uint32_t>(number);
        }
    }
    return numbers;
}

}  // namespace

void reportEditor(char const* kind, bool accepted, IPESettings const* settings) {
    reportEvent([&] {
        Event event{{"event", "editor"}, {"kind", kind}, {"accepted", accepted}};
        if (settings) event["settings"] = describe(*settings);
        return event;
    });
}

}  // namespace tzhost
