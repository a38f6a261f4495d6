// The questions for the columns of a new text. Their defaults are multiples of the text height, so
// that Enter at every question gives columns in proportion to the text.

#include <iterator>

#include "module/mtext/column_outcome.h"
#include "module/prompt/asking.h"
#include "module/prompt/integer_input.h"
#include "module/prompt/keyword_input.h"
#include "module/prompt/real_input.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/db/mtext.h"
#include "tz/mte/mtext_command.h"

namespace {

// Only the bits for empty, zero and negative answers and for free text have a meaning; the other
// bits of this number change nothing and are kept.
constexpr unsigned kCountFlags = 0x138F;
constexpr int kDefaultCount = 2;

// A question for a size: its prompt, its flags, and its default in text heights.
struct SizeQuestion {
    unsigned prompt;
    unsigned flags;
    double heights;
};
constexpr SizeQuestion kTotalWidth{kText.totalWidthPrompt, kRefusesZero | kRefusesNegative, 80.0};
constexpr SizeQuestion kColumnWidth{kText.columnWidthPrompt, kRefusesZero | kRefusesNegative, 30.0};
constexpr SizeQuestion kColumnGutter{kText.gutterWidthPrompt, kRefusesNegative, 5.0};
constexpr SizeQuestion kColumnHeight{kText.columnHeightPrompt, kRefusesZero | kRefusesNegative,
                                     10.0};

bool askSize(SizeQuestion const& question, double textHeight, double& size) {
    CKeywordTable none;
    CTzsRealInput input(question.flags, none, gStringTable[question.prompt]);
    input.SetDefault(textHeight * question.heights);
    return askOnce(input, [&] { size = input.GetReal(); });
}

// The present type stays when the question failed.
void chooseType(int status, CTzsKeywordInput& input, TextEditorColumns& columns) {
    unsigned chosen = 0;
    switch (status) {
    case statusNone: chosen = input.GetDefault(); break;
    case statusNormal:
    case statusKeyword: chosen = input.GetKeyword(); break;
    default: return;
    }
    switch (chosen) {
    case kText.dynamicColumns:
        columns.columnType = TzDbMText::kDynamicColumns;
        columns.autoHeight = true;
        break;
    case kText.staticColumns: columns.columnType = TzDbMText::kStaticColumns; break;
    default: columns.columnType = TzDbMText::kNoColumns; break;
    }
}

}  // namespace

bool TzxMtextCommand::DoTotalWidthPrompt() {
    return askSize(kTotalWidth, textHeight, boxWidth);
}

bool TzxMtextCommand::DoColumnWidthPrompt() {
    return askSize(kColumnWidth, textHeight, columns.columnWidth);
}

bool TzxMtextCommand::DoColumnGutterPrompt() {
    return askSize(kColumnGutter, textHeight, columns.columnGutter);
}

bool TzxMtextCommand::DoColumnHeightPrompt() {
    return askSize(kColumnHeight, textHeight, boxHeight);
}

bool TzxMtextCommand::DoColumnCountPrompt() {
    CKeywordTable none;
    CTzsIntegerInput input(kCountFlags, none, gStringTable[kText.columnCountPrompt]);
    input.SetDefault(kDefaultCount);
    return askUntilAnswered(input, [&] { columns.columnCount = input.GetInteger(); });
}

int TzxMtextCommand::DoColumnPrompt() {
    unsigned int ids[] = {kText.dynamicColumns, kText.staticColumns, kText.noColumns};
    CKeywordTable keywords(ids, static_cast<int>(std::size(ids)));
    CTzsKeywordInput input(0, keywords, gStringTable[kText.columnTypePrompt]);
    input.SetDefault(kText.dynamicColumns);
    int const status = input.Prompt();
    if (status == statusCancel) return kColumnsCancelled;
    chooseType(status, input, columns);

    if (columns.columnType == TzDbMText::kNoColumns) return kColumnsNone;
    bool const answered = columns.columnType == TzDbMText::kStaticColumns
                              ? DoTotalWidthPrompt() && DoColumnCountPrompt()
                              : DoColumnWidthPrompt();
    if (!answered || !DoColumnGutterPrompt() || !DoColumnHeightPrompt()) return kColumnsCancelled;
    columnsConfirmed = true;
    return kColumnsSetUp;
}
