#include "host/shaping/font_rights.h"

#include <hb.h>
#include <pango/pango.h>

#include <algorithm>
#include <array>
#include <memory>

namespace tzhost {
namespace {

struct BlobFree {
    void operator()(hb_blob_t* blob) const { hb_blob_destroy(blob); }
};
using Blob = std::unique_ptr<hb_blob_t, BlobFree>;

Blob tableOf(GlyphFont const& font, hb_tag_t tag) {
    hb_font_t* const shaped = pango_font_get_hb_font(font.get());
    return Blob(hb_face_reference_table(hb_font_get_face(shaped), tag));
}

}  // namespace

bool mayBeEmbedded(GlyphFont const& font) {
    constexpr unsigned int kRights = 8;  // offset of fsType in the table OS/2
    constexpr unsigned int kLevels = 0x000F;
    constexpr unsigned int kRestricted = 0x0002;
    constexpr unsigned int kWholeOrPicturesAlone = 0x0300;
    Blob const table = tableOf(font, HB_TAG('O', 'S', '/', '2'));
    unsigned int length = 0;
    char const* const bytes = hb_blob_get_data(table.get(), &length);
    if (length < kRights + 2) return true;
    auto const byteAt = [&](unsigned int at) {
        return static_cast<unsigned int>(static_cast<unsigned char>(bytes[at]));
    };
    unsigned int const rights = byteAt(kRights) << 8 | byteAt(kRights + 1);
    return (rights & kLevels) != kRestricted && (rights & kWholeOrPicturesAlone) == 0;
}

bool hasOutlines(GlyphFont const& font) {
    constexpr std::array kTables{HB_TAG('g', 'l', 'y', 'f'), HB_TAG('C', 'F', 'F', ' '),
                                 HB_TAG('C', 'F', 'F', '2')};
    return std::any_of(kTables.begin(), kTables.end(), [&](hb_tag_t tag) {
        return hb_blob_get_length(tableOf(font, tag).get()) > 0;
    });
}

std::string faceNameOf(GlyphFont const& font) {
    std::unique_ptr<PangoFontDescription, void (*)(PangoFontDescription*)> const description(
        pango_font_describe(font.get()), pango_font_description_free);
    char const* const family = pango_font_description_get_family(description.get());
    return family ? family : "";
}

}  // namespace tzhost
