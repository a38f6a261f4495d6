#pragma once

#include <cstdint>

#include "tz/export.h"
#include "tz/rx/status.h"

// Colours of entities: an index of the host's fixed palette, a true colour, or "as the layer" and
// "as the block". Plain values.
//
//   TzCmEntityColor color;
//   color.setRGB(200, 20, 20);
//   int const nearest = color.colorIndex();
//
// Indices: 0 as the block, 1 to 255 the palette, 256 as the layer. A COLORREF is 0x00BBGGRR.

// [any] The palette's colour as 0x00BBGGRR; black for 0 and for any index outside 0 to 255.
[[nodiscard]] TZ_API unsigned int tzedGetRGB(int index);

class TZ_API TzCmEntityColor {
public:
    // The bytes that tell the kinds of colour apart.
    enum ColorMethod : std::uint8_t {
        kByLayer = 192,
        kByBlock = 193,
        kByColor = 194,  // a true colour
        kByIndex = 195,
    };

    // As the layer.
    TzCmEntityColor() = default;
    // A true colour.
    TzCmEntityColor(std::uint8_t red, std::uint8_t green, std::uint8_t blue);
    // The colour with that index; as the layer for an index outside 0 to 256.
    [[nodiscard]] static TzCmEntityColor fromIndex(int index);

    [[nodiscard]] ColorMethod colorMethod() const { return method_; }
    // Changes only the kind. The components and the index stay, and count when the kind uses them.
    void setColorMethod(ColorMethod method) { method_ = method; }
    [[nodiscard]] bool isByLayer() const { return method_ == kByLayer; }
    [[nodiscard]] bool isByBlock() const { return method_ == kByBlock; }
    [[nodiscard]] bool isByColor() const { return method_ == kByColor; }
    [[nodiscard]] bool isByIndex() const { return method_ == kByIndex; }

    // Makes it a true colour.
    void setRGB(std::uint8_t red, std::uint8_t green, std::uint8_t blue);
    // Set the components without changing the kind.
    void setRed(std::uint8_t red) { red_ = red; }
    void setGreen(std::uint8_t green) { green_ = green; }
    void setBlue(std::uint8_t blue) { blue_ = blue; }
    // The components; for an index those of the palette, for the layer's or the block's colour 0.
    [[nodiscard]] std::uint8_t red() const;
    [[nodiscard]] std::uint8_t green() const;
    [[nodiscard]] std::uint8_t blue() const;
    // The components as 0x00BBGGRR.
    [[nodiscard]] unsigned int getCOLORREF() const;

    // 256 and 0 for the layer's and the block's, the index, or the palette index nearest to a true
    // colour: the lowest of those at the least squared distance, among 1 to 255.
    [[nodiscard]] int colorIndex() const;
    // 0 block, 256 layer, 1 to 255 palette; eOutOfRange for any other, which changes nothing.
    Tzad::ErrorStatus setColorIndex(int index);

    // Equal when the kinds are equal, and the numbers that this kind uses.
    [[nodiscard]] bool operator==(TzCmEntityColor const& other) const;
    [[nodiscard]] bool operator!=(TzCmEntityColor const& other) const { return !(*this == other); }

private:
    ColorMethod method_ = kByLayer;
    std::uint8_t red_ = 0;
    std::uint8_t green_ = 0;
    std::uint8_t blue_ = 0;
    std::uint8_t index_ = 0;
};

// The colour of an object that keeps one beside its drawing, such as a background or a layer.
class TZ_API TzCmColor : public TzCmEntityColor {
public:
    using TzCmEntityColor::TzCmEntityColor;
    TzCmColor() = default;
    TzCmColor(TzCmEntityColor const& color) : TzCmEntityColor(color) {}
};

// How much shows through, in per cent: 0 (the default) is solid, 90 the most.
class TZ_API TzCmTransparency {
public:
    TzCmTransparency() = default;

    [[nodiscard]] int percent() const { return percent_; }
    // eOutOfRange outside 0 to 90, which changes nothing.
    Tzad::ErrorStatus setPercent(int percent);
    [[nodiscard]] bool isSolid() const { return percent_ == 0; }
    // 255 solid, 0 would be invisible.
    [[nodiscard]] std::uint8_t alpha() const;

    [[nodiscard]] bool operator==(TzCmTransparency const& other) const {
        return percent_ == other.percent_;
    }
    [[nodiscard]] bool operator!=(TzCmTransparency const& other) const { return !(*this == other); }

private:
    int percent_ = 0;
};
