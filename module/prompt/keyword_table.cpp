#include "module/prompt/keyword_table.h"

#include <cassert>

#include "module/texts/resources.h"
#include "tz/mte/globals.h"

CKeywordTable::CKeywordTable(unsigned int const* ids, int count)
    : keywordIds(ids), keywordCount(count) {}

void CKeywordTable::LoadStrings() {
    keywordStrings.setLogicalLength(keywordCount);
    for (int index = 0; index < keywordCount; ++index)
        keywordStrings[index] = loadResourceString(static_cast<int>(keywordIds[index]));
}

void CKeywordTable::GetKeywords(int index, TzString& local, TzString& global) const {
    assert(index >= 0 && index < keywordStrings.length() && "LoadStrings comes first");
    TzString const& text = keywordStrings[index];
    int const separator = text.find(gsLocalizationSeparator.kwszPtr());
    local = separator == -1 ? text : text.left(separator);
    // Without a separator `separator` is -1, so that only the first character is left out.
    global = text.mid(separator + gsLocalizationSeparator.length());
}

bool CKeywordTable::FindKeyword(TzString const& input, unsigned int& id) const {
    TzString local;
    TzString global;
    for (int index = 0; index < keywordCount; ++index) {
        GetKeywords(index, local, global);
        if (FormatAsKeyword(global).compareNoCase(input) != 0) continue;
        id = keywordIds[index];
        return true;
    }
    id = 0;
    return false;
}

TzString CKeywordTable::GetKeywordString(unsigned int id, bool local) const {
    TzString localPart;
    TzString globalPart;
    for (int index = 0; index < keywordCount; ++index) {
        if (keywordIds[index] != id) continue;
        GetKeywords(index, localPart, globalPart);
        return local ? localPart : globalPart;
    }
    return TzString();
}

TzString FormatAsKeyword(TzString text) {
    for (int at; (at = text.findOneOf(L" =()")) != -1;)
        text.remove(at);
    return text;
}

TzString FormatAsPromptOption(TzString text) {
    int const comma = text.find(L',');
    return comma == -1 ? text : text.left(comma);
}
