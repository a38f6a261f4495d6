#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "tz/db/object.h"

struct TzDbObjectRecord;

namespace tzhost {

struct ObjectList;

// The value of a member of a drawing file that this host does not know, as JSON text, by the path
// of its object ("" for the entity's own members, "columns" for those inside that member).
struct UnknownMember {
    std::string path;
    std::string name;
    std::string json;

    friend bool operator==(UnknownMember const&, UnknownMember const&) = default;
};
using UnknownMembers = std::vector<UnknownMember>;

// The field under a key of an object.
using FieldLinks = std::vector<std::pair<std::wstring, TzDbObjectId>>;

}  // namespace tzhost

// The host's part of an object: the values of its class, which undo copies and puts back. Each
// class derives its own; what belongs to the object rather than to its values (the record, who
// embeds it) stays when values are exchanged.
class TzDbObjectImp {
public:
    TzDbObjectImp() = default;
    virtual ~TzDbObjectImp();
    TzDbObjectImp& operator=(TzDbObjectImp const&) = delete;

    // The values in a fresh record-less part.
    [[nodiscard]] virtual std::unique_ptr<TzDbObjectImp> copy() const = 0;
    // Whether values of the same class are these, to the last bit; nothing computed counts. A class
    // with values of its own compares them too.
    [[nodiscard]] virtual bool isSameAs(TzDbObjectImp const& other) const;
    // Called when these values have become those of `object`.
    virtual void settle(TzDbObject& /*object*/) {}
    // Makes these values those of a copy in no drawing: what belongs to the original stays with it.
    virtual void loosen() { fields.reset(); }
    // Called around erasing and taking that back, with the object open for write.
    virtual void onErase(bool /*erasing*/) {}
    // Forgets what was computed from the values.
    virtual void forgetComputed() {}
    // Shows the evaluated text of a field; false for classes that show none.
    virtual bool showFieldText(std::wstring const& /*text*/) { return false; }
    // Whether a value of this object names that record.
    [[nodiscard]] virtual bool refersTo(TzDbObjectRecord const* /*named*/) const { return false; }
    // The objects that this one lists in order; null for one that lists none.
    [[nodiscard]] virtual tzhost::ObjectList* list() { return nullptr; }
    // The record whose lock decides whether this object may be written; null for none.
    [[nodiscard]] virtual TzDbObjectRecord* lockingLayer() const { return nullptr; }

    TzDbObjectRecord* record = nullptr;  // null while the object is in no drawing
    TzDbObject* embedder = nullptr;      // the object that owns this one as a part; else null
    std::unique_ptr<tzhost::UnknownMembers> unknown;  // null when there are none
    std::unique_ptr<tzhost::FieldLinks> fields;       // null when there are none

protected:
    TzDbObjectImp(TzDbObjectImp const& other);
};

// The host's way into objects.
struct TzDbObjectAccess {
    [[nodiscard]] static TzDbObjectImp* imp(TzDbObject const& object) { return object.imp_; }
    // Gives `object` other values and returns the ones before; record and embedder stay.
    static std::unique_ptr<TzDbObjectImp> exchange(TzDbObject& object,
                                                   std::unique_ptr<TzDbObjectImp> values);
};

namespace tzhost {

// The values of an object that is known to have those of its class.
template <class Imp>
[[nodiscard]] Imp& valuesOf(TzDbObject const& object) {
    return static_cast<Imp&>(*TzDbObjectAccess::imp(object));
}

// Prepares a change of the object's values: refuses when it is not open for write, notes the values
// for undo, marks the object as changed.
[[nodiscard]] Tzad::ErrorStatus beginChange(TzDbObject& object);
// The same without looking at openings, for changes that the host makes itself.
void beginHostChange(TzDbObject& object);

// The failing status that the fault plan wants from this call of `operation`; eOk for none.
[[nodiscard]] Tzad::ErrorStatus faultStatus(char const* operation,
                                            Tzad::ErrorStatus usual = Tzad::eInternal);

// Sets one value of an object: what every plain setter does. `operation` is its name in the fault
// plan; a value that is not `valid` is refused with `refusal`.
template <class Imp, class Value>
[[nodiscard]] Tzad::ErrorStatus assign(TzDbObject& object,
                                       char const* operation,
                                       Value Imp::*member,
                                       Value value,
                                       bool valid = true,
                                       Tzad::ErrorStatus refusal = Tzad::eOutOfRange) {
    if (auto const fault = faultStatus(operation)) return fault;
    if (!valid) return refusal;
    if (auto const status = beginChange(object)) return status;
    valuesOf<Imp>(object).*member = std::move(value);
    return Tzad::eOk;
}

// The same for a value that decides how the object looks, so that what was measured is forgotten.
template <class Imp, class Value>
[[nodiscard]] Tzad::ErrorStatus reshape(TzDbObject& object,
                                        char const* operation,
                                        Value Imp::*member,
                                        Value value,
                                        bool valid = true,
                                        Tzad::ErrorStatus refusal = Tzad::eOutOfRange) {
    auto const status = assign(object, operation, member, std::move(value), valid, refusal);
    if (status == Tzad::eOk) TzDbObjectAccess::imp(object)->forgetComputed();
    return status;
}

}  // namespace tzhost
