#pragma once

#include <memory>

#include "host/database/drawing.h"

// Drawings of any size for benchmarks.
namespace tzbench {

// A drawing with `count` entities in model space, lines and one-line MTEXTs in turns, a row of 100
// to each unit upwards; handles from 1. It is the working drawing afterwards.
[[nodiscard]] std::unique_ptr<tzhost::Drawing> drawingWith(int count);
// The same with `count` of those texts and no lines.
[[nodiscard]] std::unique_ptr<tzhost::Drawing> drawingWithTexts(int count);

}  // namespace tzbench
