#pragma once

#include <string>

namespace quabble::bench {

// The pictures are loaded from the folder.
void measureHeap(const std::string& programFolder);

}  // namespace quabble::bench
