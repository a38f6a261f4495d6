#pragma once

#include "tz/db/object_id.h"
#include "tz/export.h"
#include "tz/text/array.h"

class TzApDocument;

// What a filter may do with the arrays that the host shows it. Indices are those of the array as it
// was handed over and stay so until the callback ends, whatever was removed before.
class TZ_API TzEdSelectionSetService {
public:
    virtual ~TzEdSelectionSetService() = default;
    // [filter] Takes one entry out; 0, or a failing status for an index outside the array. O(1).
    virtual int remove(int index) = 0;
    // [filter] Takes several out; an index outside is skipped and gives the failing status.
    virtual int remove(TzArray<int> const& indices) = 0;
};

// Root of what may listen to a document's input.
class TZ_API TzEdInputContextReactor {
public:
    virtual ~TzEdInputContextReactor() = default;
};

// Decides what a selection may hold while it runs. A filter overrides only the operations that it
// needs.
class TZ_API TzEdSSGetFilter : public TzEdInputContextReactor {
public:
    // Entities are about to be added: the whole set so far, and the new ones, of which the service
    // removes by index. Runs for each addition, the implied selection included.
    virtual void ssgetAddFilter(int flags,
                                TzEdSelectionSetService& service,
                                TzArray<TzDbObjectId> const& selectionSet,
                                TzArray<TzDbObjectId> const& subSelectionSet);
    // The same for entities that are about to be taken out of the set.
    virtual void ssgetRemoveFilter(int flags,
                                   TzEdSelectionSetService& service,
                                   TzArray<TzDbObjectId> const& selectionSet,
                                   TzArray<TzDbObjectId> const& subSelectionSet);
    // The selection is complete, with `status` as its result so far; the service removes from the
    // set. Runs before tzedSSGet returns, for the implied selection too.
    virtual void endSSGet(int status,
                          int flags,
                          TzEdSelectionSetService& service,
                          TzArray<TzDbObjectId> const& selectionSet);
};

// [command] Installs a filter on a document's input, or takes it back; the host does not own it.
// The bits of `flags` ask for hooks: 1 additions, 2 removals, 4 the end; 15 asks for every one.
// False when the document is null, when a filter to install is already there, and when one to take
// back is not.
TZ_API bool
addSSgetFilterInputContextReactor(TzApDocument* document, TzEdSSGetFilter* filter, int flags);
TZ_API bool removeSSgetFilterInputContextReactor(TzApDocument* document, TzEdSSGetFilter* filter);
