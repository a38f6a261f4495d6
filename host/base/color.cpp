#include "tz/gi/color.h"

#include "host/base/palette.h"

namespace {

constexpr int kByBlockIndex = 0;
constexpr int kByLayerIndex = 256;
constexpr int kMostTransparent = 90;

std::uint8_t byteOf(unsigned int rgb, int shift) {
    return static_cast<std::uint8_t>((rgb >> shift) & 0xFF);
}

}  // namespace

unsigned int tzedGetRGB(int index) {
    return tzhost::paletteColor(index);
}

TzCmEntityColor::TzCmEntityColor(std::uint8_t red, std::uint8_t green, std::uint8_t blue) {
    setRGB(red, green, blue);
}

TzCmEntityColor TzCmEntityColor::fromIndex(int index) {
    TzCmEntityColor color;
    (void)color.setColorIndex(index);  // one that is refused leaves "as the layer"
    return color;
}

void TzCmEntityColor::setRGB(std::uint8_t red, std::uint8_t green, std::uint8_t blue) {
    method_ = kByColor;
    red_ = red;
    green_ = green;
    blue_ = blue;
}

unsigned int TzCmEntityColor::getCOLORREF() const {
    switch (method_) {
    case kByColor:
        return red_ | (static_cast<unsigned int>(green_) << 8) |
               (static_cast<unsigned int>(blue_) << 16);
    case kByIndex: return tzhost::paletteColor(index_);
    default: return 0;
    }
}

std::uint8_t TzCmEntityColor::red() const {
    return byteOf(getCOLORREF(), 0);
}

std::uint8_t TzCmEntityColor::green() const {
    return byteOf(getCOLORREF(), 8);
}

std::uint8_t TzCmEntityColor::blue() const {
    return byteOf(getCOLORREF(), 16);
}

int TzCmEntityColor::colorIndex() const {
    switch (method_) {
    case kByLayer: return kByLayerIndex;
    case kByBlock: return kByBlockIndex;
    case kByIndex: return index_;
    case kByColor: break;
    }
    return tzhost::nearestPaletteIndex(getCOLORREF());
}

Tzad::ErrorStatus TzCmEntityColor::setColorIndex(int index) {
    if (index < kByBlockIndex || index > kByLayerIndex) return Tzad::eOutOfRange;
    if (index == kByLayerIndex) {
        method_ = kByLayer;
    } else if (index == kByBlockIndex) {
        method_ = kByBlock;
    } else {
        method_ = kByIndex;
        index_ = static_cast<std::uint8_t>(index);
    }
    return Tzad::eOk;
}

bool TzCmEntityColor::operator==(TzCmEntityColor const& other) const {
    if (method_ != other.method_) return false;
    return method_ == kByIndex ? index_ == other.index_ : getCOLORREF() == other.getCOLORREF();
}

Tzad::ErrorStatus TzCmTransparency::setPercent(int percent) {
    if (percent < 0 || percent > kMostTransparent) return Tzad::eOutOfRange;
    percent_ = percent;
    return Tzad::eOk;
}

std::uint8_t TzCmTransparency::alpha() const {
    return static_cast<std::uint8_t>((255 * (100 - percent_) + 50) / 100);
}
