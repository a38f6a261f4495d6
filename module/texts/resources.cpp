#include "module/texts/resources.h"

#include "tz/rx/resource.h"

TzRxResourceInstance const& getMteResourceInstance() {
    static TzRxResourceInstance const instance(L"TzmtedRes.dll");
    return instance;
}

TzString loadResourceString(int id) {
    TzString text;
    (void)getMteResourceInstance().tryLoadString(static_cast<unsigned int>(id), text);
    return text;
}

TzString getWarningId(int number) {
    return TzString::formatted(L"TzMte%d", number);
}
