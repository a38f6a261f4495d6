#pragma once

namespace tzhost {

// Whether the variables TILEMODE and CVPORT choose the paper, else the model.
[[nodiscard]] bool isPaperActive();

}  // namespace tzhost
