#pragma once

#include <memory>
#include <string>

#include "host/database/entity_imp.h"
#include "host/layout/layout_types.h"
#include "tz/db/mtext.h"
#include "tz/db/text.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// The values of single-line texts, attribute definitions and attributes.
namespace tzhost {

struct TextImp : TextStyledImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    void forgetComputed() override { looks_ = 0; }
    bool showFieldText(std::wstring const& shown) override;

    // What is drawn: the text itself, or the tag of a definition.
    [[nodiscard]] virtual std::wstring const& shownText() const { return text; }
    // The box in the text's own frame: origin at the position, x along the rotation.
    [[nodiscard]] virtual LayoutBox box() const;
    [[nodiscard]] LineLayout layout() const;
    // The start of the baseline.
    [[nodiscard]] TzGePoint3d position() const;

    std::wstring text;
    TzGePoint3d alignmentPoint;
    TzDbText::Justification justification = TzDbText::kLeft;
    TzGeVector3d normal = TzGeVector3d::kZAxis;
    double rotation = 0.0;
    double height = 0.2;
    double widthFactor = 1.0;
    double oblique = 0.0;

private:
    // Whether it is a single line, which its justification places.
    [[nodiscard]] virtual bool isOneLine() const { return true; }

    mutable LayoutBox box_;           // as of `looks_`
    mutable unsigned int looks_ = 0;  // generation of the text styles, 0 when nothing is known
};

struct AttributeImp final : TextImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    std::wstring tag;
};

struct DefinitionImp final : TextImp {
    DefinitionImp() = default;
    DefinitionImp(DefinitionImp const& other);
    ~DefinitionImp() override;
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    void settle(TzDbObject& object) override;
    [[nodiscard]] bool refersTo(TzDbObjectRecord const* named) const override;
    [[nodiscard]] std::wstring const& shownText() const override { return tag; }
    [[nodiscard]] LayoutBox box() const override;

    std::wstring tag;
    std::wstring prompt;
    std::unique_ptr<TzDbMText> lines;  // null for a single-line definition

private:
    [[nodiscard]] bool isOneLine() const override { return lines == nullptr; }
};

}  // namespace tzhost
