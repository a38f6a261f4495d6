#pragma once

#include "host/text/filled.h"
#include "host/text/local_text.h"

// The program's texts are looked up among the host's.
namespace tzconvert {

using tzhost::filled;
using tzhost::forLocalText;
using tzhost::localText;

}  // namespace tzconvert
