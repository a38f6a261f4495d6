#include "module/markup/font_name.h"

#include <utility>

namespace {

CStdStrW folded(CStdStrW text) {
    text.MakeLower();
    return text;
}

}  // namespace

FontName::FontName(CStdStrW const& text) {
    if (text.empty()) return;
    text_ = std::make_shared<Shared const>(
        Shared{text, std::make_shared<CStdStrW const>(folded(text))});
}

CStdStrW const& FontName::text() const {
    static CStdStrW const none;
    return text_ ? text_->text : none;
}

bool FontName::operator==(FontName const& other) const {
    return text_ == other.text_ || text() == other.text();
}

bool FontName::isSameAs(FontName const& other) const {
    if (caseIdentity() == other.caseIdentity()) return true;
    return text_ && other.text_ && *text_->folded == *other.text_->folded;
}

void const* FontName::caseIdentity() const {
    return text_ ? text_->folded.get() : nullptr;
}

FontName FontNamePool::intern(CStdStrW const& text) {
    if (text.empty()) return {};
    if (auto const at = names_.find(text); at != names_.end()) return at->second;
    FontName name(text);
    auto const& lower = name.text_->folded;
    if (auto const [at, isNew] = folded_.try_emplace(*lower, lower); !isNew) {
        name.text_ = std::make_shared<FontName::Shared const>(FontName::Shared{text, at->second});
    }
    names_.emplace(name.text(), name);
    return name;
}
