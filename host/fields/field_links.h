#pragma once

class TzDbMText;

// Fields of texts.
namespace tzhost {

// Called when a text was set: its old field is erased, and codes in a text of a drawing become a
// new one. One that cannot be attached is deleted.
void renewTextField(TzDbMText& text);

}  // namespace tzhost
