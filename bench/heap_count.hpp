#pragma once

#include <cstdint>

namespace quabble::bench {

// How many blocks of the heap this process has now, by whatever means it asked for them.
std::int64_t heapBlocks();

}  // namespace quabble::bench
