#include "write_png.hpp"

#include <png.h>
#include <zlib.h>

#include <cstddef>
#include <utility>

namespace {

constexpr int bestCompression = 9;

// Libpng ends the process when something is wrong, which here only lack of memory can be.
std::vector<unsigned char> writtenWith(int filters, int strategy, const std::vector<unsigned char>& pixels,
                                       int width, int height) {
    std::vector<unsigned char> file;
    const std::size_t channels =
        pixels.size() / (static_cast<std::size_t>(width) * static_cast<std::size_t>(height));
    png_structp png = png_create_write_struct(PNG_LIBPNG_VER_STRING, nullptr, nullptr, nullptr);
    png_infop info = png_create_info_struct(png);
    const auto append = [](png_structp to, png_bytep bytes, std::size_t count) {
        auto& written = *static_cast<std::vector<unsigned char>*>(png_get_io_ptr(to));
        written.insert(written.end(), bytes, bytes + count);
    };
    png_set_write_fn(png, &file, append, nullptr);
    png_set_IHDR(png, info, static_cast<png_uint_32>(width), static_cast<png_uint_32>(height), 8,
                 channels == 4 ? PNG_COLOR_TYPE_RGBA : PNG_COLOR_TYPE_RGB, PNG_INTERLACE_NONE,
                 PNG_COMPRESSION_TYPE_DEFAULT, PNG_FILTER_TYPE_DEFAULT);
    png_set_compression_level(png, bestCompression);
    png_set_compression_mem_level(png, bestCompression);
    png_set_compression_strategy(png, strategy);
    png_set_filter(png, PNG_FILTER_TYPE_BASE, filters);
    png_write_info(png, info);
    const std::size_t stride = channels * static_cast<std::size_t>(width);
    for (std::size_t at = 0; at < pixels.size(); at += stride)
        png_write_row(png, pixels.data() + at);
    png_write_end(png, info);
    png_destroy_write_struct(&png, &info);
    return file;
}

}  // namespace

std::vector<unsigned char> smallestPng(const std::vector<unsigned char>& pixels, int width, int height) {
    std::vector<unsigned char> smallest;
    for (const auto& [filters, strategy] :
         {std::pair{PNG_FILTER_NONE, Z_DEFAULT_STRATEGY}, std::pair{PNG_FILTER_PAETH, Z_FILTERED},
          std::pair{PNG_ALL_FILTERS, Z_FILTERED}}) {
        auto file = writtenWith(filters, strategy, pixels, width, height);
        if (smallest.empty() || file.size() < smallest.size())
            smallest.swap(file);
    }
    return smallest;
}
