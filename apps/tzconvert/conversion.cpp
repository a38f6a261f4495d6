#include "apps/tzconvert/conversion.h"

#include <utility>

#include "module/markup/mtext_to_rtf.h"
#include "module/markup/rtf_to_mtext.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/scale_correction.h"
#include "tz/text/string.h"

namespace tzconvert {
namespace {

constexpr int kTwipsPerHalfPoint = 10;

// The font map and the scales, which both ways of a round trip share.
class Session {
public:
    explicit Session(Options const& options) : options_(options) {
        for (CScaleCorrection* scale : {&fontScale_, &marginScale_}) {
            scale->SetScaleUnits(options.size);
            scale->SetScaleTwips(options.twips);
        }
        // The style's size comes back as itself, also when a size beside it is met first.
        int const halfPoints = options.twips / kTwipsPerHalfPoint;
        fontScale_.AddScale(halfPoints * kTwipsPerHalfPoint, options.size);
        results_.tracking = options.tracking;
        results_.widthFactor = options.widthFactor;
        results_.oblique = options.oblique;
        results_.baseAlignment = options.baseAlignment;
        results_.minFontSize = results_.maxFontSize = halfPoints;
        results_.initialFontSize = results_.currentFontSize = halfPoints;
    }

    [[nodiscard]] std::wstring toRtf(std::wstring const& markup) {
        CMTextToRichTextContext context(&fonts_, &fontScale_, &marginScale_);
        setFont(context);
        context.SetInitialFontColor(options_.color);
        setColors(context);
        std::wstring rtf = context.Parse(markup);
        results_ = {context.GetIncidents(),       context.GetTracking(),
                    context.GetCharWidth(),       context.GetOblique(),
                    context.GetBaseAlignment(),   context.GetMinFontSize(),
                    context.GetMaxFontSize(),     context.GetInitialFontSize(),
                    context.GetCurrentFontSize(), context.StacksSeen()};
        return rtf;
    }

    [[nodiscard]] std::wstring toMtext(std::wstring const& rtf) {
        CRichTextToMTextContext context(&fonts_, &fontScale_, &marginScale_);
        setFont(context);
        setColors(context);
        context.SetInitialColor(options_.color);
        context.SetTracking(results_.tracking);
        context.SetCharWidth(results_.widthFactor);
        context.SetOblique(results_.oblique);
        context.SetBaseAlignment(static_cast<VerticalAlignment>(results_.baseAlignment), 0);
        if (options_.keepsTrailingParagraphs)
            context.SetOptions(CRichTextToMTextContext::kKeepTrailingParagraphs);
        std::wstring markup = context.Parse(rtf);
        results_.stacksSeen = results_.stacksSeen || context.StackSeen();
        return markup;
    }

    [[nodiscard]] Results const& results() const { return results_; }

private:
    template <class Context>
    void setFont(Context& context) {
        if (options_.face.empty()) {
            context.SetInitialFontFileName(TzString::fromUtf8(options_.fontFile));
        } else {
            context.SetInitialFontName(TzString::fromUtf8(options_.face), options_.bold,
                                       options_.italic, static_cast<Charset>(options_.charset),
                                       options_.pitch);
        }
        context.SetInitialFontSize(options_.size, options_.twips);
    }

    // The two must differ, as they tell ByLayer and ByBlock apart.
    template <class Context>
    void setColors(Context& context) {
        if (options_.byLayer) context.SetByLayerColor(*options_.byLayer);
        if (!options_.byBlock) return;
        bool const isSame = options_.byLayer == options_.byBlock;
        context.SetByBlockColor(*options_.byBlock ^ (isSame ? 1U : 0U));
    }

    Options const& options_;
    CMTextFontMapDatabase fonts_{0};
    CScaleCorrection fontScale_{1};
    CScaleCorrection marginScale_{0};
    Results results_;
};

}  // namespace

Converted convert(Options const& options, std::wstring text) {
    Session session(options);
    if (options.direction != Direction::toMtext) text = session.toRtf(text);
    if (options.direction != Direction::toRtf) text = session.toMtext(text);
    return {std::move(text), session.results()};
}

}  // namespace tzconvert
