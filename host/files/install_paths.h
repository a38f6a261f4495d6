#pragma once

// Where the files of this build or installation lie, found from where the running code lies, so
// that the whole tree can be moved.

#include <string>

namespace tzhost {

// The folder of the libraries and of the data files beside them, without a slash at its end: that
// of this library, or lib/ beside the folder of the program that holds this code.
[[nodiscard]] std::string libraryFolder();

// The user's folder for the configuration of these programs; it need not exist.
[[nodiscard]] std::string configurationFolder();

}  // namespace tzhost
