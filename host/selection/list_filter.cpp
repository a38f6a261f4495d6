#include "host/selection/list_filter.h"

#include <algorithm>

#include "host/database/classes.h"
#include "host/database/drawing.h"
#include "host/database/entity_imp.h"
#include "host/display/record_access.h"
#include "host/selection/entity_list.h"
#include "host/selection/wildcard.h"
#include "tz/db/entity.h"
#include "tz/db/symbol_table.h"
#include "tz/rx/resbuf.h"

namespace tzhost {

namespace {

TzString kindOf(TzDbObjectId id) {
    return entityKind(id.objectClass());
}

TzString layerOf(TzDbObjectId id) {
    return entityOf(id)->layer();
}

// Empty for an entity without a text style.
TzString styleOf(TzDbObjectId id) {
    auto const* const text =
        dynamic_cast<TextStyledImp const*>(TzDbObjectAccess::imp(*entityOf(id)));
    if (text == nullptr) return {};
    TzDbObjectId const style =
        text->style.isNull() ? id.record()->drawing->textstyle() : text->style;
    auto const* const record = objectOf<TzDbTextStyleTableRecord>(style);
    return record ? TzString(record->getName()) : TzString();
}

struct CodeRow {
    int code;
    TzString (*valueOf)(TzDbObjectId id);
};

constexpr CodeRow kCodes[] = {
    {0, kindOf},
    {7, styleOf},
    {8, layerOf},
    {Tzad::eResultEntityKind, kindOf},
};

CodeRow const* findCode(int code) {
    auto const* const at = std::find_if(std::begin(kCodes), std::end(kCodes),
                                        [code](CodeRow const& row) { return row.code == code; });
    return at == std::end(kCodes) ? nullptr : at;
}

}  // namespace

std::optional<ListFilter> ListFilter::read(resbuf const* list) {
    ListFilter filter;
    for (; list != nullptr; list = list->rbnext) {
        if (findCode(list->restype) == nullptr) return std::nullopt;
        wchar_t const* const text = list->resval.rstring;
        filter.conditions_.push_back({list->restype, text ? text : L""});
    }
    return filter;
}

bool ListFilter::lets(TzDbObjectId id) const {
    if (entityOf(id) == nullptr) return false;
    return std::all_of(conditions_.begin(), conditions_.end(), [id](Condition const& each) {
        TzString const value = findCode(each.code)->valueOf(id);
        return !value.isEmpty() && matchesPattern(value.str(), each.pattern, Case::ignored);
    });
}

}  // namespace tzhost
