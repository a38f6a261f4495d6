#pragma once

#include <string_view>

namespace tzhost {

// Opens /dev/null for each of standard input, output and error that the program was started
// without, so that no file it opens later gets that number and with it what is printed. To be
// called before anything is opened.
void openStandardStreams();

// What is printed to standard output from now on, by other programs too, goes to standard error:
// standard output is for a result alone.
void keepStandardOutput();
// Writes to the standard output that the program was started with, and at once. False with errno,
// EBADF when the program was started without one.
[[nodiscard]] bool writeStandardOutput(std::string_view bytes);

}  // namespace tzhost
