#pragma once

#include "tz/db/database.h"
#include "tz/db/object.h"

// Holders for records of the drawing's tables.
namespace tzdraft {

// An object open for read or write, closed at the end.
template <class Object>
class Opened {
public:
    Opened(TzDbObjectId id, TzDb::OpenMode mode) { (void)tzdbOpenObject(object_, id, mode); }
    explicit Opened(Object* object) : object_(object) {}
    Opened(Opened const&) = delete;
    Opened& operator=(Opened const&) = delete;
    ~Opened() {
        if (object_) (void)object_->close();
    }
    explicit operator bool() const { return object_ != nullptr; }
    Object* operator->() const { return object_; }
    [[nodiscard]] Object* get() const { return object_; }

private:
    Object* object_ = nullptr;
};

// The id of the record of that name in a table; when there is none and `Record` can be made, a new
// one of that name. The null id when the table refuses.
template <class Record, class Table>
[[nodiscard]] TzDbObjectId findOrAdd(Table* table, wchar_t const* name) {
    TzDbObjectId id;
    if (table->getIdAt(name, id) == Tzad::eOk) return id;
    auto* const record = new Record;
    if (record->setName(name) != Tzad::eOk || table->addRecord(record, id) != Tzad::eOk) {
        delete record;
        return {};
    }
    (void)record->close();
    return id;
}

}  // namespace tzdraft
