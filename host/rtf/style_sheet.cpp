#include "host/rtf/style_sheet.h"

#include <cstddef>

namespace tzhost {

namespace {

// Styles that go round in a circle end here.
constexpr int kLongestChain = 16;

}  // namespace

void RtfStyleSheet::define(RtfStyleKind kind,
                           int number,
                           int basedOn,
                           RtfStyleValues const& values) {
    styles_[static_cast<std::size_t>(kind)][number] = {basedOn, values};
}

RtfStyleValues RtfStyleSheet::valuesOf(RtfStyleKind kind, int number) const {
    Styles const& styles = styles_[static_cast<std::size_t>(kind)];
    RtfStyleValues values;
    values.fill(kRtfUnset);
    for (int step = 0; step < kLongestChain; ++step) {
        auto const at = styles.find(number);
        if (at == styles.end()) break;
        for (std::size_t i = 0; i < values.size(); ++i) {
            if (values[i] == kRtfUnset) values[i] = at->second.values[i];
        }
        number = at->second.basedOn;
    }
    return values;
}

}  // namespace tzhost
