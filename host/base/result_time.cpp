#include "host/base/result_time.h"

#include <charconv>
#include <cstdlib>
#include <string_view>
#include <system_error>

namespace tzhost {

std::time_t resultTime() {
    char const* const value = std::getenv("SOURCE_DATE_EPOCH");
    std::string_view const text = value ? value : "";
    std::time_t seconds = 0;
    auto const [end, error] = std::from_chars(text.data(), text.data() + text.size(), seconds);
    bool const isWhole = error == std::errc() && end == text.data() + text.size();
    return isWhole ? seconds : std::time(nullptr);
}

}  // namespace tzhost
