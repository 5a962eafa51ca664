// Writes a large rendering of a picture in the form that the program takes it in, and behind it the
// fingerprint of the plain picture that it belongs to: make_large_picture RENDERED.png PLAIN.bmp OUT The form
// is described in src/draw/large_picture.hpp.

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <span>
#include <string>

#include "draw/bitmap_file.hpp"
#include "draw/fingerprint.hpp"
#include "draw/large_picture.hpp"
#include "draw/png_file.hpp"
#include "write_png.hpp"

namespace {

std::string contents(const char* file) {
    std::ifstream stream(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

void put(std::ostream& out, std::uint64_t number, std::size_t bytes) {
    for (std::size_t i = 0; i < bytes; ++i)
        out.put(static_cast<char>(number >> (8 * i)));
}

// The rows of a band, three bytes a pixel.
std::vector<unsigned char> pixelsOf(const quabble::Surface& picture, int top, int bottom) {
    std::vector<unsigned char> bytes;
    for (int y = top; y < bottom; ++y) {
        for (const std::uint32_t pixel : picture.row(y)) {
            const quabble::Colour colour = quabble::colourOf(pixel);
            bytes.insert(bytes.end(), {colour.red, colour.green, colour.blue});
        }
    }
    return bytes;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 4) {
        std::fputs("usage: make_large_picture RENDERED.png PLAIN.bmp OUT\n", stderr);
        return EXIT_FAILURE;
    }
    const std::string renderedFile = contents(argv[1]);
    const std::string plainFile = contents(argv[2]);
    const auto large = quabble::decodePng(std::as_bytes(std::span(renderedFile)));
    const auto plain = quabble::decodeBitmap(std::as_bytes(std::span(plainFile)));
    if (!large || !plain || large->width() % plain->width() != 0) {
        std::fprintf(stderr, "make_large_picture: %s and %s do not belong together\n", argv[1], argv[2]);
        return EXIT_FAILURE;
    }
    const int factor = large->width() / plain->width();
    std::ofstream out(argv[3], std::ios::binary);
    for (const int number : {factor, plain->width(), plain->height()})
        put(out, static_cast<std::uint64_t>(number), 4);
    const int bandHeight = quabble::LargePicture::bandHeight * factor;
    for (int top = 0; top < large->height(); top += bandHeight) {
        const int bottom = std::min(top + bandHeight, large->height());
        const auto band = smallestPng(pixelsOf(*large, top, bottom), large->width(), bottom - top);
        put(out, band.size(), 4);
        out.write(reinterpret_cast<const char*>(band.data()), static_cast<std::streamsize>(band.size()));
    }
    put(out, quabble::fingerprintOf(*plain), quabble::fingerprintSize);
    if (!out.flush()) {
        std::fprintf(stderr, "make_large_picture: cannot write %s\n", argv[3]);
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
