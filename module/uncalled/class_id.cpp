#include "module/uncalled/class_id.h"

int StringFromCLSID(_GUID const& id, CStdStr<wchar_t>& text) {
    wchar_t* buffer = nullptr;
    int const result = StringFromCLSID(id, &buffer);
    text = CStdStr<wchar_t>(result == 0 ? buffer : nullptr);
    CoTaskMemFree(buffer);
    return result;
}
