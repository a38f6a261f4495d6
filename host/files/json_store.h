#pragma once

#include <array>
#include <cstddef>
#include <cstring>
#include <memory_resource>
#include <string_view>
#include <type_traits>

#include "host/files/json_value.h"

// The memory of JSON values: what they name lies here until it is cleared, all at once. A drawing
// is read with one store that each entity uses anew, so that values cost no allocations.
namespace tzhost {

class JsonStore {
public:
    JsonStore() = default;
    JsonStore(JsonStore const&) = delete;
    JsonStore& operator=(JsonStore const&) = delete;

    [[nodiscard]] std::string_view keep(std::string_view text) {
        return {copyOf(text.data(), text.size()), text.size()};
    }
    template <class T>
    [[nodiscard]] JsonList<T> keep(T const* first, std::size_t count) {
        return {copyOf(first, count), count};
    }
    // A value of another store with all that it names. Values were read with a bound on their
    // depth, so the calls nest no deeper.
    [[nodiscard]] JsonValue keep(JsonValue const& value);
    // Everything that was kept is gone.
    void clear() { memory_.release(); }

private:
    template <class T>
    [[nodiscard]] T* copyOf(T const* from, std::size_t count) {
        static_assert(std::is_trivially_copyable_v<T> && std::is_trivially_destructible_v<T>);
        if (count == 0) return nullptr;
        void* const to = memory_.allocate(count * sizeof(T), alignof(T));
        std::memcpy(to, static_cast<void const*>(from), count * sizeof(T));
        return static_cast<T*>(to);
    }

    static constexpr std::size_t kUsual = std::size_t{1} << 14;  // an entity with all its members
    alignas(std::max_align_t) std::array<std::byte, kUsual> usual_;
    std::pmr::monotonic_buffer_resource memory_{usual_.data(), usual_.size()};
};

}  // namespace tzhost
