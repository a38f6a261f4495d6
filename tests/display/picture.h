#pragma once

#include <cairo.h>

#include <cstddef>
#include <string>

// A PNG picture read back.
class Picture {
public:
    explicit Picture(std::string png);
    ~Picture() { cairo_surface_destroy(surface_); }
    Picture(Picture const&) = delete;
    Picture& operator=(Picture const&) = delete;

    [[nodiscard]] int width() const { return cairo_image_surface_get_width(surface_); }
    [[nodiscard]] int height() const { return cairo_image_surface_get_height(surface_); }
    // The colour of a pixel as 0xRRGGBB.
    [[nodiscard]] unsigned int at(int x, int y) const;
    // How many pixels have a colour.
    [[nodiscard]] int count(unsigned int color) const;
    // How many have it or a shade between it and white, as the edges of thin lines do; for colours
    // whose components are 0 or 255.
    [[nodiscard]] int countShades(unsigned int color) const;

private:
    template <class Test>
    [[nodiscard]] int countIf(Test const& test) const;
    static cairo_status_t read(void* closure, unsigned char* data, unsigned int length);

    std::string bytes_;
    std::size_t next_ = 0;
    cairo_surface_t* surface_;
};
