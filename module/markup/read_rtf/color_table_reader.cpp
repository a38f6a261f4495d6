#include "module/markup/read_rtf/color_table_reader.h"

#include "module/markup/read_rtf/rtf_tokens.h"
#include "module/markup/shared/rtf_color_table.h"

namespace {

constexpr int kByte = 0xFF;

struct Components {
    int red = kByte;
    int green = kByte;
    int blue = kByte;

    [[nodiscard]] unsigned int rgb() const {
        auto const shifted = static_cast<unsigned int>(green) << 8;
        return (static_cast<unsigned int>(blue) << 16) | (shifted & 0xFFFF) |
               static_cast<unsigned int>(red);
    }
};

void takeWord(Components& components, RtfStep const& step) {
    if (step.name == L"red") components.red = step.value & kByte;
    if (step.name == L"green") components.green = step.value;
    if (step.name == L"blue") components.blue = step.value & kByte;
}

void addColor(CRichTextColorTable& colors, Components const& components, bool isAutomatic) {
    if (!isAutomatic) {
        colors.AddColor(components.rgb(), true);
        return;
    }
    int index = 0;
    (void)colors.GetColor(0, &index);  // an empty table gives ByBlock
    colors.AddColor(index, true);
}

}  // namespace

// Any character that belongs to no word makes the entry the automatic colour, the first of the
// table: a blank before the ";" does so.
void readColorTable(wchar_t const*& cursor, CRichTextColorTable& colors) {
    Components components;
    bool isAutomatic = true;
    for (;;) {
        RtfStep const step = nextStep(cursor);
        switch (step.kind) {
        case RtfStep::end: return;
        case RtfStep::close: cursor = step.start; return;
        case RtfStep::open: skipGroupRest(cursor); break;
        case RtfStep::word:
            isAutomatic = false;
            takeWord(components, step);
            break;
        case RtfStep::symbol: break;
        case RtfStep::character:
            if (*step.start == L';') {
                addColor(colors, components, isAutomatic);
                components = {};
            }
            isAutomatic = true;
            break;
        }
    }
}
