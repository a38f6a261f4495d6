#pragma once

namespace tzhost {

// Opens /dev/null for each of standard input, output and error that the program was started
// without, so that no file it opens later gets that number and with it what is printed. To be
// called before anything is opened.
void openStandardStreams();

}  // namespace tzhost
