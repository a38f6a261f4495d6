#include "host/drawing_file/member_reader.h"

#include <cmath>

#include "host/database/geometry.h"
#include "host/database/true_color.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost::drawingfile {
namespace {

// A value as a message shows it.
std::string shown(JsonValue const& value) {
    if (value.kind == JsonKind::number) return std::string(value.text);
    if (value.kind == JsonKind::flag) return value.flag ? "true" : "false";
    return nameOf(value.kind);
}

std::string range(WholeRange numbers) {
    return TzString::formatted(localText(L"a whole number from %d to %d"), numbers.low,
                               numbers.high)
        .toUtf8();
}

bool isWholeIn(double number, WholeRange numbers) {
    return number == std::floor(number) && number >= numbers.low && number <= numbers.high;
}

}  // namespace

MemberReader::MemberReader(ReadContext& context,
                           JsonValue const& object,
                           UnknownMembers& unknown,
                           std::string path)
    : context_(context), object_(object), unknown_(unknown), path_(std::move(path)),
      known_(object.members.size()) {}

std::string MemberReader::pathOf(std::string_view name) const {
    return path_.empty() ? std::string(name) : path_ + '.' + std::string(name);
}

JsonValue const* MemberReader::take(char const* name) {
    std::size_t const count = object_.members.size();
    for (std::size_t tried = 0; tried < count; ++tried) {
        std::size_t const at = next_;
        next_ = at + 1 == count ? 0 : at + 1;
        if (object_.members[at].first != name) continue;
        known_[at] = true;
        return &object_.members[at].second;
    }
    return nullptr;
}

JsonValue const* MemberReader::takeOf(char const* name, JsonKind kind) {
    JsonValue const* const member = take(name);
    if (!member || member->kind == kind) return member;
    refuse(name, *member, nameOf(kind));
    return nullptr;
}

void MemberReader::complain(char const* name, std::string what) const {
    JsonValue const* const member = object_.find(name);
    context_.complain(member ? member->line : object_.line, pathOf(name), std::move(what));
}

void MemberReader::refuse(char const* name,
                          JsonValue const& member,
                          std::string_view expected) const {
    complain(name,
             localText("is ") + shown(member) + localText(", expected ") + std::string(expected));
}

void MemberReader::flag(char const* name, bool& value) {
    if (JsonValue const* const member = takeOf(name, JsonKind::flag)) value = member->flag;
}

void MemberReader::number(char const* name, double& value, Range allowed) {
    JsonValue const* const member = take(name);
    if (!member) return;
    if (member->kind != JsonKind::number || !std::isfinite(member->number) ||
        !isIn(allowed, member->number)) {
        return refuse(name, *member, nameOf(allowed));
    }
    value = member->number;
}

void MemberReader::wholeNumber(char const* name, int& value, WholeRange numbers) {
    JsonValue const* const member = take(name);
    if (!member) return;
    if (member->kind != JsonKind::number || !isWholeIn(member->number, numbers)) {
        return refuse(name, *member, range(numbers));
    }
    value = static_cast<int>(member->number);
}

void MemberReader::text(char const* name, std::wstring& value) {
    JsonValue const* const member = takeOf(name, JsonKind::text);
    if (!member) return;
    if (member->text.find('\0') != std::string_view::npos) {
        return complain(name, localText("holds a zero character, expected a text without one"));
    }
    value = fromUtf8(member->text);
}

bool MemberReader::triple(char const* name, double (&values)[3]) {
    JsonValue const* const member = take(name);
    if (!member) return false;
    constexpr char const* kExpected = forLocalText("an array of three numbers");
    if (member->kind != JsonKind::array || member->items.size() != 3) {
        refuse(name, *member, localText(kExpected));
        return false;
    }
    for (std::size_t i = 0; i < 3; ++i) {
        JsonValue const& item = member->items[i];
        if (item.kind != JsonKind::number || !std::isfinite(item.number)) {
            complain(name, localText("holds ") + shown(item) + localText(", expected ") +
                               localText(kExpected));
            return false;
        }
        values[i] = item.number;
    }
    return true;
}

void MemberReader::point(char const* name, TzGePoint3d& value) {
    double numbers[3];
    if (triple(name, numbers)) value.set(numbers[0], numbers[1], numbers[2]);
}

void MemberReader::direction(char const* name, TzGeVector3d& value) {
    double numbers[3];
    if (!triple(name, numbers)) return;
    TzGeVector3d const vector(numbers[0], numbers[1], numbers[2]);
    if (!isDirection(vector)) return complain(name, localText("is zero, expected a direction"));
    value = unitVector(vector);
}

void MemberReader::color(char const* name, TzCmColor& value, WholeRange indices) {
    JsonValue const* const member = take(name);
    if (!member) return;
    auto const trueColor = readTrueColor(member->kind == JsonKind::text ? member->text : "");
    if (trueColor) {
        value = *trueColor;
    } else if (member->kind == JsonKind::number && isWholeIn(member->number, indices)) {
        value = TzCmEntityColor::fromIndex(static_cast<int>(member->number));
    } else {
        refuse(name, *member, range(indices) + localText(" or a text \"#RRGGBB\""));
    }
}

void MemberReader::record(char const* name,
                          TzDbObjectId& value,
                          TzDbObjectId table,
                          char const* kind) {
    std::wstring wanted;
    JsonValue const* const member = object_.find(name);
    text(name, wanted);
    if (!member || member->kind != JsonKind::text) return;
    TzDbObjectId const found = Drawing::find(table, wanted);
    if (!found.isNull()) {
        value = found;
        return;
    }
    complain(name, localText("names \"") + std::string(member->text) +
                       localText("\", expected the name of ") + localText(kind) +
                       localText(" of this drawing"));
}

void MemberReader::layer(char const* name, TzDbObjectId& value) {
    record(name, value, context_.drawing.layerTableId(), forLocalText("a layer"));
}

void MemberReader::textStyle(char const* name, TzDbObjectId& value) {
    record(name, value, context_.drawing.textStyleTableId(), forLocalText("a text style"));
}

void MemberReader::numbers(char const* name, std::vector<double>& values, Range allowed) {
    JsonValue const* const member = takeOf(name, JsonKind::array);
    if (!member) return;
    values.clear();
    for (JsonValue const& item : member->items) {
        if (item.kind != JsonKind::number || !std::isfinite(item.number) ||
            !isIn(allowed, item.number)) {
            return complain(name, localText("holds ") + shown(item) + localText(", expected ") +
                                      nameOf(allowed));
        }
        values.push_back(item.number);
    }
}

void MemberReader::keepRest() {
    for (std::size_t i = 0; i < known_.size(); ++i) {
        if (known_[i]) continue;
        auto const& [name, value] = object_.members[i];
        std::string json;
        writeValue(json, value);
        unknown_.push_back({path_, std::string(name), std::move(json)});
    }
}

}  // namespace tzhost::drawingfile
