#include "host/text/number_locale.h"

namespace tzhost {

namespace {

// Lives as long as the process. Null when the C library is out of memory; the locale then stays as
// it is.
locale_t plainLocale() noexcept {
    static locale_t const locale = newlocale(LC_ALL_MASK, "C", locale_t{});
    return locale;
}

}  // namespace

NumberLocale::NumberLocale() noexcept : before_(uselocale(plainLocale())) {}

NumberLocale::~NumberLocale() {
    uselocale(before_);
}

}  // namespace tzhost
