#pragma once

#include "tz/export.h"

struct resbuf;

// Selections and picks. A selection set and an entity are named by pairs of 64-bit integers; a set
// lives from tzedSSGet to tzedSSFree, at most to the end of the command. Statuses as in
// tz/ed/prompts.h.
//
// Modes of tzedSSGet, in one text, null as "": "_" nothing further; "I" the implied set; "X" all
// entities of both spaces; "L" the newest entity; "P" the set that was selected last; "W" and "C"
// what lies in the box between two points, and what it touches; ":$" the second argument is a pair
// of prompts (to add and to remove); ":K" the question's words go to the keyword callback and the
// question goes on; ":L" and ":l" leave out entities on locked layers; ":c" and ":p" change
// nothing. A mode without a capital asks the user, or takes a point that is given as the second
// argument.
//
// A filter is a list of conditions, all of which an entity must meet: codes 0 and 5020 the type's
// name, 8 the layer, 7 the text style; names may hold the wildcards of tzutWcMatchEx.

// [command] `first` and `second` are points (double[3], user coordinates) or, with ":$", `first` is
// a wchar_t const*[2] of prompts and `second` a wchar_t const* with a list of words, in the form of
// tzedInitGet; they may be null. `filter` may be null. 5100 with at least one entity, and `set`
// takes the name of a new set; -5001 with none, for an unknown mode or filter code, -5002 on
// cancel, -5005 for a keyword that goes to no callback: then `set` takes a name of no set. The
// flags of tzedInitGet do not apply; its words do, and those of `second` when it armed none.
[[nodiscard]] TZ_API int tzedSSGet(wchar_t const* mode,
                                   void const* first,
                                   void const* second,
                                   resbuf const* filter,
                                   long long* set);
// [command] How many entities the set holds. -5001 for a set that is not there.
[[nodiscard]] TZ_API int tzedSSLength(long long const* set, int* length);
// [command] The name of the entity at `index`, from 0. -5001 outside the set.
[[nodiscard]] TZ_API int tzedSSName(long long const* set, int index, long long* name);
// [command] Frees the set; a set freed before may be freed again (5100).
TZ_API int tzedSSFree(long long const* set);
// [command] Makes `selected` the implied selection, or drops that when it is null; `grips` is the
// part of it to grip, which this host shows nowhere, and may be null.
TZ_API int tzedSSSetFirst(long long const* grips, long long const* selected);

// [command] Picks one entity. `name` and `point` (user coordinates) change only with 5100; a pick
// that hits nothing gives -5001.
[[nodiscard]] TZ_API int tzedEntSel(wchar_t const* prompt, long long* name, double* point);
// [command] Picks one entity, also inside block references. `pickFlag` 0 asks, 1 takes `point` as
// the pick. `matrix` (4 by 4, rows) maps the entity's coordinates to world; `references` takes a
// list of the references around it, inmost first, null at top level, that the caller releases with
// tzutRelRb.
[[nodiscard]] TZ_API int tzedNEntSelP(wchar_t const* prompt,
                                      long long* name,
                                      double* point,
                                      int pickFlag,
                                      double (*matrix)[4],
                                      resbuf** references);

// The process-wide callback that takes the keywords of a selection with ":K": it gets the global
// word and may ask questions of its own; a list that it returns is ignored. The callback may be
// null. [any] Both give 5100; reading it into a null pointer gives -5001.
using TzedSSKeywordCallback = resbuf* (*)(wchar_t const* keyword);
TZ_API int tzedSSGetKwordCallbackPtr(TzedSSKeywordCallback* callback);
TZ_API int tzedSSSetKwordCallbackPtr(TzedSSKeywordCallback callback);

// [any] Whether `text` matches a pattern of *, ?, [...], a leading ~ for "not", and lists with
// commas; with `ignoreCase` case does not count.
[[nodiscard]] TZ_API bool
tzutWcMatchEx(wchar_t const* text, wchar_t const* pattern, bool ignoreCase);
