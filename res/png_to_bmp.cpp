// Writes a PNG picture as a 24-bit BMP: png_to_bmp IN.png OUT.bmp. Transparent parts become black.

#include <stb/stb_image.h>
#include <stb/stb_image_write.h>

#include <cstdio>
#include <cstdlib>
#include <memory>

namespace {

struct FreePixels {
    void operator()(unsigned char* pixels) const { stbi_image_free(pixels); }
};

void flattenOverBlack(unsigned char* rgba, std::size_t pixels, unsigned char* rgb) {
    for (std::size_t i = 0; i < pixels; ++i) {
        for (std::size_t channel = 0; channel < 3; ++channel)
            rgb[3 * i + channel] = static_cast<unsigned char>(rgba[4 * i + channel] * rgba[4 * i + 3] / 255);
    }
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fputs("usage: png_to_bmp IN.png OUT.bmp\n", stderr);
        return EXIT_FAILURE;
    }
    int width = 0;
    int height = 0;
    const std::unique_ptr<unsigned char, FreePixels> rgba(stbi_load(argv[1], &width, &height, nullptr, 4));
    if (!rgba) {
        std::fprintf(stderr, "png_to_bmp: cannot read %s: %s\n", argv[1], stbi_failure_reason());
        return EXIT_FAILURE;
    }
    const std::size_t pixels = static_cast<std::size_t>(width) * static_cast<std::size_t>(height);
    const auto rgb = std::make_unique<unsigned char[]>(3 * pixels);
    flattenOverBlack(rgba.get(), pixels, rgb.get());
    if (stbi_write_bmp(argv[2], width, height, 3, rgb.get()) == 0) {
        std::fprintf(stderr, "png_to_bmp: cannot write %s\n", argv[2]);
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
