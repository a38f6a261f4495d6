#include "host/database/active_space.h"

#include "host/settings/variables.h"

namespace tzhost {

bool isPaperActive() {
    Variables const& variables = Variables::instance();
    return variables.number(L"TILEMODE") == 0 && variables.number(L"CVPORT") == 1;
}

}  // namespace tzhost
