#include "apps/tzdraft/screen_columns.h"

#include <sys/ioctl.h>

namespace tzdraft {

std::size_t screenColumns(int descriptor) {
    winsize size{};
    return ioctl(descriptor, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
}

}  // namespace tzdraft
