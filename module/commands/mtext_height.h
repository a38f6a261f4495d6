#pragma once

// Asks for one text height and gives it to every multi-line text of a selection; one that cannot be
// opened for write is passed over.
void setHeightForSelectedMText(long long const* set);
