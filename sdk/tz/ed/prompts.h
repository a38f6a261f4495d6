#pragma once

#include "tz/export.h"
#include "tz/text/string.h"

class TzDbDatabase;

// The questions of the command line. A question prints its prompt, reads one answer and gives back
// a status: 5100 a value was given, 5000 an empty answer, -5001 a failure or a refused answer,
// -5002 cancel, -5005 a keyword (its global word waits for tzedGetInput). A host may also give
// -5008 for a line that is too long; the embedded one says so and asks again.
//
//   1. tzedInitGet with flags and keywords, for the next question alone
//   2. the question
//   3. tzedGetInput after -5005
//
// Bits of the flags: 1 refuses an empty answer, 2 zero, 4 negative values, 0x80 gives free text
// back as -5005; other bits change nothing. A refused answer prints one line and asks again inside
// the host. All questions may be called while a command runs [command], also from a selection's
// keyword callback.

// Arms the next question. `keywords` lists the words with blanks between them, the local ones
// first; after " _" the same number of global words may follow. A word's capitals are its
// abbreviation. Null and "" mean none. 5100, or -5001 when the two lists differ in length; what was
// armed before then stays armed.
TZ_API int tzedInitGet(int flags, wchar_t const* keywords);
// A keyword of the armed list; `result` takes the global word. An empty answer gives 5000 when the
// flags let it through. An empty answer and a failure leave `result` alone.
[[nodiscard]] TZ_API int tzedGetKword(wchar_t const* prompt, TzString& result);
// A line of text; with `allowSpaces` not 0 blanks belong to it, else a blank ends it. `result` is
// emptied first. An empty answer gives 5100 and an empty text.
[[nodiscard]] TZ_API int tzedGetString(int allowSpaces, wchar_t const* prompt, TzString& result);
// A point in user coordinates, which becomes the last point. A base point, in user coordinates or
// null, is for hosts with a screen. `result` holds three coordinates and changes only with 5100.
[[nodiscard]] TZ_API int tzedGetPoint(double const* base, wchar_t const* prompt, double* result);
// A real number; no points.
[[nodiscard]] TZ_API int tzedGetReal(wchar_t const* prompt, double* result);
// An integer from `low` to `high`; any other is refused, and the question asked again.
[[nodiscard]] TZ_API int tzedGetInt(wchar_t const* prompt, int* result, int low, int high);
// An angle in radians, as a number in the drawing's units or by points; 0 is the X axis of the user
// system, anticlockwise. Here angle and orientation are the same.
[[nodiscard]] TZ_API int tzedGetAngle(double const* base, wchar_t const* prompt, double* result);
[[nodiscard]] TZ_API int tzedGetOrient(double const* base, wchar_t const* prompt, double* result);
// A length, as a number in the drawing's units or by a point from the base point, or by two points.
[[nodiscard]] TZ_API int tzedGetDist(double const* base, wchar_t const* prompt, double* result);
// What the last question left: the global word of the keyword or the free text, after -5005. 5100,
// or -5001 with an empty result when nothing waits.
[[nodiscard]] TZ_API int tzedGetInput(TzString& result);

// [any] Whether a command may show a dialog now: the variable DIALOGS. `useDefaults` changes
// nothing.
[[nodiscard]] TZ_API bool tzedInitDialog(bool useDefaults);
// [any] Whether a recorded macro gives the answers: the variable MACROPLAYBACK.
[[nodiscard]] TZ_API bool tzedMacroPlayback();

// The question for a name of a symbol (style, layer, block). It lets "?", "*", patterns and names
// with "|" through and refuses other characters that no symbol may hold.
class TZ_API TzEdSymbolUtilities {
public:
    class TZ_API Services {
    public:
        virtual ~Services() = default;
        // [any] Whether a text may be the name of a new symbol: not empty, at most 255 characters,
        // no blank at either end, no control character and none of < > / \ " : ; ? * | , = `
        [[nodiscard]] virtual bool isValidSymbolName(wchar_t const* name) const = 0;
        // [command] Asks for a name. `result` takes a text of the host's, null when there is none,
        // that the caller releases with tzutDelBuffer whatever the status. `database` may be null.
        [[nodiscard]] virtual int
        getSymbolString(wchar_t*& result, wchar_t const* prompt, TzDbDatabase* database) = 0;
    };
    // [any] Never null, lives with the process.
    [[nodiscard]] static Services* servicesPtr100();
};
