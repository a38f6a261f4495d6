#pragma once

// How the texts are spread along the line, as TEXTALIGNSPACING stores it.
enum class tagTextSpacing : int {
    Distribute,
    SpecificSpace,
    CurrentSpaceVertical,
    CurrentSpaceHorizontal
};
