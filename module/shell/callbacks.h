#pragma once

// What the host calls when a command starts, one for each command. Each makes its command object,
// runs it and deletes it. Only system variables and the exported globals carry values from one run
// to the next.

void ImprovedMtextCallback();        // MTEXT
void CompatibleMtextCallback();      // -MTEXT
void EditMtextCallback();            // MTEDIT
void CompatibleEditMtextCallback();  // -MTEDIT
void MtpropCallback();               // MTPROP
void AlignTextCallback();            // TEXTALIGN
void MtextPropertiesCallback();      // MTEXTPROPERTIES
