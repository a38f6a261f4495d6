#pragma once

#include "tz/db/mtext.h"
#include "tz/db/text_columns.h"
#include "tz/ed/telemetry.h"
#include "tz/export.h"
#include "tz/ge/point3d.h"
#include "tz/rx/object.h"
#include "tz/text/string.h"

// One run of MTEXT: the options that its questions change, the questions, and the making of the
// entity.
//
//   TzxMtextCommand* command = newTzxMtextCommand();
//   command->UseCommandLineEditor(true);
//   if (command->DoMainPrompt(false, true)) command->CreateObject(nullptr, false);
//   delete command;
//
// Lengths in drawing units, angles in radians; points in world coordinates but for firstCornerUcs.
// The constructor reads the drawing's defaults, so a drawing must be open. A question that returns
// false was cancelled and changed nothing.

// The options and the questions that commands share.
class TZ_API TzxMtextCommandBase {
public:
    TzxMtextCommandBase();

    void UseCommandLineEditor(bool use) { useCommandLineEditor = use; }
    // Whether a text style of that name is in the drawing.
    [[nodiscard]] bool IsStyleNameOK(TzString const& name) const;
    // Reads the options from an entity, or writes them to one that is open for write. They are not
    // exact inverses: reading adds the working globals' angle to the rotation, writing does not
    // take it away.
    void setMTextOptionsFrom(TzDbMText* entity);
    void setMTextOptionsTo(TzDbMText* entity) const;
    // The text height that the style in force gives.
    void ComputeTextSize();
    // Factor 1, at least.
    void ResetLineSpacing();
    // Stores a factor from 0.25 to 4; false for any other.
    bool ValidateLineSpacingFactor(double factor);
    [[nodiscard]] double getTextHeight() const { return textHeight; }

    bool DoAttachPrompt();
    bool DoRotatePrompt();
    bool DoHeightPrompt(bool useBase);
    bool DoWidth();
    bool DoLineSpacingStylePrompt();
    bool DoLineSpacingFactorPrompt();
    bool DoLineSpacingPrompts();
    bool DoTextString();
    bool DoStylePrompt();
    // Lists the drawing's text styles.
    static void EnumerateStyles();

    bool useCommandLineEditor = false;  // the text comes from the command line, not from an editor
    unsigned int attachmentId = 1048;   // keyword 1048 to 1056, top left to bottom right
    unsigned int directionId = 1057;    // keyword of the flow direction; nothing changes it
    double boxWidth = 0;
    double boxHeight = 0;  // of the box or of the columns
    double textHeight = 0;
    double rotation = 0;
    double location[3] = {0, 0, 0};
    double firstCornerUcs[3] = {0, 0, 0};
    TzString styleName;
    TzString contents;
    bool boxDragged = false;   // the second corner was picked in the drag
    int lineSpacingStyle = 1;  // 1 at least, 2 exactly
    double lineSpacingFactor = 1;
    TzTelemetryCmdHelper telemetry;
};

// The command with its columns and its dialogue.
class TZ_API TzxMtextCommand : public TzRxObject, public TzxMtextCommandBase {
public:
    TzxMtextCommand();
    ~TzxMtextCommand() override;

    // The first corner and, when wanted, the second one; `forAttribute` for an attribute's text.
    bool DoMainPrompt(bool forAttribute, bool wantSecondPoint);
    bool DoSecondPointPrompt(bool forAttribute);
    // The column questions: -1 cancelled, 0 no columns, 1 columns set up.
    int DoColumnPrompt();
    bool DoColumnCountPrompt();
    bool DoTotalWidthPrompt();
    bool DoColumnWidthPrompt();
    bool DoColumnGutterPrompt();
    bool DoColumnHeightPrompt();
    // Makes the entity: a new one, posted to the drawing, with `existing` null; else fills the
    // caller's, which is not posted. True when the text was accepted.
    int CreateObject(TzDbMText* existing, bool forAttribute);
    // For outside callers, instead of the first questions.
    void setInitialProperties(TzGePoint3d const& location,
                              double width,
                              double rotation,
                              double height,
                              unsigned int attachmentId,
                              wchar_t const* styleName);

    static TzRxClass* gpDesc;
    static TzRxClass* desc();
    static TzRxClass* rxInit();
    [[nodiscard]] TzRxClass* isA() const override;

    TextEditorColumns columns;
    bool columnsConfirmed = false;  // the column questions ran to their end
};
