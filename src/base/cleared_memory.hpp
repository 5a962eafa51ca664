#pragma once

#include <cstddef>
#include <cstdlib>

namespace quabble {

// An allocator of memory that the system has cleared: none of it is touched before it is used.
template <typename T>
struct ClearedMemory {
    using value_type = T;
    T* allocate(std::size_t count) {
        void* memory = std::calloc(count, sizeof(T));
        if (memory == nullptr)
            std::abort();
        return static_cast<T*>(memory);
    }
    void deallocate(T* memory, std::size_t) { std::free(memory); }
    void construct(T*) {}
    template <typename From>
    void construct(T* place, const From& value) {
        *place = value;
    }
    friend bool operator==(const ClearedMemory&, const ClearedMemory&) { return true; }
};

}  // namespace quabble
