// Writes a PNG picture in the form that the program takes it in: convert_picture IN.png OUT
//   OUT.bmp   a 24-bit BMP; transparent parts become black
//   OUT.rgba  the pixels alone, four bytes each

#include <stb/stb_image.h>
#include <stb/stb_image_write.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <memory>
#include <string_view>
#include <vector>

namespace {

struct FreePixels {
    void operator()(unsigned char* pixels) const { stbi_image_free(pixels); }
};

std::vector<unsigned char> flattenOverBlack(const unsigned char* rgba, std::size_t pixels) {
    std::vector<unsigned char> rgb;
    rgb.reserve(3 * pixels);
    for (std::size_t i = 0; i < pixels; ++i) {
        for (std::size_t channel = 0; channel < 3; ++channel)
            rgb.push_back(static_cast<unsigned char>(rgba[4 * i + channel] * rgba[4 * i + 3] / 255));
    }
    return rgb;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fputs("usage: convert_picture IN.png OUT.bmp|OUT.rgba\n", stderr);
        return EXIT_FAILURE;
    }
    int width = 0;
    int height = 0;
    const std::unique_ptr<unsigned char, FreePixels> rgba(stbi_load(argv[1], &width, &height, nullptr, 4));
    if (!rgba) {
        std::fprintf(stderr, "convert_picture: cannot read %s: %s\n", argv[1], stbi_failure_reason());
        return EXIT_FAILURE;
    }
    const std::size_t pixels = static_cast<std::size_t>(width) * static_cast<std::size_t>(height);
    bool written = false;
    if (std::string_view(argv[2]).ends_with(".bmp")) {
        written = stbi_write_bmp(argv[2], width, height, 3, flattenOverBlack(rgba.get(), pixels).data()) != 0;
    } else {
        std::ofstream out(argv[2], std::ios::binary);
        out.write(reinterpret_cast<const char*>(rgba.get()), static_cast<std::streamsize>(4 * pixels));
        written = static_cast<bool>(out.flush());
    }
    if (!written) {
        std::fprintf(stderr, "convert_picture: cannot write %s\n", argv[2]);
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
