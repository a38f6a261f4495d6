#include "module/align/spacing/text_box_makers.h"

#include <memory>
#include <new>
#include <optional>

#include "module/align/spacing/text_axes.h"
#include "module/geometry/attachments.h"
#include "tz/db/mtext.h"
#include "tz/db/text.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/resbuf.h"

namespace {

// The lower left and upper right corner of a text, open for read, in its own frame.
struct FrameBox {
    double low[3] = {};
    double high[3] = {};
};

std::optional<FrameBox> measured(TzDbText const& text) {
    long long name[2] = {};
    if (tzdbGetTzsName(name, text.objectId()) != Tzad::eOk) return std::nullopt;
    FrameBox box;
    std::unique_ptr<resbuf, int (*)(resbuf*)> const data(tzdbEntGet(name), tzutRelRb);
    if (tzedTextBox(data.get(), box.low, box.high) == Tzad::ePromptError) return std::nullopt;
    return box;
}

}  // namespace

TzMTextAlignBoundBoxMaker::Box TzMTextAlignBoundBoxMakerMText::makeWcsBoundBox() const {
    EasyObject<TzDbMText> text;
    if (tzdbOpenObject(text.object, id(), TzDb::kForRead) != Tzad::eOk) return std::nullopt;
    TzGeVector3d const across = text->direction() * text->actualWidth();
    TzGeVector3d const up = text->normal().crossProduct(text->direction()) * text->actualHeight();
    BoxPlace const attached = placeOfAttachment(text->attachment());
    TzGePoint3d const lowerLeft =
        text->location() - across * attached.across() + up * (attached.down() - 1.0);
    return TzGeBoundBlock3d(lowerLeft, across, up, TzGeVector3d::kIdentity);
}

// Takes the width of a multi-line definition, open for read, away while it lives.
class TzMTextAlignBoundBoxMakerText::AttributeDefHacker {
public:
    explicit AttributeDefHacker(TzDbAttributeDefinition* definition) : m_definition(definition) {
        if (!m_definition) return;
        change([this](TzDbMText& lines) {
            m_width = lines.width();
            (void)lines.setWidth(0.0);  // zero is a width that no text refuses
        });
    }
    AttributeDefHacker(AttributeDefHacker const&) = delete;
    AttributeDefHacker& operator=(AttributeDefHacker const&) = delete;
    ~AttributeDefHacker() {
        if (!m_definition) return;
        try {
            change([this](TzDbMText& lines) { (void)lines.setWidth(m_width); });  // its own width
        } catch (std::bad_alloc const&) {
            return;  // without memory the width is lost, as without the opening
        }
    }

private:
    // Hands the lines over for writing; nothing when there are none, or the definition cannot be
    // written.
    template <class Change>
    void change(Change const& apply) {
        Tzad::ErrorStatus const upgraded = m_definition->upgradeOpen();
        if (upgraded != Tzad::eOk && upgraded != Tzad::eAlreadyOpenForWrite) return;
        if (m_definition->getMTextAttributeDefinitionConst())
            apply(*m_definition->getMTextAttributeDefinition());
        if (upgraded == Tzad::eOk) (void)m_definition->downgradeOpen();  // it was upgraded here
    }

    double m_width = 0;
    TzDbAttributeDefinition* m_definition;
};

TzMTextAlignBoundBoxMaker::Box TzMTextAlignBoundBoxMakerText::makeWcsBoundBox() const {
    EasyObject<TzDbText> text;
    if (tzdbOpenObject(text.object, id(), TzDb::kForRead) != Tzad::eOk) return std::nullopt;
    AttributeDefHacker const unwrapped(tzrxCast<TzDbAttributeDefinition>(text.object));
    auto const box = measured(*text.object);
    if (!box) return TzGeBoundBlock3d();
    TzGeBoundBlock3d block(TzGePoint3d(box->low[0], box->low[1], box->low[2]),
                           TzGeVector3d(box->high[0] - box->low[0], 0, 0),
                           TzGeVector3d(0, box->high[1] - box->low[1], 0), TzGeVector3d::kIdentity);
    block.transformBy(calculateObjEcs(text->position(), text->normal(), text->rotation()));
    return block;
}
