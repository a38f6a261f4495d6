#pragma once

#include "tz/ed/selection_filter.h"
#include "tz/text/string.h"

class TzApDocument;

// How many entities a selection held when it ended, locked ones included, and how many of those
// were on locked layers.
struct FilterCount {
    int found = 0;
    int locked = 0;
};

// While this filter lives, it takes the entities on locked layers out of a selection that ends, and
// counts them.
//
//   TzLockedWarningFilter const filter(tzDocManagerPtr()->curDocument());
//   (void)selectMText(set, L"_I", KindCode::result);
//   if (filter.counts().locked > 0) TzLockedWarningFilter::sendWarning(...);
class [[nodiscard]] TzLockedWarningFilter : public TzEdSSGetFilter {
public:
    // Without a document there is nothing to watch.
    explicit TzLockedWarningFilter(TzApDocument* document);
    TzLockedWarningFilter(TzLockedWarningFilter const&) = delete;
    TzLockedWarningFilter& operator=(TzLockedWarningFilter const&) = delete;
    ~TzLockedWarningFilter() override;

    // Zeros until a selection that held an entity has ended.
    [[nodiscard]] FilterCount counts() const { return m_counts; }

    void endSSGet(int status,
                  int flags,
                  TzEdSelectionSetService& service,
                  TzArray<TzDbObjectId> const& selectionSet) override;

    // Warns once: `lockedLine` for each locked entity, the number found, and the number locked, for
    // which there is a text of its own when it is one. The host reads the warning as a format, so
    // none of the texts may hold a stray percent sign.
    static void sendWarning(TzString warningId,
                            TzString lockedLine,
                            TzString foundFormat,
                            TzString oneLockedText,
                            TzString manyLockedFormat,
                            FilterCount counts);

private:
    TzApDocument* m_document;
    FilterCount m_counts;
};
