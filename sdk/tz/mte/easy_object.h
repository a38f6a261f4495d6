#pragma once

class TzDbField;

// Holders of open database objects: a holder gives back what its flags name, on every way out of
// the block.
//
//   EasyObject<TzDbMText> text;                       // flags 1: close at the end
//   if (tzdbOpenObject(text.object, id, TzDb::kForRead) != Tzad::eOk) return;
//
// The members are open to their users, who also take objects out by setting `object` to null. Not
// copyable. Other host modules get such holders through the dialog parameters.
namespace EasyFlags {
inline constexpr unsigned int kNone = 0;
inline constexpr unsigned int kClose = 1;   // close at the end
inline constexpr unsigned int kDelete = 2;  // delete at the end, after closing
}  // namespace EasyFlags

// What holders of objects and of tables have in common.
template <class T>
class EasyHolder {
public:
    EasyHolder(EasyHolder const&) = delete;
    EasyHolder& operator=(EasyHolder const&) = delete;
    virtual ~EasyHolder() {
        if (!object) return;
        // When the host refuses to close, the holder can do nothing about it.
        if (flags & EasyFlags::kClose) (void)object->close();
        if (flags & EasyFlags::kDelete) delete object;
        object = nullptr;
    }

    T* operator->() const { return object; }

    T* object;
    unsigned int flags;

protected:
    EasyHolder(T* held, unsigned int duties) : object(held), flags(duties) {}
};

template <class T>
class EasyObject : public EasyHolder<T> {
public:
    explicit EasyObject(T* held = nullptr, unsigned int duties = EasyFlags::kClose)
        : EasyHolder<T>(held, duties) {}

    // Filled by an editor session alone, for a text without a database; whoever ran the session
    // attaches and closes it.
    TzDbField* field = nullptr;
};

template <class T>
class EasyTable : public EasyHolder<T> {
public:
    explicit EasyTable(T* held = nullptr, unsigned int duties = EasyFlags::kClose)
        : EasyHolder<T>(held, duties) {}
};

// The iterator I of a table T; iterators are deleted and never closed.
template <class T, class I>
class EasyIterator {
public:
    explicit EasyIterator(I* held = nullptr, unsigned int duties = EasyFlags::kDelete)
        : object(held), flags(duties) {}
    EasyIterator(EasyIterator const&) = delete;
    EasyIterator& operator=(EasyIterator const&) = delete;
    ~EasyIterator() {
        if (object && (flags & EasyFlags::kDelete)) delete object;
        object = nullptr;
    }

    I* operator->() const { return object; }

    I* object;
    unsigned int flags;
};
