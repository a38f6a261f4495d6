#pragma once

// Where the files of this build or installation lie, found from where the running code lies, so
// that the whole tree can be moved.

#include <string>

namespace tzhost {

// The folder of the module and of the data files beside it, an absolute path without a slash at its
// end. In an installation it is tz/ in the folder of the libraries; in a build it is the folder of
// the libraries itself, which is lib/ beside the folder of a program that holds this code. The root
// when the system does not tell. It is looked for once, so that it stays when the files are
// removed.
[[nodiscard]] std::string libraryFolder();

// The user's folder for the configuration of these programs, which need not exist: in
// $XDG_CONFIG_HOME, else in $HOME/.config. Relative paths there do not count, since the working
// folder may be a stranger's. Empty when neither is absolute.
[[nodiscard]] std::string configurationFolder();

}  // namespace tzhost
