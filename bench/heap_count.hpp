#pragma once

#include <cstdint>

namespace quabble::bench {

// How many blocks this process has asked the heap for, by whatever means.
std::uint64_t heapBlocks();

}  // namespace quabble::bench
