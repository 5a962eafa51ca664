#include "base/reused_memory.hpp"

namespace quabble {

std::pmr::memory_resource& reusedMemory() {
#ifdef QUABBLE_SANITIZE
    return *std::pmr::new_delete_resource();  // AddressSanitizer is to see everything come and go
#else
    static std::pmr::unsynchronized_pool_resource pool;
    return pool;
#endif
}

}  // namespace quabble
