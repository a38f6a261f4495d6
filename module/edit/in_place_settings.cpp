#include "module/edit/in_place_settings.h"

#include <algorithm>
#include <iterator>

#include "module/host_calls/sys_var.h"
#include "tz/mte/globals.h"
#include "tz/pal/settings.h"

namespace {

constexpr std::uint32_t kColors[] = {0x006767CB, 0x00CB6767, 0x00966414, 0x00A05050};
constexpr std::uint32_t kFifthColor = 0x005050A0;
constexpr std::uint32_t kMinimumPixelSize = 6;
constexpr std::uint32_t kFixedPixelSize = 12;
constexpr unsigned kOption13 = 13;
constexpr unsigned kOption14 = 14;

// Sizes that the product settings leave out keep what they are.
void readPixelSizes(IPESettings& settings) {
    namespace PAL = Tzworks::Tzdraft::PAL;
    PAL::Settings::read().getProductSettings(
        L"MTEXT.IPE",
        [&settings](PAL::Settings::Container const& given) {
            if (given.exists(L"MinPixelSize"))
                settings.minimumPixelSize = given.getUInt32(L"MinPixelSize");
            if (given.exists(L"FixedPixelSize"))
                settings.fixedPixelSize = given.getUInt32(L"FixedPixelSize");
            return true;
        },
        true);
}

}  // namespace

IPESettings inPlaceSettings(TzDbMText const& text, InPlaceOptions const& options) {
    IPESettings settings;
    settings.viewFlag = options.view;
    settings.attribute = options.attribute;
    settings.editable = true;
    if (options.attribute) {
        bool const inPlace = CTzadSysVar::GetInt(L"ATTIPE") != 0;
        settings.viewFlag = inPlace;
        settings.plainAttribute = !inPlace;
    }
    settings.options =
        (options.option13 ? 1U << kOption13 : 0U) | (options.option14 ? 1U << kOption14 : 0U);
    settings.boxHeight = text.database() ? 0.0 : gdJigBoundBoxHeight;
    settings.scale = 1.0;
    std::copy(std::begin(kColors), std::end(kColors), settings.colors);
    settings.fifthColor = kFifthColor;
    settings.minimumPixelSize = kMinimumPixelSize;
    settings.fixedPixelSize = kFixedPixelSize;
    readPixelSizes(settings);
    return settings;
}
