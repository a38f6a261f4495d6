#include "host/fields/field_codes.h"

#include <cstdlib>
#include <ctime>
#include <cwchar>

#include "host/base/result_time.h"
#include "host/database/drawing.h"
#include "host/database/open_state.h"
#include "host/fields/field_properties.h"
#include "host/runtime/words.h"
#include "host/settings/variables.h"
#include "host/text/utf8.h"

namespace tzhost {
namespace {

constexpr std::wstring_view kBegin = L"%<\\";
constexpr std::wstring_view kEnd = L">%";
constexpr std::wstring_view kFailed = L"####";

using Value = std::optional<std::wstring>;

Value variableValue(Words const& words, Drawing const* /*drawing*/) {
    if (words.size() != 2) return std::nullopt;
    VariableValue const* const value = Variables::instance().get(words[1]);
    return value ? Value(writeValue(*value)) : std::nullopt;
}

// The date where the user is, but for a result that can be made again anywhere.
Value dateValue(Words const& words, Drawing const* /*drawing*/) {
    std::time_t const seconds = resultTime();
    std::tm date{};
    bool const isFixed = std::getenv("SOURCE_DATE_EPOCH") != nullptr;
    if (words.size() != 1 ||
        !(isFixed ? gmtime_r(&seconds, &date) : localtime_r(&seconds, &date))) {
        return std::nullopt;
    }
    return TzString::formatted(L"%04d-%02d-%02d", date.tm_year + 1900, date.tm_mon + 1,
                               date.tm_mday)
        .str();
}

Value fileValue(Words const& words, Drawing const* drawing) {
    if (words.size() != 1 || !drawing || drawing->file().empty()) return std::nullopt;
    return TzString::fromUtf8(drawing->file().filename().string()).str();
}

Value objectValue(Words const& words, Drawing const* drawing) {
    auto const handle = words.size() == 3 ? readHandle(toUtf8(words[1])) : std::nullopt;
    if (!handle || !drawing) return std::nullopt;
    TzDbObjectId const id = drawing->objectAt(*handle);
    if (id.isNull() || id.isErased()) return std::nullopt;
    return propertyText(*id.record()->object, words[2]);
}

struct CodeRow {
    std::wstring_view word;
    Value (*value)(Words const& words, Drawing const* drawing);
};

// The first word of a code and what computes it.
constexpr CodeRow kCodes[] = {
    {L"\\Date", dateValue},
    {L"\\File", fileValue},
    {L"\\Object", objectValue},
    {L"\\Var", variableValue},
};

Value valueOf(std::wstring_view code, Drawing const* drawing) {
    Words const words = splitWords(code.substr(2, code.size() - 2 - kEnd.size()));
    for (CodeRow const& row : kCodes) {
        if (!words.empty() && words[0] == row.word) return row.value(words, drawing);
    }
    return std::nullopt;
}

}  // namespace

std::optional<FieldSpan> findField(std::wstring_view text, std::size_t start) {
    std::size_t const first = text.find(kBegin, start);
    if (first == text.npos) return std::nullopt;
    std::size_t const end = text.find(kEnd, first + kBegin.size());
    if (end == text.npos) return std::nullopt;
    return FieldSpan{first, end + kEnd.size()};
}

std::optional<FieldSpan> findField(wchar_t const* text) {
    wchar_t const* const first = std::wcsstr(text, kBegin.data());
    wchar_t const* const end = first ? std::wcsstr(first + kBegin.size(), kEnd.data()) : nullptr;
    if (!end) return std::nullopt;
    return FieldSpan{static_cast<std::size_t>(first - text),
                     static_cast<std::size_t>(end - text) + kEnd.size()};
}

ExpandedText expandFields(std::wstring_view text, Drawing const* drawing) {
    ExpandedText result;
    std::size_t letters = 0;  // of all values
    std::size_t at = 0;
    while (auto const code = findField(text, at)) {
        result.text += text.substr(at, code->first - at);
        Value value = valueOf(text.substr(code->first, code->end - code->first), drawing);
        if (value && value->size() > kMostFieldLetters - letters) {
            value.reset();
            result.tooLong = true;
        }
        letters += value ? value->size() : 0;
        result.text += value ? std::wstring_view(*value) : kFailed;
        result.complete = result.complete && value.has_value();
        at = code->end;
    }
    result.text += text.substr(at);
    return result;
}

}  // namespace tzhost
