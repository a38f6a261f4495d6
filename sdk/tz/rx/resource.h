#pragma once

#include <memory>

#include "tz/export.h"
#include "tz/text/string.h"

// A resource library: texts under numeric ids, in the user's language. The host looks for the file
// beside the module, in the folder of its language first; a file that is missing or damaged reads
// as not loaded, and then no id has a text.
//
//   TzRxResourceInstance resources(L"TzmtedRes.dll");
//   TzString prompt;
//   if (!resources.isLoaded() || !resources.tryLoadString(1043, prompt)) ...
//
// A plain value; copies share what was read. [any]
class TZ_API TzRxResourceInstance {
public:
    // The instance without a file.
    static TzRxResourceInstance const empty;

    TzRxResourceInstance();
    // Reads the file of that name, or of that path.
    explicit TzRxResourceInstance(wchar_t const* file);
    ~TzRxResourceInstance();
    TzRxResourceInstance(TzRxResourceInstance const&);
    TzRxResourceInstance& operator=(TzRxResourceInstance const&);

    [[nodiscard]] bool isLoaded() const;
    // The text under an id; false leaves `text` as it is.
    [[nodiscard]] bool tryLoadString(unsigned int id, TzString& text) const;

private:
    class Library;
    std::shared_ptr<Library const> library_;
};
