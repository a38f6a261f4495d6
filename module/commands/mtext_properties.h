#pragma once

// MTEXTPROPERTIES: style, rotation or justification of every multi-line text that was selected
// before or is selected now. Texts on locked layers are left out, and the host warns about them
// once.
void changeMtextProperties();
