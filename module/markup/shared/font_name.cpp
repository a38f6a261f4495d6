#include "module/markup/shared/font_name.h"

#include <utility>

FontName::FontName(CStdStrW const& text) {
    if (!text.empty()) text_ = std::make_shared<Shared const>(Shared{text, nullptr});
}

CStdStrW const& FontName::text() const {
    static CStdStrW const none;
    return text_ ? text_->text : none;
}

bool FontName::operator==(FontName const& other) const {
    return text_ == other.text_ || text() == other.text();
}

bool FontName::isSameAs(FontName const& other) const {
    if (text_ == other.text_) return true;
    if (!text_ || !other.text_) return false;
    return folded() == other.folded() || *folded() == *other.folded();
}

// Only for a name that is not empty.
std::shared_ptr<CStdStrW const> const& FontName::folded() const {
    if (!text_->folded) {
        CStdStrW lower = text_->text;
        lower.MakeLower();
        text_->folded = std::make_shared<CStdStrW const>(std::move(lower));
    }
    return text_->folded;
}

FontName FontNamePool::intern(CStdStrW const& text) {
    if (text.empty()) return {};
    if (auto const at = names_.find(text); at != names_.end()) return at->second;
    FontName const name(text);
    name.text_->folded = folded_.try_emplace(*name.folded(), name.folded()).first->second;
    names_.emplace(name.text(), name);
    return name;
}
