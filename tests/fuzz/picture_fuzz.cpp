// Feeds any bytes to the picture loader.

#include <cassert>
#include <span>

#include "draw/bitmap_file.hpp"

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
    const auto picture = quabble::decodeBitmap(std::as_bytes(std::span(data, size)));
    // A picture never has more pixels than the file has bytes for.
    assert(!picture ||
           static_cast<std::size_t>(picture->width()) * static_cast<std::size_t>(picture->height()) < size);
    return 0;
}
