#pragma once

// How the questions for the columns of a new text ended, as DoColumnPrompt tells it.
inline constexpr int kColumnsCancelled = -1;
inline constexpr int kColumnsNone = 0;
inline constexpr int kColumnsSetUp = 1;
