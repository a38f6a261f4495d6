#pragma once

// Keeps the reading and writing of numbers in the "C" locale for the life of the object, whatever a
// library has set for the process. Only the calling thread is touched.
//
//   NumberLocale const inC;
//   std::snprintf(buffer, size, "%g", value);

#include <locale.h>

namespace tzhost {

class [[nodiscard]] NumberLocale {
public:
    NumberLocale() noexcept;
    ~NumberLocale();
    NumberLocale(NumberLocale const&) = delete;
    NumberLocale& operator=(NumberLocale const&) = delete;

private:
    locale_t before_;
};

}  // namespace tzhost
