// Copies a large picture and puts behind it the fingerprint of the plain one that it belongs to:
// sign_picture LARGE.png PLAIN.bmp OUT.png

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <span>
#include <string>

#include "draw/bitmap_file.hpp"
#include "draw/fingerprint.hpp"

namespace {

std::string contents(const char* file) {
    std::ifstream stream(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 4) {
        std::fputs("usage: sign_picture LARGE.png PLAIN.bmp OUT.png\n", stderr);
        return EXIT_FAILURE;
    }
    const std::string large = contents(argv[1]);
    const std::string plainFile = contents(argv[2]);
    const auto plain = quabble::decodeBitmap(std::as_bytes(std::span(plainFile)));
    if (large.empty() || !plain) {
        std::fprintf(stderr, "sign_picture: cannot read %s or %s\n", argv[1], argv[2]);
        return EXIT_FAILURE;
    }
    std::ofstream out(argv[3], std::ios::binary);
    out << large;
    const std::uint64_t fingerprint = quabble::fingerprintOf(*plain);
    for (std::size_t i = 0; i < quabble::fingerprintSize; ++i)
        out.put(static_cast<char>(fingerprint >> (8 * i)));
    if (!out.flush()) {
        std::fprintf(stderr, "sign_picture: cannot write %s\n", argv[3]);
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
