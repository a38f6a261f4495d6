#include "module/holders/easy_upgrade.h"

#include "tz/db/object.h"

CEasyUpgrade::~CEasyUpgrade() {
    CEasyUpgrade::Downgrade();
}

bool CEasyUpgrade::Upgrade(TzDbObject* toUpgrade) {
    if (toUpgrade->isWriteEnabled()) return upgraded;
    upgraded = toUpgrade->upgradeOpen() == Tzad::eOk;
    if (upgraded) object = toUpgrade;
    return upgraded;
}

void CEasyUpgrade::Downgrade() {
    if (object) (void)object->downgradeOpen();  // if refused, it stays open for write
    object = nullptr;
}
