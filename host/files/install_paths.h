#pragma once

// Where the files of this build or installation lie, found from where the running code lies, so
// that the whole tree can be moved.

#include <string>

namespace tzhost {

// The folder of the libraries and of the data files beside them, an absolute path without a slash
// at its end: that of this library, or lib/ beside the folder of the program that holds this code.
// The root when the system does not tell.
[[nodiscard]] std::string libraryFolder();

// The user's folder for the configuration of these programs, which need not exist: in
// $XDG_CONFIG_HOME, else in $HOME/.config. Relative paths there do not count, since the working
// folder may be a stranger's. Empty when neither is absolute.
[[nodiscard]] std::string configurationFolder();

}  // namespace tzhost
