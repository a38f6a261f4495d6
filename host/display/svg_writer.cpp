#include "host/display/svg_writer.h"

#include <pango/pango.h>

#include <array>
#include <charconv>
#include <cmath>
#include <cstdio>

#include "host/display/plot_clip.h"

namespace tzhost {
namespace {

// Coordinates of glyphs are whole numbers of so many Pango units.
constexpr double kGlyphUnit = 64.0;
// Digits of lengths on the page after the point.
constexpr int kPageDigits = 3;
// The file is handed over in parts of about so many bytes.
constexpr std::size_t kPart = std::size_t{1} << 16;

// A number without zeros at its end, and without the sign of a zero.
std::string shown(double value, std::chars_format format, int digits) {
    std::array<char, 400> text{};
    auto const [end, problem] =
        std::to_chars(text.data(), text.data() + text.size(), value, format, digits);
    std::string result(text.data(), end);
    bool const hasPoint =
        result.find('.') != std::string::npos && result.find('e') == std::string::npos;
    if (hasPoint) {
        result.erase(result.find_last_not_of('0') + 1);
        if (result.back() == '.') result.pop_back();
    }
    return result == "-0" ? "0" : result;
}

std::string length(double value) {
    return shown(value, std::chars_format::fixed, kPageDigits);
}

std::string factor(double value) {
    constexpr int kDigits = 7;
    return shown(value, std::chars_format::general, kDigits);
}

template <class Write>
void addPoint(std::string& path, LayoutPoint const& point, Write write) {
    std::string const y = write(point.y);
    path += write(point.x);
    if (y[0] != '-') path += ' ';
    path += y;
}

template <class Write>
std::string pathData(std::vector<OutlineStep> const& path, Write write) {
    std::string data;
    for (auto const& [kind, at] : path) {
        switch (kind) {
        case OutlineKind::move:
            data += 'M';
            addPoint(data, at[0], write);
            break;
        case OutlineKind::line:
            data += 'L';
            addPoint(data, at[0], write);
            break;
        case OutlineKind::curve:
            data += 'C';
            addPoint(data, at[0], write);
            data += ' ';
            addPoint(data, at[1], write);
            data += ' ';
            addPoint(data, at[2], write);
            break;
        case OutlineKind::close: data += 'Z'; break;
        }
    }
    return data;
}

// ` fill="#RRGGBB"`, with the opacity where it is not whole.
std::string paint(char const* what, PlotColor const& color) {
    auto const part = [](double value) { return static_cast<int>(std::lround(value * 255.0)); };
    std::array<char, 40> text{};
    (void)std::snprintf(text.data(), text.size(), " %s=\"#%02x%02x%02x\"", what, part(color.red),
                        part(color.green), part(color.blue));
    std::string result = text.data();
    if (color.alpha < 1.0)
        result += std::string(" ") + what + "-opacity=\"" + factor(color.alpha) + '"';
    return result;
}

// U+FFFE and U+FFFF, which XML does not allow.
bool isBeyondXml(std::string_view bytes) {
    return bytes.starts_with("\xEF\xBF\xBE") || bytes.starts_with("\xEF\xBF\xBF");
}

std::string escaped(std::string const& words) {
    constexpr std::size_t kBytesBeyond = 3;
    std::string result;
    for (std::size_t i = 0; i < words.size(); ++i) {
        switch (char const c = words[i]) {
        case '&': result += "&amp;"; break;
        case '<': result += "&lt;"; break;
        case '"': result += "&quot;"; break;
        case '\xEF':
            if (isBeyondXml(std::string_view(words).substr(i))) {
                result += ' ';
                i += kBytesBeyond - 1;
                break;
            }
            [[fallthrough]];
        default: result += static_cast<unsigned char>(c) < ' ' ? ' ' : c;
        }
    }
    return result;
}

}  // namespace

SvgWriter::SvgWriter(PlotSheet const& sheet, ByteTaker const& take)
    : sheet_(sheet), take_(take), near_(surroundingsOf(sheet)) {}

void SvgWriter::flush(std::size_t least) {
    if (out_.size() < least) return;
    good_ = good_ && take_(out_);
    out_.clear();
}

void SvgWriter::open() {
    std::string const width = length(sheet_.width);
    std::string const height = length(sheet_.height);
    auto const side = [&](double units) {
        return sheet_.isPaper ? length(units / sheet_.perMillimetre) + "mm" : length(units);
    };
    out_ += "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
            "<svg xmlns=\"http://www.w3.org/2000/svg\" "
            "xmlns:xlink=\"http://www.w3.org/1999/xlink\" width=\"" +
            side(sheet_.width) + "\" height=\"" + side(sheet_.height) + "\" viewBox=\"0 0 " +
            width + ' ' + height + "\" version=\"1.1\">\n<rect width=\"" + width + "\" height=\"" +
            height + "\" fill=\"#ffffff\"/>\n";
    out_ += "<g stroke-linecap=\"round\" stroke-linejoin=\"round\"";
    if (auto const clip = sheet_.clip()) {
        out_ += " clip-path=\"url(#shown)\"><clipPath id=\"shown\"><rect x=\"" +
                length(clip->left) + "\" y=\"" + length(clip->bottom) + "\" width=\"" +
                length(clip->width()) + "\" height=\"" + length(clip->height()) + "\"/></clipPath";
    }
    out_ += ">\n";
}

void SvgWriter::close() {
    closeLine();
    out_ += "</g>\n</svg>\n";
    flush(0);
}

void SvgWriter::addLine(PlotShape const& shape,
                        std::vector<OutlineStep> const& path,
                        double before) {
    StrokeLook const look = strokeOf(sheet_, shape);
    out_ += "<path d=\"" + pathData(path, length) + "\" fill=\"none\"" +
            paint("stroke", shape.color) + " stroke-width=\"" + length(look.width) + '"';
    if (!look.dashes.empty()) {
        char const* mark = " stroke-dasharray=\"";
        for (double const each : look.dashes) {
            out_ += mark + length(each);
            mark = " ";
        }
        out_ += "\" stroke-dashoffset=\"" + length(look.offsetAfter(before)) + '"';
    }
    out_ += "/>\n";
}

void SvgWriter::addStroke(PlotShape const& shape, std::vector<OutlineStep> const& path) {
    if (!reachesBeyond(path, near_)) return addLine(shape, path, 0.0);
    for (LinePiece const& piece : clippedLines(path, near_)) {
        addLine(shape, {{OutlineKind::move, {piece.from}}, {OutlineKind::line, {piece.to}}},
                piece.before);
    }
}

void SvgWriter::addFill(PlotShape const& shape, std::vector<OutlineStep> const& path) {
    bool const isFar = reachesBeyond(path, near_);
    out_ += "<path d=\"" + pathData(isFar ? clippedArea(path, near_) : path, length) + '"' +
            paint("fill", shape.color) + "/>\n";
}

int SvgWriter::numberOf(PlotGlyph const& glyph) {
    auto const [at, isNew] =
        glyphs_.try_emplace({glyph.font, glyph.glyph}, static_cast<int>(glyphs_.size()));
    if (isNew) {
        auto const whole = [](double value) {
            return std::to_string(std::lround(value / kGlyphUnit));
        };
        out_ += "<defs><path id=\"g" + std::to_string(at->second) + "\" d=\"" +
                pathData(outlineOf(glyph.font, glyph.glyph), whole) + "\"/></defs>\n";
    }
    return at->second;
}

// Letters that begin where the last ones ended are of one line.
bool SvgWriter::goesOn(PlotShape const& letters) const {
    constexpr double kAside = 0.1;   // text heights
    constexpr double kBehind = 0.2;  // text heights
    constexpr double kAhead = 0.5;   // text heights
    double const x = last_.to.x - last_.from.x;
    double const y = last_.to.y - last_.from.y;
    double const size = std::hypot(x, y);
    double const toX = letters.from.x - last_.to.x;
    double const toY = letters.from.y - last_.to.y;
    double const ahead = (toX * x + toY * y) / size;
    double const aside = std::fabs(toY * x - toX * y) / size;
    double const height = last_.letterHeight;
    return size > 0.0 && aside <= kAside * height && ahead >= -kBehind * height &&
           ahead <= kAhead * height;
}

void SvgWriter::closeLine() {
    if (!uses_.empty()) {
        out_ += "<g role=\"img\" aria-label=\"" + escaped(words_) + "\">" + uses_ + "</g>\n";
    }
    words_.clear();
    uses_.clear();
}

void SvgWriter::addAlike(PlotShape const& letters, AlikeGlyphs const& glyphs) {
    PlotGlyph const& first = glyphs.front();
    LayoutPoint const start = sheet_.place(first.origin);
    double const area = first.along.x * first.down.y - first.along.y * first.down.x;
    if (!first.font || area == 0.0 || !std::isfinite(start.x) || !std::isfinite(start.y)) return;
    double const unit = sheet_.scale * kGlyphUnit;
    uses_ += "<g" + paint("fill", letters.color) + " transform=\"matrix(" +
             factor(first.along.x * unit) + ' ' + factor(-first.along.y * unit) + ' ' +
             factor(first.down.x * unit) + ' ' + factor(-first.down.y * unit) + ' ' +
             length(start.x) + ' ' + length(start.y) + ")\">";
    for (PlotGlyph const& each : glyphs) {
        if (each.glyph == PANGO_GLYPH_EMPTY || outlineOf(each.font, each.glyph).empty()) continue;
        double const byX = each.origin.x - first.origin.x;
        double const byY = each.origin.y - first.origin.y;
        long const x = std::lround((byX * first.down.y - byY * first.down.x) / area / kGlyphUnit);
        long const y = std::lround((first.along.x * byY - first.along.y * byX) / area / kGlyphUnit);
        uses_ += "<use xlink:href=\"#g" + std::to_string(numberOf(each));
        if (x != 0) uses_ += "\" x=\"" + std::to_string(x);
        if (y != 0) uses_ += "\" y=\"" + std::to_string(y);
        uses_ += "\"/>";
    }
    uses_ += "</g>";
}

void SvgWriter::addLetters(PlotShape const& letters) {
    if (!goesOn(letters)) closeLine();
    double const gap = std::hypot(letters.from.x - last_.to.x, letters.from.y - last_.to.y);
    constexpr double kBlank = 0.2;  // text heights
    if (!words_.empty() && gap > kBlank * letters.letterHeight) words_ += ' ';
    words_ += wordsOf(letters, sheet_);
    eachAlike(
        letters, sheet_, [](PlotGlyph const&) { return false; },
        [&](AlikeGlyphs const& glyphs) { addAlike(letters, glyphs); });
    last_.from = letters.from;
    last_.to = letters.to;
    last_.letterHeight = letters.letterHeight;
}

void SvgWriter::add(PlotShape const& shape) {
    if (isText(sheet_, shape)) {
        addLetters(shape);
        return flush(kPart);
    }
    closeLine();
    bool const isBaseline = isTooSmall(sheet_, shape);
    auto const path = placedPath(sheet_, isBaseline ? baselineOf(shape) : shape.path);
    if (!path) return;
    if (shape.kind == PlotKind::stroke || isBaseline)
        addStroke(shape, *path);
    else
        addFill(shape, *path);
    flush(kPart);
}

bool SvgWriter::write() {
    open();
    sheet_.scene([&](PlotShape const& shape) { add(shape); });
    close();
    return good_;
}

}  // namespace tzhost
