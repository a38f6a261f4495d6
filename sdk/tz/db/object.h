#pragma once

#include "tz/db/object_id.h"
#include "tz/export.h"
#include "tz/gi/drawable.h"
#include "tz/rx/status.h"

class TzDbField;
class TzDbObjectImp;

namespace TzDb {
enum OpenMode : int { kForRead = 0, kForWrite = 1, kForNotify = 2 };
}

// Root of what a database holds. An object of the database is reached by its id, opened for read or
// write, and closed:
//   1. tzdbOpenObject
//   2. its operations; those that change it need it open for write
//   3. close
// An object may be open for read many times at once, or for write once. An object that was never
// added to a database counts as open for write and is deleted by its owner; `close` on it fails.
// Between close and the next opening only the host reaches the object: callers keep its id, never
// its address.
//
// Statuses: 0; 15 another holder has it open for read; 45 for write; 83 it is already open for
// write; 87 its layer is locked (opening for write and upgrading; opening for read always works).
class TZ_API TzDbObject : public TzGiDrawable {
public:
    ~TzDbObject() override;
    TzDbObject(TzDbObject const&) = delete;
    TzDbObject& operator=(TzDbObject const&) = delete;

    // [any] The null id and a null database for an object that is in no database.
    [[nodiscard]] TzDbObjectId objectId() const;
    [[nodiscard]] TzDbDatabase* database() const;
    [[nodiscard]] bool isReadEnabled() const;
    [[nodiscard]] bool isWriteEnabled() const;

    // [open] Gives the opening back; the pointer is not to be used afterwards. When the object was
    // changed, the host brings its picture up to date.
    Tzad::ErrorStatus close();
    // [read-open] For write, by the holder that has it open for read alone. 83 when it is open for
    // write already, which changes nothing.
    [[nodiscard]] Tzad::ErrorStatus upgradeOpen();
    // [write-open] Back to read. Refused without harm for an object that is in no database.
    Tzad::ErrorStatus downgradeOpen();
    // [write-open] Erases the object, or takes that back.
    Tzad::ErrorStatus erase(bool erasing = true);
    [[nodiscard]] bool isErased() const;
    // [read-open] A copy in no database, owned by the caller; null when it cannot be made.
    [[nodiscard]] virtual TzDbObject* clone() const;

    // [write-open] Attaches a field under a key; `id` takes the field's id. The object's database
    // owns the field, which stays open until its `close`. On an object without a database the call
    // fails and the field stays the caller's.
    [[nodiscard]] Tzad::ErrorStatus
    setField(wchar_t const* key, TzDbField* field, TzDbObjectId& id);
    // [read-open] The field under a key, opened; on failure `field` is null.
    [[nodiscard]] Tzad::ErrorStatus
    getField(wchar_t const* key, TzDbField*& field, TzDb::OpenMode mode) const;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    // Takes over the host's part of the object; null for classes of modules.
    explicit TzDbObject(TzDbObjectImp* imp = nullptr);

private:
    friend struct TzDbObjectAccess;  // the host's way in
    TzDbObjectImp* imp_;
};

// [any] Opens an object by its id; on failure `object` is null. The null id and erased objects
// fail.
[[nodiscard]] TZ_API Tzad::ErrorStatus tzdbOpenTzDbObject(TzDbObject*& object,
                                                          TzDbObjectId id,
                                                          TzDb::OpenMode mode,
                                                          bool erasedToo = false);

// [any] The same for a given class: an object of another class is closed again and fails with
// Tzad::eWrongObjectType.
template <class T>
[[nodiscard]] Tzad::ErrorStatus
tzdbOpenObject(T*& object, TzDbObjectId id, TzDb::OpenMode mode, bool erasedToo = false) {
    object = nullptr;
    TzDbObject* opened = nullptr;
    Tzad::ErrorStatus const status = tzdbOpenTzDbObject(opened, id, mode, erasedToo);
    if (status != Tzad::eOk) return status;
    object = tzrxCast<T>(static_cast<TzRxObject*>(opened));
    if (object) return Tzad::eOk;
    (void)opened->close();  // what counts is that it is of another class
    return Tzad::eWrongObjectType;
}

// Takes over an opening for read, makes it one for write, and gives both back at the end: first the
// write, then the read.
//
//   TzDbMText* text = nullptr;
//   if (tzdbOpenObject(text, id, TzDb::kForRead) != Tzad::eOk) return;
//   WritableTzDbObject writable;
//   if (writable.replaceObject(text)) (void)text->setRotation(0);  // nothing to undo
class TZ_API WritableTzDbObject {
public:
    WritableTzDbObject() = default;
    WritableTzDbObject(WritableTzDbObject const&) = delete;
    WritableTzDbObject& operator=(WritableTzDbObject const&) = delete;
    ~WritableTzDbObject();

    // [read-open] Gives back what it holds, takes over the opening of `object` and makes it
    // writable. False for null, or when it stays an opening for read, which is closed at the end
    // all the same.
    [[nodiscard]] bool replaceObject(TzDbObject* object);
    // [any] Back to the opening for read; nothing when it is not writable.
    void revertWrite();
    // [any] The same, and closes the object; nothing when it holds none.
    void revertRead();

private:
    TzDbObject* object_ = nullptr;  // open; null when nothing is held
    bool upgraded_ = false;
};
