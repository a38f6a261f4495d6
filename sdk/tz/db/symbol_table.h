#pragma once

#include "tz/db/object.h"
#include "tz/ge/point3d.h"
#include "tz/gi/color.h"
#include "tz/text/array.h"
#include "tz/text/string.h"

// The tables of a database: layers, line types, text styles, blocks. A table is opened, asked for a
// record or walked by an iterator, and closed; records are opened by id. Names compare without
// case. Tables are walked in file order, new records last.

// Walks a table. Made by the table's newIterator and deleted by the caller, while the table is
// open.
class TZ_API TzDbSymbolTableIterator {
public:
    virtual ~TzDbSymbolTableIterator() = default;
    // To the first record, or with `atBeginning` false to the last; erased ones are passed over
    // unless told not to.
    virtual void start(bool atBeginning = true, bool skipErased = true) = 0;
    [[nodiscard]] virtual bool done() const = 0;
    virtual void step(bool forward = true, bool skipErased = true) = 0;
    // The null id past the end.
    [[nodiscard]] virtual TzDbObjectId getRecordId() const = 0;
};

class TZ_API TzDbSymbolTableRecord : public TzDbObject {
public:
    // [any] Valid until the record is renamed or erased; never null.
    [[nodiscard]] wchar_t const* getName() const;
    // [write-open] Refuses a name that isValidSymbolName of tz/ed/prompts.h refuses, with
    // eInvalidSymbolName, and one that the table has.
    Tzad::ErrorStatus setName(wchar_t const* name);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    explicit TzDbSymbolTableRecord(TzDbObjectImp* imp);
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    void subViewportDraw(TzGiViewportDraw* draw) override;
    unsigned int subSetAttributes(TzGiDrawableTraits* traits) override;
};

class TZ_API TzDbSymbolTable : public TzDbObject {
public:
    // [read-open] The id of a record; eKeyNotFound and the null id when there is none.
    [[nodiscard]] Tzad::ErrorStatus getIdAt(wchar_t const* name, TzDbObjectId& id) const;
    [[nodiscard]] bool has(wchar_t const* name) const;
    // [write-open] Takes a record over; a name that the table already has is refused, and the
    // record stays the caller's. The record then is open for write until its close.
    [[nodiscard]] Tzad::ErrorStatus addRecord(TzDbSymbolTableRecord* record, TzDbObjectId& id);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    explicit TzDbSymbolTable(TzDbObjectImp* imp);
    // The caller deletes it; null on failure.
    [[nodiscard]] TzDbSymbolTableIterator* makeIterator(bool atBeginning, bool skipErased) const;
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    void subViewportDraw(TzGiViewportDraw* draw) override;
    unsigned int subSetAttributes(TzGiDrawableTraits* traits) override;
};

class TZ_API TzDbLayerTableRecord : public TzDbSymbolTableRecord {
public:
    TzDbLayerTableRecord();
    [[nodiscard]] bool isLocked() const;
    Tzad::ErrorStatus setIsLocked(bool locked);
    // What lies on a layer that is off is neither drawn nor found by a pick.
    [[nodiscard]] bool isOff() const;
    Tzad::ErrorStatus setIsOff(bool off);
    [[nodiscard]] TzCmColor color() const;
    Tzad::ErrorStatus setColor(TzCmColor const& color);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

class TZ_API TzDbLinetypeTableRecord : public TzDbSymbolTableRecord {
public:
    TzDbLinetypeTableRecord();
    // 0 for a solid line. Lengths in drawing units, gaps negative.
    [[nodiscard]] int numDashes() const;
    [[nodiscard]] double dashLengthAt(int index) const;
    Tzad::ErrorStatus setDashes(TzArray<double> const& lengths);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

class TZ_API TzDbTextStyleTableRecord : public TzDbSymbolTableRecord {
public:
    TzDbTextStyleTableRecord();
    // 0 means that each text chooses its height.
    [[nodiscard]] double textSize() const;
    Tzad::ErrorStatus setTextSize(double size);
    [[nodiscard]] double xScale() const;
    Tzad::ErrorStatus setXScale(double scale);
    // Radians.
    [[nodiscard]] double obliquingAngle() const;
    Tzad::ErrorStatus setObliquingAngle(double radians);
    // 2 backward, 4 upside down.
    [[nodiscard]] int flagBits() const;
    Tzad::ErrorStatus setFlagBits(int bits);
    [[nodiscard]] bool isVertical() const;
    Tzad::ErrorStatus setIsVertical(bool vertical);
    [[nodiscard]] TzString fileName() const;
    Tzad::ErrorStatus setFileName(wchar_t const* file);
    [[nodiscard]] TzString bigFontFileName() const;
    Tzad::ErrorStatus setBigFontFileName(wchar_t const* file);
    // The typeface with its description; an empty typeface for a style that names a font file.
    [[nodiscard]] Tzad::ErrorStatus
    font(TzString& typeface, bool& bold, bool& italic, int& charset, int& pitchAndFamily) const;
    // Character set, and pitch with family, from 0 to 255; eOutOfRange for others.
    Tzad::ErrorStatus
    setFont(wchar_t const* typeface, bool bold, bool italic, int charset, int pitchAndFamily);

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

class TZ_API TzDbLayerTable : public TzDbSymbolTable {
public:
    explicit TzDbLayerTable(TzDbObjectImp* imp) : TzDbSymbolTable(imp) {}
    [[nodiscard]] Tzad::ErrorStatus newIterator(TzDbSymbolTableIterator*& iterator,
                                                bool atBeginning = true,
                                                bool skipErased = true) const;
    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

class TZ_API TzDbLinetypeTableIterator {
public:
    explicit TzDbLinetypeTableIterator(TzDbSymbolTableIterator* walk) : walk_(walk) {}
    ~TzDbLinetypeTableIterator() { delete walk_; }
    TzDbLinetypeTableIterator(TzDbLinetypeTableIterator const&) = delete;
    TzDbLinetypeTableIterator& operator=(TzDbLinetypeTableIterator const&) = delete;
    void start(bool atBeginning = true, bool skipErased = true) {
        walk_->start(atBeginning, skipErased);
    }
    [[nodiscard]] bool done() const { return walk_->done(); }
    void step(bool forward = true, bool skipErased = true) { walk_->step(forward, skipErased); }
    // [read-open] Opens the record where the walk stands; the caller closes it.
    [[nodiscard]] Tzad::ErrorStatus getRecord(TzDbLinetypeTableRecord*& record,
                                              TzDb::OpenMode mode) const {
        return tzdbOpenObject(record, walk_->getRecordId(), mode);
    }

private:
    TzDbSymbolTableIterator* walk_;  // owned
};

class TZ_API TzDbLinetypeTable : public TzDbSymbolTable {
public:
    explicit TzDbLinetypeTable(TzDbObjectImp* imp) : TzDbSymbolTable(imp) {}
    [[nodiscard]] Tzad::ErrorStatus newIterator(TzDbLinetypeTableIterator*& iterator,
                                                bool atBeginning = true,
                                                bool skipErased = true) const;
    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

class TZ_API TzDbTextStyleTableIterator {
public:
    explicit TzDbTextStyleTableIterator(TzDbSymbolTableIterator* walk) : walk_(walk) {}
    ~TzDbTextStyleTableIterator() { delete walk_; }
    TzDbTextStyleTableIterator(TzDbTextStyleTableIterator const&) = delete;
    TzDbTextStyleTableIterator& operator=(TzDbTextStyleTableIterator const&) = delete;
    void start(bool atBeginning = true, bool skipErased = true) {
        walk_->start(atBeginning, skipErased);
    }
    [[nodiscard]] bool done() const { return walk_->done(); }
    void step(bool forward = true, bool skipErased = true) { walk_->step(forward, skipErased); }
    // [read-open] Opens the record where the walk stands; the caller closes it.
    [[nodiscard]] Tzad::ErrorStatus getRecord(TzDbTextStyleTableRecord*& record,
                                              TzDb::OpenMode mode) const {
        return tzdbOpenObject(record, walk_->getRecordId(), mode);
    }

private:
    TzDbSymbolTableIterator* walk_;  // owned
};

class TZ_API TzDbTextStyleTable : public TzDbSymbolTable {
public:
    explicit TzDbTextStyleTable(TzDbObjectImp* imp) : TzDbSymbolTable(imp) {}
    [[nodiscard]] Tzad::ErrorStatus newIterator(TzDbTextStyleTableIterator*& iterator,
                                                bool atBeginning = true,
                                                bool skipErased = true) const;
    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};
