// Stacked text of the markup.

#include "module/host_calls/truncate.h"
#include "module/markup/read_markup/markup_numbers.h"
#include "module/markup/read_markup/stack_look_ahead.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/shared/rtf_units.h"
#include "module/markup/write_rtf/mtext_to_rtf.h"
#include "tz/mte/globals.h"

void CMTextToRichTextContext::onStack(wchar_t const*& cursor) {
    m_bStacksSeen = true;
    if (!stacks_) stacks_ = std::make_unique<StackLookAhead>(text_);
    if (!stacks_->isStack(cursor)) {
        Append(L"\\\\S");
        ReportIncident(kStackWithoutSign);
        return;
    }
    appendStack(rebuiltStack(GetString(cursor)));
}

// At the outermost level a pending size is written now. In a group it stays pending, and the stack
// carries the factor of that size in per cent.
void CMTextToRichTextContext::appendStack(std::wstring_view text) {
    int percent = 100;
    if (m_nPendingFontSize != 0) {
        if (m_nState == 0)
            flushSize();
        else
            percent = truncatedToInt(lastFactor_ * 100);
    }
    std::wstring stack(L"{\\dn");
    appendDecimal(stack, kStackMarker);
    stack += L" \\";
    stack += gszStartOfStackToken;
    stack += L'<';
    appendDecimal(stack, m_eBaseAlignment);
    stack += L',';
    appendDecimal(stack, percent);
    stack += L">}";
    stack += text;
    stack += L"{\\dn";
    appendDecimal(stack, kStackMarker);
    stack += L" \\";
    stack += gszEndOfStackToken;
    stack += L'}';
    Append(std::wstring_view(stack));
}
