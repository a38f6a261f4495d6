#include "host/base/audit.h"

namespace tzhost {

bool Audit::clean() const {
    return openObjects == 0 && selectionSets == 0 && filters == 0 && gestureHandlers == 0 &&
           highlighted == 0 && ucsStack == 0 && !keywordCallback;
}

Audit& audit() {
    static Audit counters;
    return counters;
}

}  // namespace tzhost
