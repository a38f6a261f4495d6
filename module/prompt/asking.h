#pragma once

#include "module/prompt/input.h"

// Questions that are asked once, or until they are answered.

// An answer that carries a value: one that was given, or the default after an empty answer.
[[nodiscard]] constexpr bool isAnswered(int status) {
    return status == statusNormal || status == statusNone;
}

// Asks once and hands an answer to `store`. False when the user cancelled; a question that failed
// changes nothing.
template <class Input, class Store>
[[nodiscard]] bool askOnce(Input& input, Store store) {
    int const status = input.Prompt();
    if (status == statusCancel) return false;
    if (isAnswered(status)) store();
    return true;
}

// Asks until there is an answer, which goes to `store`; false when the user cancelled.
template <class Input, class Store>
[[nodiscard]] bool askUntilAnswered(Input& input, Store store) {
    for (;;) {
        int const status = input.Prompt();
        if (status == statusCancel) return false;
        if (!isAnswered(status)) continue;
        store();
        return true;
    }
}
