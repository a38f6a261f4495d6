#pragma once

// The host's value record, and lists of them: values of system variables, arguments of interpreter
// calls, selection filters. A record names its type and holds one value; a list is linked by
// `rbnext`.
//
//   resbuf* filter = tzutNewRb(0);
//   filter->resval.rstring = tzutNewString(L"MTEXT");
//   ...
//   tzutRelRb(filter);                 // the list with its strings
//
// Strings in a record belong to the record: they come from tzutNewString and go with tzutRelRb or
// tzutDelString. [any]

#include "tz/export.h"

namespace Tzad {

// Types of values; the low group codes of selection filters (0 for the kind of an entity) stand
// beside them in the same member.
enum ResultType : short {
    eResultNone = 5000,
    eResultReal = 5001,
    eResultPoint2d = 5002,
    eResultShort = 5003,
    eResultAngle = 5004,
    eResultString = 5005,
    eResultEntityName = 5006,
    eResultSelectionSet = 5007,
    eResultOrientation = 5008,
    eResultPoint3d = 5009,
    eResultLong = 5010,
    eResultVoid = 5014,
    eResultListBegin = 5016,
    eResultListEnd = 5017,
    eResultEntityKind = 5020,  // in selection filters: the kind of an entity, as group code 0
};

}  // namespace Tzad

// One value; which member is live follows from the record's type.
union resval_u {
    double rreal;         // reals, angles, orientations
    double rpoint[3];     // points
    short rint;           // shorts
    wchar_t* rstring;     // strings and the kinds in filters
    int rlong;            // longs, 32 bits
    long long rlname[2];  // names of entities and selection sets
};

struct resbuf {
    resbuf* rbnext;
    short restype;
    resval_u resval;
};

// A fresh record of that type: value zero, no successor. The caller releases it with tzutRelRb.
[[nodiscard]] TZ_API resbuf* tzutNewRb(int type);
// Releases a list with the strings in it. Null is allowed. Returns 5100.
TZ_API int tzutRelRb(resbuf* list);
// A copy of a string that a record may hold; null reads as the empty text.
[[nodiscard]] TZ_API wchar_t* tzutNewString(wchar_t const* text);
// Releases a string that the host gave and clears the pointer. Null is allowed.
TZ_API void tzutDelString(wchar_t*& text);
// The same for texts that a question of the host gave.
TZ_API void tzutDelBuffer(wchar_t*& text);
// Whether a record of that type holds a string.
[[nodiscard]] TZ_API bool tzutHoldsString(int type);
