#include "host/text/system_words.h"

#include <cstring>
#include <new>
#include <stdexcept>

#include "host/text/filled.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

constexpr char const* kByNumber = forLocalText("error %s of the system");

}  // namespace

std::string systemWords(int problem) {
    std::string const english = std::strerror(problem);
    std::string local = localText(english.c_str());
    if (local != english) return local;
    local = localText(kByNumber);
    return local == kByNumber ? english : filled(local, {std::to_string(problem)});
}

std::string systemWords(std::exception const& thrown) {
    bool const isMemory = dynamic_cast<std::bad_alloc const*>(&thrown) != nullptr ||
                          dynamic_cast<std::length_error const*>(&thrown) != nullptr;
    return isMemory ? localText("there is not enough memory") : thrown.what();
}

}  // namespace tzhost
