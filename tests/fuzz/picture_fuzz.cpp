// Feeds any bytes to the picture loaders.

#include <cassert>
#include <span>

#include "draw/bitmap_file.hpp"
#include "draw/large_picture.hpp"
#include "draw/png_file.hpp"

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
    const auto bytes = std::as_bytes(std::span(data, size));
    const auto picture = quabble::decodeBitmap(bytes);
    // A picture never has more pixels than the file has bytes for.
    assert(!picture ||
           static_cast<std::size_t>(picture->width()) * static_cast<std::size_t>(picture->height()) < size);
    const auto compressed = quabble::decodePng(bytes);
    assert(!compressed || (compressed->width() <= 4096 && compressed->height() <= 4096));
    // A band is never larger than its picture says.
    if (auto large = quabble::LargePicture::of(bytes))
        assert(large->cut({0, 20, 8, 36}).height() == 16 * large->factor());
    return 0;
}
