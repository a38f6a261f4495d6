#include "host/entities/mtext_imp.h"

#include "host/database/exact_values.h"
#include "host/database/symbol_imp.h"
#include "host/entities/style_look.h"
#include "host/layout/attachment_box.h"
#include "host/layout/mtext_layout.h"

namespace tzhost {

MTextImp::MTextImp(MTextImp const& other)
    : TextStyledImp(other), contents(other.contents), location(other.location),
      normal(other.normal), direction(other.direction), textHeight(other.textHeight),
      width(other.width), height(other.height), lineSpacingFactor(other.lineSpacingFactor),
      lineSpacingStyle(other.lineSpacingStyle), attachment(other.attachment),
      columns(other.columns ? std::make_unique<TextEditorColumns>(*other.columns) : nullptr),
      background(other.background ? std::make_unique<MTextBackground>(*other.background) : nullptr),
      size_(other.size_), layout_(other.layout_), looks_(other.looks_) {}

std::unique_ptr<TzDbObjectImp> MTextImp::copy() const {
    return std::make_unique<MTextImp>(*this);
}

// The contents come last: they lie elsewhere in memory, and commands on many texts leave them.
bool MTextImp::isSameAs(TzDbObjectImp const& other) const {
    return TextStyledImp::isSameAs(other) &&
           agree(*this, static_cast<MTextImp const&>(other), &MTextImp::textHeight,
                 &MTextImp::direction, &MTextImp::width, &MTextImp::height,
                 &MTextImp::lineSpacingFactor, &MTextImp::lineSpacingStyle, &MTextImp::attachment,
                 &MTextImp::location, &MTextImp::normal, &MTextImp::columns, &MTextImp::background,
                 &MTextImp::contents);
}

void MTextImp::forgetComputed() {
    looks_ = 0;
    layout_.reset();
}

bool MTextImp::showFieldText(std::wstring const& text) {
    contents = text;
    forgetComputed();
    return true;
}

TextEditorColumns& MTextImp::columnsForChange() {
    if (!columns) columns = std::make_unique<TextEditorColumns>();
    return *columns;
}

MTextBackground& MTextImp::backgroundForChange() {
    if (!background) background = std::make_unique<MTextBackground>();
    return *background;
}

MTextLayoutInput MTextImp::input() const {
    MTextLayoutInput input;
    input.contents = contents;
    input.width = width;
    input.height = height;
    input.textHeight = textHeight;
    input.style = lookOfStyle(style);
    input.lineSpacingStyle = lineSpacingStyle;
    input.lineSpacingFactor = lineSpacingFactor;
    input.attachment = attachment;
    if (columns) {
        input.columns = {columns->columnType,   columns->autoHeight,
                         columns->columnCount,  columns->columnWidth,
                         columns->columnGutter, {columns->heights.begin(), columns->heights.end()}};
    }
    return input;
}

std::shared_ptr<MTextLayout const> MTextImp::layout() const {
    if (layout_ && looks_ == looksGeneration()) return layout_;
    auto made = std::make_shared<MTextLayout const>(layOutMText(input()));
    size_ = {made->width, made->height};
    looks_ = looksGeneration();
    layout_ = record || embedder ? nullptr : made;
    return made;
}

LayoutPoint const& MTextImp::size() const {
    if (looks_ != looksGeneration()) (void)layout();
    return size_;
}

LayoutBox MTextImp::box() const {
    LayoutPoint const& measured = size();
    return boxAt(attachmentShares(attachment, lookOfStyle(style)), measured.x, measured.y);
}

TzGePoint3d MTextImp::placeOf(short attachmentPoint) const {
    LayoutBox const now = box();
    AttachmentShares const shares = attachmentShares(attachmentPoint, lookOfStyle(style));
    return at({now.left + shares.along * now.width(), now.top - shares.down * now.height()});
}

TzGePoint3d MTextImp::at(LayoutPoint const& point) const {
    return location + direction * point.x + normal.crossProduct(direction) * point.y;
}

}  // namespace tzhost
