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
//   if (command->DoMainPrompt(false, true)) accepted = command->CreateObject(nullptr, false);
//   delete command;
//
// Lengths in drawing units, angles in radians; points in world coordinates but for firstCornerUcs.
// The constructor reads the drawing's defaults, so a drawing must be open.
//
// The questions, Do... [command], store their answers in the members below. False means that the
// user cancelled: the value that was asked for last is as before, and earlier answers stay. A
// question that the host could not ask is asked again, unless its comment says otherwise.

// The options and the questions that commands share.
class TZ_API TzxMtextCommandBase {
public:
    TzxMtextCommandBase();

    void UseCommandLineEditor(bool use) { useCommandLineEditor = use; }
    // [any] Whether a text style of that name is in the drawing.
    [[nodiscard]] bool IsStyleNameOK(TzString const& name) const;
    // [read-open] Takes the options from an entity; [write-open] writes them to one. They are not
    // exact inverses: reading adds the working globals' angle to the rotation, writing does not
    // take it away. A value that the entity refuses leaves it as it is.
    void setMTextOptionsFrom(TzDbMText* entity);
    void setMTextOptionsTo(TzDbMText* entity) const;
    // [any] Takes the text height that the command's style gives.
    void ComputeTextSize();
    // [any] Factor 1, at least.
    void ResetLineSpacing();
    // [any] Stores a factor from 0.25 to 4; false for any other. One that misses a limit by no more
    // than the rounding of the drawing's units is pulled onto it.
    [[nodiscard]] bool ValidateLineSpacingFactor(double factor);
    [[nodiscard]] double getTextHeight() const { return textHeight; }

    // Which of the nine points of its box the text is attached to. Enter takes the top left one,
    // whatever the attachment was.
    [[nodiscard]] bool DoAttachPrompt();
    // The rotation, as an angle or by a point from the first corner; Enter keeps it.
    [[nodiscard]] bool DoRotatePrompt();
    // The text height; Enter keeps it. For an annotative style it is asked for, and shown, times
    // the annotation scale. With `useBase` a point is measured from the first corner, else from a
    // first point. Asked once: a failed question changes nothing and gives true.
    [[nodiscard]] bool DoHeightPrompt(bool useBase);
    // The width of the box; Enter gives 0, a text that does not wrap. Asked once, as the height is.
    [[nodiscard]] bool DoWidth();
    // At least or exactly; Enter keeps what it is.
    [[nodiscard]] bool DoLineSpacingStylePrompt();
    // The distance of lines, or a factor written with an x after it; Enter keeps the factor. For a
    // factor outside the limits a message is shown and the question asked again.
    [[nodiscard]] bool DoLineSpacingFactorPrompt();
    // Both questions, in this order. When the user cancels at the factor, the new style stays.
    [[nodiscard]] bool DoLineSpacingPrompts();
    // The text, line by line up to an empty one; each line is a paragraph.
    [[nodiscard]] bool DoTextString();
    // The text style, asked again for one that is not in the drawing or belongs to another drawing
    // ("|" in its name); "?" lists the styles. Enter keeps it, and a failed question too. The text
    // height stays.
    [[nodiscard]] bool DoStylePrompt();
    // [command] Asks for a pattern, and lists the drawing's text styles that fit it.
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

    // The first corner, which goes to both points and to LASTPOINT, and, when wanted, the second
    // one. Enter takes the place where the preview stands. `forAttribute` asks for an attribute's
    // text: other words, no line about style and height.
    [[nodiscard]] bool DoMainPrompt(bool forAttribute, bool wantSecondPoint);
    // The opposite corner, from `location`, with the options as keywords; columns are none for an
    // attribute. A pick, or Enter, takes the box as it is dragged. A width, or columns, asked for
    // by keyword end the question too, and the text then begins at the first corner. A new height
    // or style resets the line spacing. A cancel at an option cancels the whole question.
    [[nodiscard]] bool DoSecondPointPrompt(bool forAttribute);
    // The kind of columns, then its sizes: -1 cancelled, 0 no columns, 1 columns set up. Enter
    // chooses dynamic columns of automatic height; a failed question goes on with the present kind.
    [[nodiscard]] int DoColumnPrompt();
    // From 2 to 100; Enter gives 2.
    [[nodiscard]] bool DoColumnCountPrompt();
    // Sizes. Enter gives 80, 30, 5 and 10 text heights; each is asked once, and a failed question
    // changes nothing and gives true. The total width becomes boxWidth, the height boxHeight.
    [[nodiscard]] bool DoTotalWidthPrompt();
    [[nodiscard]] bool DoColumnWidthPrompt();
    [[nodiscard]] bool DoColumnGutterPrompt();
    [[nodiscard]] bool DoColumnHeightPrompt();
    // [command] Makes the entity from the options and asks for its text: 1 when the user accepted
    // that, else 0. With `existing` null a new entity is posted to the drawing; it is deleted when
    // the user does not accept. When the drawing refuses an accepted entity, that entity is lost
    // although the result is 1. With `existing` the caller's entity is filled instead; it must be
    // open for write or in no drawing, stays open and is not posted. When the user does not accept,
    // it keeps the options that it got. When the user accepts, the options become the drawing's
    // defaults for new texts. `forAttribute` is for the text of an attribute, which is not moved to
    // the layer of new texts. Column sizes and the text height may change on the way.
    [[nodiscard]] int CreateObject(TzDbMText* existing, bool forAttribute);
    // [any] For outside callers, instead of the first questions.
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
