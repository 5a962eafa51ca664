#include "heap_count.hpp"

#include <atomic>
#include <cstddef>

namespace {
std::atomic<std::uint64_t> blocks{0};
}

std::uint64_t quabble::bench::heapBlocks() {
    return blocks;
}

// The C library's own heap under its inner names, with a count in front. `new` comes by here as well.
extern "C" {
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* block, std::size_t size);

void* malloc(std::size_t size) {
    ++blocks;
    return __libc_malloc(size);
}
void* calloc(std::size_t count, std::size_t size) {
    ++blocks;
    return __libc_calloc(count, size);
}
void* realloc(void* block, std::size_t size) {
    ++blocks;
    return __libc_realloc(block, size);
}
}
