#include "host/layout/face_table.h"

#include <fontconfig/fontconfig.h>

#include <array>
#include <map>
#include <memory>
#include <string>

#include "tz/text/string.h"

namespace tzhost {
namespace {

struct StrokeRow {
    wchar_t const* part;  // what the file's name holds, in lower case
    wchar_t const* typeface;
    bool italic;
};

// Stroke fonts by what their names tell; the first row that fits counts, and the last fits all.
constexpr std::array kStrokeFaces{
    StrokeRow{L"mono", L"DejaVu Sans Mono", false},
    StrokeRow{L"ital", L"DejaVu Sans", true},
    StrokeRow{L"", L"DejaVu Sans", false},
};

std::wstring lowerCase(std::wstring const& text) {
    return TzString(text).makeLower().str();
}

// The last part of a path, in lower case. Drawings come with separators of either kind.
std::wstring fileName(std::wstring const& path) {
    return lowerCase(path.substr(path.find_last_of(L"/\\") + 1));
}

std::wstring textOf(FcPattern* font, char const* property) {
    FcChar8* value = nullptr;
    if (FcPatternGetString(font, property, 0, &value) != FcResultMatch) {
        return {};
    }
    return TzString::fromUtf8(reinterpret_cast<char const*>(value)).str();
}

LayoutFace faceOfPattern(FcPattern* font) {
    int weight = FC_WEIGHT_REGULAR;
    int slant = FC_SLANT_ROMAN;
    (void)FcPatternGetInteger(font, FC_WEIGHT, 0, &weight);  // absent: the value set above
    (void)FcPatternGetInteger(font, FC_SLANT, 0, &slant);
    return {textOf(font, FC_FAMILY), weight >= FC_WEIGHT_DEMIBOLD, slant != FC_SLANT_ROMAN};
}

// Every installed font file by its name in lower case, read once.
std::map<std::wstring, LayoutFace> const& installedFiles() {
    static std::map<std::wstring, LayoutFace> const files = [] {
        std::map<std::wstring, LayoutFace> found;
        std::unique_ptr<FcPattern, decltype(&FcPatternDestroy)> const all(FcPatternCreate(),
                                                                          &FcPatternDestroy);
        std::unique_ptr<FcObjectSet, decltype(&FcObjectSetDestroy)> const wanted(
            FcObjectSetBuild(FC_FILE, FC_FAMILY, FC_WEIGHT, FC_SLANT, nullptr),
            &FcObjectSetDestroy);
        std::unique_ptr<FcFontSet, decltype(&FcFontSetDestroy)> const set(
            FcFontList(nullptr, all.get(), wanted.get()), &FcFontSetDestroy);
        for (int i = 0; set != nullptr && i < set->nfont; ++i) {
            found.try_emplace(fileName(textOf(set->fonts[i], FC_FILE)),
                              faceOfPattern(set->fonts[i]));
        }
        return found;
    }();
    return files;
}

LayoutFace faceOfFile(std::wstring const& path) {
    std::wstring const name = fileName(path);
    if (!name.ends_with(L".shx") && name.find(L'.') != std::wstring::npos) {
        auto const file = installedFiles().find(name);
        if (file != installedFiles().end()) {
            return file->second;
        }
    }
    for (StrokeRow const& row : kStrokeFaces) {
        if (name.find(row.part) != std::wstring::npos) {
            return {row.typeface, false, row.italic};
        }
    }
    return {};
}

LayoutFace faceOfName(std::wstring const& name, bool bold, bool italic) {
    // The mark of a vertical face is no part of its name.
    bool const marked = !name.empty() && name.front() == L'@';
    return {marked ? name.substr(1) : name, bold, italic};
}

}  // namespace

LayoutFace faceOfStyle(LayoutStyle const& style) {
    return style.typeface.empty() ? faceOfFile(style.fontFile)
                                  : faceOfName(style.typeface, style.bold, style.italic);
}

LayoutFace faceOfMarkup(MarkupFont const& font) {
    return font.byFile ? faceOfFile(font.name) : faceOfName(font.name, font.bold, font.italic);
}

}  // namespace tzhost
