#include <algorithm>
#include <cmath>

#include "host/database/geometry.h"
#include "host/database/symbol_imp.h"
#include "tz/db/symbol_table.h"

using tzhost::assign;
using tzhost::LayerImp;
using tzhost::LinetypeImp;
using tzhost::reshape;
using tzhost::TextStyleImp;
using tzhost::valuesOf;

TzDbLayerTableRecord::TzDbLayerTableRecord() : TzDbSymbolTableRecord(new LayerImp) {}

bool TzDbLayerTableRecord::isLocked() const {
    return valuesOf<LayerImp>(*this).locked;
}

Tzad::ErrorStatus TzDbLayerTableRecord::setIsLocked(bool locked) {
    return assign(*this, "TzDbLayerTableRecord::setIsLocked", &LayerImp::locked, locked);
}

bool TzDbLayerTableRecord::isOff() const {
    return valuesOf<LayerImp>(*this).off;
}

Tzad::ErrorStatus TzDbLayerTableRecord::setIsOff(bool off) {
    return assign(*this, "TzDbLayerTableRecord::setIsOff", &LayerImp::off, off);
}

TzCmColor TzDbLayerTableRecord::color() const {
    return valuesOf<LayerImp>(*this).color;
}

// A layer's colour is an index of the palette or a true colour.
Tzad::ErrorStatus TzDbLayerTableRecord::setColor(TzCmColor const& color) {
    bool const valid = !color.isByLayer() && !color.isByBlock();
    return assign(*this, "TzDbLayerTableRecord::setColor", &LayerImp::color, color, valid);
}

TzDbLinetypeTableRecord::TzDbLinetypeTableRecord() : TzDbSymbolTableRecord(new LinetypeImp) {}

int TzDbLinetypeTableRecord::numDashes() const {
    return static_cast<int>(valuesOf<LinetypeImp>(*this).dashes.size());
}

double TzDbLinetypeTableRecord::dashLengthAt(int index) const {
    auto const& dashes = valuesOf<LinetypeImp>(*this).dashes;
    return index >= 0 && index < numDashes() ? dashes[static_cast<std::size_t>(index)] : 0.0;
}

Tzad::ErrorStatus TzDbLinetypeTableRecord::setDashes(TzArray<double> const& lengths) {
    bool const valid = std::all_of(lengths.begin(), lengths.end(),
                                   [](double each) { return std::isfinite(each); });
    return assign(*this, "TzDbLinetypeTableRecord::setDashes", &LinetypeImp::dashes,
                  std::vector<double>(lengths.begin(), lengths.end()), valid);
}

TzDbTextStyleTableRecord::TzDbTextStyleTableRecord() : TzDbSymbolTableRecord(new TextStyleImp) {}

double TzDbTextStyleTableRecord::textSize() const {
    return valuesOf<TextStyleImp>(*this).height;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setTextSize(double size) {
    return reshape(*this, "TzDbTextStyleTableRecord::setTextSize", &TextStyleImp::height, size,
                   tzhost::isSize(size));
}

double TzDbTextStyleTableRecord::xScale() const {
    return valuesOf<TextStyleImp>(*this).widthFactor;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setXScale(double scale) {
    return reshape(*this, "TzDbTextStyleTableRecord::setXScale", &TextStyleImp::widthFactor, scale,
                   tzhost::isPositive(scale));
}

double TzDbTextStyleTableRecord::obliquingAngle() const {
    return valuesOf<TextStyleImp>(*this).oblique;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setObliquingAngle(double radians) {
    return reshape(*this, "TzDbTextStyleTableRecord::setObliquingAngle", &TextStyleImp::oblique,
                   radians, std::isfinite(radians));
}

int TzDbTextStyleTableRecord::flagBits() const {
    return valuesOf<TextStyleImp>(*this).flagBits;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setFlagBits(int bits) {
    constexpr int kKnown = 2 | 4;
    return reshape(*this, "TzDbTextStyleTableRecord::setFlagBits", &TextStyleImp::flagBits, bits,
                   (bits & ~kKnown) == 0);
}

bool TzDbTextStyleTableRecord::isVertical() const {
    return valuesOf<TextStyleImp>(*this).vertical;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setIsVertical(bool vertical) {
    return reshape(*this, "TzDbTextStyleTableRecord::setIsVertical", &TextStyleImp::vertical,
                   vertical);
}

TzString TzDbTextStyleTableRecord::fileName() const {
    return valuesOf<TextStyleImp>(*this).fontFile;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setFileName(wchar_t const* file) {
    return reshape(*this, "TzDbTextStyleTableRecord::setFileName", &TextStyleImp::fontFile,
                   std::wstring(file ? file : L""));
}

TzString TzDbTextStyleTableRecord::bigFontFileName() const {
    return valuesOf<TextStyleImp>(*this).bigFontFile;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setBigFontFileName(wchar_t const* file) {
    return reshape(*this, "TzDbTextStyleTableRecord::setBigFontFileName",
                   &TextStyleImp::bigFontFile, std::wstring(file ? file : L""));
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::font(
    TzString& typeface, bool& bold, bool& italic, int& charset, int& pitchAndFamily) const {
    if (auto const fault = tzhost::faultStatus("TzDbTextStyleTableRecord::font")) return fault;
    TextStyleImp const& values = valuesOf<TextStyleImp>(*this);
    typeface = values.typeface;
    bold = values.bold;
    italic = values.italic;
    charset = values.charset;
    pitchAndFamily = values.pitchAndFamily;
    return Tzad::eOk;
}

Tzad::ErrorStatus TzDbTextStyleTableRecord::setFont(
    wchar_t const* typeface, bool bold, bool italic, int charset, int pitchAndFamily) {
    constexpr int kByte = 255;
    bool const valid =
        charset >= 0 && charset <= kByte && pitchAndFamily >= 0 && pitchAndFamily <= kByte;
    auto const status = reshape(*this, "TzDbTextStyleTableRecord::setFont", &TextStyleImp::typeface,
                                std::wstring(typeface ? typeface : L""), valid);
    if (status) return status;
    TextStyleImp& values = valuesOf<TextStyleImp>(*this);
    values.bold = bold;
    values.italic = italic;
    values.charset = charset;
    values.pitchAndFamily = pitchAndFamily;
    return Tzad::eOk;
}
