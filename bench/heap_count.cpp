#include "heap_count.hpp"

#include <atomic>
#include <cstddef>

namespace {
std::atomic<std::int64_t> blocks{0};
}

std::int64_t quabble::bench::heapBlocks() {
    return blocks;
}

// The C library's own heap under its inner names, with a count in front. `new` and `delete` come by here as
// well.
extern "C" {
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* block, std::size_t size);
void __libc_free(void* block);

void* malloc(std::size_t size) {
    ++blocks;
    return __libc_malloc(size);
}
void* calloc(std::size_t count, std::size_t size) {
    ++blocks;
    return __libc_calloc(count, size);
}
void* realloc(void* block, std::size_t size) {
    blocks += block == nullptr;
    return __libc_realloc(block, size);
}
void free(void* block) {
    blocks -= block != nullptr;
    __libc_free(block);
}
}
