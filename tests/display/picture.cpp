#include "tests/display/picture.h"

#include <cstring>
#include <utility>

Picture::Picture(std::string png)
    : bytes_(std::move(png)), surface_(cairo_image_surface_create_from_png_stream(read, this)) {
    cairo_surface_flush(surface_);
}

unsigned int Picture::at(int x, int y) const {
    unsigned char const* const row =
        cairo_image_surface_get_data(surface_) + y * cairo_image_surface_get_stride(surface_);
    unsigned int pixel = 0;
    std::memcpy(&pixel, row + 4 * x, sizeof pixel);
    return pixel & 0xFFFFFF;
}

template <class Test>
int Picture::countIf(Test const& test) const {
    int found = 0;
    for (int y = 0; y < height(); ++y) {
        for (int x = 0; x < width(); ++x)
            found += test(at(x, y)) ? 1 : 0;
    }
    return found;
}

int Picture::count(unsigned int color) const {
    return countIf([color](unsigned int pixel) { return pixel == color; });
}

int Picture::countShades(unsigned int color) const {
    constexpr unsigned int kWhite = 0xFFFFFF;
    return countIf([color](unsigned int p) { return (p & color) == color && p != kWhite; });
}

cairo_status_t Picture::read(void* closure, unsigned char* data, unsigned int length) {
    auto* const self = static_cast<Picture*>(closure);
    if (self->bytes_.size() - self->next_ < length) return CAIRO_STATUS_READ_ERROR;
    std::memcpy(data, self->bytes_.data() + self->next_, length);
    self->next_ += length;
    return CAIRO_STATUS_SUCCESS;
}
