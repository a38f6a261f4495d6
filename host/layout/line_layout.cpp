#include "host/layout/line_layout.h"

#include <algorithm>
#include <utility>

#include "host/layout/face_table.h"
#include "host/layout/glyph_run.h"
#include "host/layout/markup_scan.h"
#include "host/shaping/shaper.h"

namespace tzhost {
namespace {

WholeText wholeTextOf(LineLayoutInput const& input) {
    WholeText whole;
    whole.widthFactor = usableFactor(input.style.widthFactor);
    whole.tracking = usableFactor(input.tracking);
    whole.oblique = usableSlant(input.style.oblique);
    whole.flow = isVerticalStyle(input.style) ? TextFlow::down : TextFlow::along;
    return whole;
}

LineLayout
layAlong(LineLayoutInput const& input, LineFormat const& format, WholeText const& whole) {
    LineLayout line;
    GlyphRun run = shapeGlyphRun(input.text, format, whole);
    line.box = {0.0, 0.0, run.advance, format.height};
    line.runs.push_back(std::move(run));
    return line;
}

LineLayout layDown(LineLayoutInput const& input, LineFormat const& format, WholeText const& whole) {
    LineLayout line;
    double const step = kVerticalStep * format.height * whole.tracking;
    double widest = 0.0;
    double y = -format.height;
    for (std::wstring const& letter : splitLetters(input.text, format.face)) {
        GlyphRun run = shapeGlyphRun(letter, format, whole);
        run.x = -run.advance / 2.0;
        run.y = y;
        y -= step;
        widest = std::max(widest, run.advance);
        line.runs.push_back(std::move(run));
    }
    line.box = {-widest / 2.0, line.runs.empty() ? 0.0 : y + step, widest / 2.0, 0.0};
    return line;
}

void mirror(LineLayout& line, LayoutStyle const& style) {
    for (GlyphRun& run : line.runs) {
        run.mirroredX = style.backward;
        run.mirroredY = style.upsideDown;
        run.x = style.backward ? -run.x : run.x;
        run.y = style.upsideDown ? -run.y : run.y;
    }
    LayoutBox& box = line.box;
    if (style.backward) {
        box.left = -std::exchange(box.right, -box.left);
    }
    if (style.upsideDown) {
        box.bottom = -std::exchange(box.top, -box.bottom);
    }
}

}  // namespace

LineLayout layOutLine(LineLayoutInput const& input) {
    LineFormat const format{faceOfStyle(input.style), input.textHeight, input.color, false, false};
    WholeText const whole = wholeTextOf(input);
    LineLayout line = whole.flow == TextFlow::down ? layDown(input, format, whole)
                                                   : layAlong(input, format, whole);
    mirror(line, input.style);
    return line;
}

std::wstring decodeLineText(std::wstring const& text) {
    std::wstring result;
    for (wchar_t const* cursor = text.c_str(); *cursor != 0;) {
        wchar_t const* const start = cursor;
        wchar_t character = *cursor++;
        if (character == L'\\' && (*cursor == L'U' || *cursor == L'u')) {
            character = markup::scanUnicode(++cursor);
        } else if (character == L'\\' && (*cursor == L'M' || *cursor == L'm')) {
            if (!markup::scanMultibyte(++cursor, character)) {
                character = 0;
            }
        }
        if (character == 0) {
            cursor = start + 1;
            character = *start;
        }
        result += character;
    }
    return result;
}

bool hasVerticalMark(LayoutStyle const& style) {
    return style.typeface.starts_with(L'@');
}

bool isVerticalStyle(LayoutStyle const& style) {
    return style.vertical || hasVerticalMark(style);
}

void dropVerticalMark(LayoutStyle& style) {
    if (!style.vertical && hasVerticalMark(style)) style.typeface.erase(0, 1);
}

}  // namespace tzhost
