#pragma once

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <utility>
#include <vector>

// The host's growable array. Elements are values; indices count from 0 and are not checked but
// where an operation says so. `growLength` is how many elements room is made for when the array is
// full; it shows only through `physicalLength`.
//
//   TzArray<TzDbObjectId> ids;          // grows by 8
//   ids.append(id);
//   for (TzDbObjectId const& each : ids) ...
template <class T>
class TzArray {
public:
    explicit TzArray(int physicalLength = 0, int growLength = 8) : growLength_(growLength) {
        setPhysicalLength(physicalLength);
    }
    TzArray(std::initializer_list<T> items) : items_(items) {}

    [[nodiscard]] int length() const { return static_cast<int>(items_.size()); }
    [[nodiscard]] bool isEmpty() const { return items_.empty(); }
    [[nodiscard]] int physicalLength() const { return static_cast<int>(items_.capacity()); }
    [[nodiscard]] int growLength() const { return growLength_; }
    // Makes room for at least `length` elements; less than the elements there are changes nothing.
    void setPhysicalLength(int length) {
        if (length > 0) items_.reserve(static_cast<std::size_t>(length));
    }
    // Cuts the array or fills it up with default values.
    void setLogicalLength(int length) {
        items_.resize(static_cast<std::size_t>(std::max(length, 0)));
    }

    [[nodiscard]] T& operator[](int index) { return items_[static_cast<std::size_t>(index)]; }
    [[nodiscard]] T const& operator[](int index) const {
        return items_[static_cast<std::size_t>(index)];
    }
    [[nodiscard]] T& first() { return items_.front(); }
    [[nodiscard]] T const& first() const { return items_.front(); }
    [[nodiscard]] T& last() { return items_.back(); }
    [[nodiscard]] T const& last() const { return items_.back(); }

    // Adds at the end and returns the new index.
    int append(T const& item) {
        if (items_.size() < items_.capacity()) {
            items_.push_back(item);
        } else {
            T copy(item);  // the item may lie in this very array, which moves now
            makeRoom(1);
            items_.push_back(std::move(copy));
        }
        return length() - 1;
    }
    void append(TzArray const& other) {
        if (items_.capacity() - items_.size() < other.items_.size()) makeRoom(other.items_.size());
        // Counted beforehand, as an array may be added to itself.
        for (std::size_t i = 0, count = other.items_.size(); i < count; ++i)
            items_.push_back(other.items_[i]);
    }
    // `index` may be the length; outside 0 to the length nothing happens.
    void insertAt(int index, T const& item) {
        if (index >= 0 && index <= length()) items_.insert(items_.begin() + index, item);
    }
    // Outside the array nothing happens.
    void removeAt(int index) {
        if (index >= 0 && index < length()) items_.erase(items_.begin() + index);
    }
    void removeLast() { removeAt(length() - 1); }
    void removeAll() { items_.clear(); }
    // The first index of an equal element at or after `start`, or -1.
    [[nodiscard]] int find(T const& item, int start = 0) const {
        auto const at =
            std::find(items_.begin() + std::clamp(start, 0, length()), items_.end(), item);
        return at == items_.end() ? -1 : static_cast<int>(at - items_.begin());
    }
    [[nodiscard]] bool contains(T const& item) const { return find(item) >= 0; }

    [[nodiscard]] T* asArrayPtr() { return items_.data(); }
    [[nodiscard]] T const* asArrayPtr() const { return items_.data(); }
    [[nodiscard]] auto begin() { return items_.begin(); }
    [[nodiscard]] auto end() { return items_.end(); }
    [[nodiscard]] auto begin() const { return items_.begin(); }
    [[nodiscard]] auto end() const { return items_.end(); }

private:
    // For at least `count` more: never less than the grow length, nor than half of what there is,
    // so that adding one by one stays linear.
    void makeRoom(std::size_t count) {
        auto const step = static_cast<std::size_t>(std::max(growLength_, 1));
        items_.reserve(items_.size() + std::max({step, count, items_.size() / 2}));
    }

    std::vector<T> items_;
    int growLength_ = 8;
};
