#pragma once

#include "tz/db/object.h"
#include "tz/text/array.h"
#include "tz/text/string.h"

// A text that is computed: code forms %<\Var NAME>%, %<\Date>%, %<\File>%, %<\Object HANDLE
// property>%, mixed with plain text. One that cannot be evaluated shows "####".
//
//   TzDbField* field = new TzDbField;
//   field->setFieldCode(L"Drawn %<\\Date>%", 0, nullptr);
//   if (field->evaluate(0x20, database) == Tzad::eOk) text = field->getFieldCode(2);
//   field->close(); delete field;                    // it is in no database
class TZ_API TzDbField : public TzDbObject {
public:
    TzDbField();
    ~TzDbField() override;

    // [write-open] The code; flags 0 and 0x100 are treated alike. `children` may be null.
    Tzad::ErrorStatus
    setFieldCode(wchar_t const* code, int flags, TzArray<TzDbField*> const* children);
    // [any] Flag 2 gives the evaluated text, anything else the text with its codes.
    [[nodiscard]] TzString getFieldCode(int flags) const;
    // [write-open] Computes the text; the context 0x20 evaluates every kind of code. A database of
    // null means the working one.
    [[nodiscard]] Tzad::ErrorStatus evaluate(int context, TzDbDatabase* database);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    void subViewportDraw(TzGiViewportDraw* draw) override;
    unsigned int subSetAttributes(TzGiDrawableTraits* traits) override;
};

// [any] Whether a text holds field codes; the second argument is 1.
[[nodiscard]] TZ_API bool tzdbHasFields(wchar_t const* text, int options);
// [any] The next field at or after `start`: the index of its first character and that of the first
// one after it; false when there is none.
[[nodiscard]] TZ_API bool tzdbFindField(wchar_t const* text, int start, int& first, int& end);
// [command] Tells the host that a text got a new field.
TZ_API void tzedTextFieldModified(TzDbField* field);
