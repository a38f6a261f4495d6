#include "module/align/selection_keywords.h"

#include "module/align/align_command.h"
#include "tz/rx/status.h"

TzMTextAlignCmd* TzMTextAlignSSCallbackHandler::m_command = nullptr;

resbuf* TzMTextAlignSSCallbackHandler::keywordCallback(wchar_t const* keyword) {
    struct Handler {
        wchar_t const* keyword;  // case counts
        bool (*handle)();
    };
    static constexpr Handler kHandlers[] = {
        {L"alIgnment", promptAlignDirectionOpt},
        {L"Options", promptOptions},
    };
    TzString const word(keyword);
    for (Handler const& handler : kHandlers)
        if (word == handler.keyword) (void)handler.handle();  // the selection goes on either way
    return nullptr;
}

bool TzMTextAlignSSCallbackHandler::promptAlignDirectionOpt() {
    if (!m_command || m_command->acquireAlignDirection() != Tzad::ePromptNormal) return false;
    m_command->reportCurrentSettings();
    return true;
}

bool TzMTextAlignSSCallbackHandler::promptOptions() {
    if (!m_command || m_command->acquireAlignOption() != Tzad::ePromptNormal) return false;
    m_command->reportCurrentSettings();
    return true;
}
