#pragma once

#include "host/text/local_text.h"

// The program's texts are looked up among the host's.
namespace tzdraft {

using tzhost::forLocalText;
using tzhost::localText;

}  // namespace tzdraft
