#pragma once

// How an editor session ended, as InvokeEditorOn and what it calls tell it.
inline constexpr int kEditorAccepted = 1;
inline constexpr int kEditorLeft = 2;  // left without accepting
inline constexpr int kNoEditor = 3;    // no editor ran
