#pragma once

#include "module/prompt/input.h"
#include "module/prompt/jig_entity.h"

// A question that is answered by a drag, with a preview.
//
//   CTzsMtextJig preview(corner);
//   CTzsJigInput input(TzEdJig::kGovernedByOrthoMode, table, &preview, gStringTable[1073]);
//   while (input.Prompt() == statusKeyword) use(input.GetKeyword());
//
// The preview is not owned and must outlive the input.
class CTzsJigInput : public CTzsInput {
public:
    CTzsJigInput(TzEdJig::UserInputControls controls,
                 CKeywordTable& table,
                 CTzsJigEntity* preview,
                 TzString const& prompt);

    // The keyword that ended the drag; 0 when none did.
    [[nodiscard]] unsigned int GetKeyword() override;
    [[nodiscard]] TzString PromptString() const override;
    // What the last drag learned, for telemetry; valid as long as the input.
    [[nodiscard]] TzEdJigInputData const& getInputData() const;
    void Init() override;
    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

private:
    CTzsJigHandler driver_;
    unsigned int resultKeyword_ = 0;
};
