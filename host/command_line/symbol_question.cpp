// The question for the name of a style, a layer or a block.

#include "host/base/fault_point.h"
#include "host/command_line/question.h"
#include "host/command_line/symbol_names.h"
#include "host/database/drawing.h"
#include "host/database/symbol_name.h"
#include "host/text/local_text.h"
#include "tz/ed/prompts.h"
#include "tz/rx/resbuf.h"

namespace {

// The question does not say which table it is about. Modules ask it for text styles alone.
tzhost::Offer offerFor(TzDbDatabase* database) {
    tzhost::Drawing const* const drawing = tzhost::drawingOf(database);
    TzDbObjectId const styles = drawing ? drawing->textStyleTableId() : TzDbObjectId();
    return {tzhost::Offer::Kind::names, tzhost::symbolNames(styles)};
}

class SymbolServices : public TzEdSymbolUtilities::Services {
public:
    [[nodiscard]] bool isValidSymbolName(wchar_t const* name) const override {
        if (tzhost::faultAt("TzEdSymbolUtilities::isValidSymbolName")) return false;
        return tzhost::isSymbolName(name ? name : L"");
    }

    [[nodiscard]] int
    getSymbolString(wchar_t*& result, wchar_t const* prompt, TzDbDatabase* database) override {
        result = nullptr;
        if (auto const failed = tzhost::failsAt("TzEdSymbolUtilities::getSymbolString")) {
            return *failed;
        }
        tzhost::Question question(tzhost::QuestionKind::symbol, prompt);
        if (tzhost::commandLine().isPerson()) question.setOffer(offerFor(database));
        return question.ask([&](std::wstring_view answer) {
            if (!tzhost::isNameOrPattern(answer)) {
                return tzhost::Reply::unreadable(tzhost::localText(
                    L"That is no name: it is too long or holds one of < > / \\ \" : ; = `"));
            }
            result = tzutNewString(std::wstring(answer).c_str());
            return tzhost::Reply::done(Tzad::ePromptNormal);
        });
    }
};

}  // namespace

TzEdSymbolUtilities::Services* TzEdSymbolUtilities::servicesPtr100() {
    static SymbolServices services;
    return &services;
}
