#include "tz/mte/font_map_database.h"

void LoadFontDatabase() {
    CMTextFontMapDatabase const load(1);
}

void UnloadFontDatabase() {
    CMTextFontMapDatabase(0).ResetContents();
}

int FontDatabaseLoader(void* /*unused*/) {
    LoadFontDatabase();
    return 0;
}
