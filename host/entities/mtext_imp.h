#pragma once

#include <memory>
#include <string>

#include "host/database/entity_imp.h"
#include "host/layout/layout_types.h"
#include "tz/db/text_columns.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// The values of a multi-line text, kept small: what most texts do not have costs a pointer, and of
// the layout only the size stays, unless the text is in no drawing and is drawn again and again.
namespace tzhost {

struct MTextBackground {
    bool fill = false;
    TzCmColor color = TzCmEntityColor::fromIndex(256);
    double scale = 1.5;
    TzCmTransparency transparency;
    bool useBackgroundColor = false;

    friend bool operator==(MTextBackground const&, MTextBackground const&) = default;
};

struct MTextImp final : TextStyledImp {
    MTextImp() = default;
    MTextImp(MTextImp const& other);
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    void forgetComputed() override;
    bool showFieldText(std::wstring const& text) override;

    // The columns or the background for a change, made when the text had none.
    [[nodiscard]] TextEditorColumns& columnsForChange();
    [[nodiscard]] MTextBackground& backgroundForChange();

    // The size of the laid out text, measured when it is not known.
    [[nodiscard]] LayoutPoint const& size() const;
    // The box of that size about the location, along the direction and up from it.
    [[nodiscard]] LayoutBox box() const;
    // The place of the attachment point of that number on the box.
    [[nodiscard]] TzGePoint3d placeOf(short attachmentPoint) const;
    // A place given in the frame of the box.
    [[nodiscard]] TzGePoint3d at(LayoutPoint const& point) const;
    // The whole layout. Kept for a text in no drawing, else as long as the caller keeps it.
    [[nodiscard]] std::shared_ptr<MTextLayout const> layout() const;

    std::wstring contents;
    TzGePoint3d location;
    TzGeVector3d normal = TzGeVector3d::kZAxis;
    TzGeVector3d direction = TzGeVector3d::kXAxis;
    double textHeight = 0.2;
    double width = 0.0;
    double height = 0.0;
    double lineSpacingFactor = 1.0;
    short lineSpacingStyle = 1;
    short attachment = 1;
    std::unique_ptr<TextEditorColumns> columns;   // null for no columns and the defaults
    std::unique_ptr<MTextBackground> background;  // null for the defaults

private:
    [[nodiscard]] MTextLayoutInput input() const;

    mutable LayoutPoint size_;                           // as of `looks_`
    mutable std::shared_ptr<MTextLayout const> layout_;  // as of `looks_`; null when not kept
    mutable unsigned int looks_ = 0;  // generation of the text styles, 0 when nothing is known
};

}  // namespace tzhost
