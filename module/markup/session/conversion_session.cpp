#include "module/markup/session/conversion_session.h"

#include <utility>

namespace {

template <class Context>
void setFont(Context& context, TextStart const& start) {
    StartFont const& font = start.font;
    if (font.face.empty()) {
        context.SetInitialFontFileName(font.file.c_str());
    } else {
        context.SetInitialFontName(font.face.c_str(), font.bold, font.italic, font.charset,
                                   font.pitchAndFamily);
    }
    context.SetInitialFontSize(start.size, start.twips);
}

void setColors(CRichTextColorTable& colors, TextStart const& start) {
    if (start.byLayer != kUnsetColor) colors.SetByLayerColor(start.byLayer);
    if (start.byBlock != kUnsetColor) colors.SetByBlockColor(start.byBlock);
}

MarkupFindings findingsOf(CMTextToRichTextContext const& context) {
    MarkupFindings found;
    found.wholeText = {context.GetTracking(), context.GetCharWidth(), context.GetOblique(),
                       context.GetBaseAlignment()};
    found.incidents = context.GetIncidents();
    found.incidentCounts = context.incidentCounts();
    found.stacksSeen = context.StacksSeen();
    found.minFontSize = context.GetMinFontSize();
    found.maxFontSize = context.GetMaxFontSize();
    found.initialFontSize = context.GetInitialFontSize();
    found.currentFontSize = context.GetCurrentFontSize();
    return found;
}

}  // namespace

void ConversionTables::setScales(double units, int twips) const {
    for (CScaleCorrection* scale : {fontScale, marginScale}) {
        scale->SetScaleUnits(units);
        scale->SetScaleTwips(twips);
    }
}

unsigned int colorBeside(unsigned int rgb, unsigned int other) {
    return rgb == other ? rgb ^ 1U : rgb;
}

void setUp(CMTextToRichTextContext& context, TextStart const& start) {
    setFont(context, start);
    context.SetInitialFontColor(start.color);
    setColors(context, start);
}

// The index of the initial colour may be that of ByLayer or ByBlock, which are set before it.
void setUp(CRichTextToMTextContext& context, TextStart const& start, WholeText const& values) {
    setFont(context, start);
    setColors(context, start);
    context.SetInitialColor(start.color);
    context.SetTracking(values.tracking);
    context.SetCharWidth(values.charWidth);
    context.SetOblique(values.oblique);
    context.SetBaseAlignment(values.baseAlignment, 0);
}

WrittenRtf
toRtf(ConversionTables const& tables, TextStart const& start, std::wstring const& markup) {
    CMTextToRichTextContext context(tables.fonts, tables.fontScale, tables.marginScale);
    setUp(context, start);
    CStdStrW rtf = context.parseOnce(markup);
    return {std::move(rtf), findingsOf(context)};
}

WrittenMarkup toMarkup(ConversionTables const& tables,
                       TextStart const& start,
                       WholeText const& values,
                       unsigned int options,
                       std::wstring const& rtf) {
    CRichTextToMTextContext context(tables.fonts, tables.fontScale, tables.marginScale);
    setUp(context, start, values);
    context.SetOptions(options);
    CStdStrW markup = context.parseOnce(rtf);
    return {std::move(markup), context.StackSeen(), context.losses()};
}

ConversionSession::ConversionSession(TextStart start) : start_(std::move(start)) {
    tables().setScales(start_.size, start_.twips);
}

WrittenRtf ConversionSession::toRtf(std::wstring const& markup) {
    return ::toRtf(tables(), start_, markup);
}

WrittenMarkup ConversionSession::toMarkup(std::wstring const& rtf,
                                          WholeText const& values,
                                          unsigned int options) {
    return ::toMarkup(tables(), start_, values, options, rtf);
}
