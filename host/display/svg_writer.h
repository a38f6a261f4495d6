#pragma once

#include <map>
#include <string>
#include <utility>

#include "host/display/plot_glyphs.h"
#include "host/display/plot_paint.h"

// Writes a sheet as SVG. Each glyph is defined once and used wherever it stands, and each line of
// letters carries its words for readers and searches.
namespace tzhost {

class SvgWriter {
public:
    SvgWriter(PlotSheet const& sheet, ByteTaker const& take);

    // False when a part was not taken.
    [[nodiscard]] bool write();

private:
    void open();
    void close();
    void add(PlotShape const& shape);
    void addStroke(PlotShape const& shape, std::vector<OutlineStep> const& path);
    void addLine(PlotShape const& shape, std::vector<OutlineStep> const& path, double before);
    void addFill(PlotShape const& shape, std::vector<OutlineStep> const& path);
    void addLetters(PlotShape const& letters);
    void addAlike(PlotShape const& letters, AlikeGlyphs const& glyphs);
    [[nodiscard]] bool goesOn(PlotShape const& letters) const;
    void closeLine();
    [[nodiscard]] int numberOf(PlotGlyph const& glyph);
    void flush(std::size_t least);

    PlotSheet const& sheet_;
    ByteTaker const& take_;
    LayoutBox near_;
    std::string out_;
    std::map<std::pair<GlyphFont, unsigned int>, int> glyphs_;  // by their number in the file
    // The line of letters that is open.
    std::string words_;
    std::string uses_;
    PlotShape last_;  // its last letters, without their path and glyphs
    bool good_ = true;
};

}  // namespace tzhost
