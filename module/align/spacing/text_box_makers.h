#pragma once

#include "module/align/spacing/box_maker.h"

// The makers of the boxes of both kinds of texts.

// Multi-line texts: the box of the text as it is laid out.
class TzMTextAlignBoundBoxMakerMText final : public TzMTextAlignBoundBoxMaker {
public:
    using TzMTextAlignBoundBoxMaker::TzMTextAlignBoundBoxMaker;
    [[nodiscard]] Box makeWcsBoundBox() const override;
};

// Single-line texts and attribute definitions. A definition with several lines is measured without
// the width that wraps it; the width comes back afterwards, unless the definition could be opened
// for write at one of the two moments alone, which leaves it without one.
class TzMTextAlignBoundBoxMakerText final : public TzMTextAlignBoundBoxMaker {
public:
    using TzMTextAlignBoundBoxMaker::TzMTextAlignBoundBoxMaker;
    [[nodiscard]] Box makeWcsBoundBox() const override;

private:
    class AttributeDefHacker;
};
