// Fills the help page with pictures made of the game's own tiles: fill_help_page SHEET TEMPLATE OUT
// In the template a picture stands among the attributes of an <img>, where its size and its source go:
//   {{board 1123/*4*42~1}}  rows of cells from the top down, each the hexadecimal digit of a tile (0 empty,
//   1-4
//                           blocks, 5 stone, 6 stone letting go, 7-9 bombs, a-d explosion) or "." for no
//                           cell;
//                           "~" before a cell veils it, "*" frames it together with its framed neighbours
//   {{gauge 40}}            the gauge of a level, 40 per cent full

#include <stb/stb_image.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "write_png.hpp"

namespace {

constexpr int tileSize = 28;
constexpr std::uint32_t white = 0xffffffff;

void require(bool condition, const std::string& sentence) {
    if (!condition)
        throw std::runtime_error(sentence);
}

struct Picture {
    template <typename Pixel>
    Picture(int w, int h, Pixel pixel) : width(w), height(h) {
        for (int i = 0; i < w * h; ++i)
            pixels.push_back(pixel(i % w, i / w));
    }
    std::uint32_t at(int x, int y) const {
        return pixels.at(static_cast<std::size_t>(y) * static_cast<std::size_t>(width) +
                         static_cast<std::size_t>(x));
    }

    int width;
    int height;
    std::vector<std::uint32_t> pixels;  // four bytes each, red first; 0 is transparent
};

Picture readSheet(const char* path) {
    int width = 0;
    int height = 0;
    unsigned char* rgba = stbi_load(path, &width, &height, nullptr, 4);
    require(rgba != nullptr && width == 400 && height == 838,
            "the sheet cannot be read, or is not 400 x 838");
    Picture sheet(width, height, [](int, int) { return 0U; });
    std::memcpy(sheet.pixels.data(), rgba, 4 * sheet.pixels.size());
    stbi_image_free(rgba);
    return sheet;
}

// The rows of a board, every cell in two characters: its mark or a blank, and its digit.
std::vector<std::string> rowsOf(const std::string& notation) {
    static const std::regex board("([~*]?[0-9a-d.])+(/([~*]?[0-9a-d.])+)*");
    static const std::regex beforeUnmarked("(^|[^~*])(?=[0-9a-d.])");
    require(std::regex_match(notation, board), "is not written as a board is");
    std::istringstream cells(std::regex_replace(notation, beforeUnmarked, "$1 "));
    std::vector<std::string> rows;
    for (std::string row; std::getline(cells, row, '/'); rows.push_back(row))
        require(rows.empty() || row.size() == rows[0].size(), "has rows of different lengths");
    return rows;
}

// A frame covers the pixels of its cells that lie within two of any other cell, across a corner too.
Picture drawBoard(const Picture& sheet, const std::string& notation) {
    const std::vector<std::string> rows = rowsOf(notation);
    const int width = tileSize * static_cast<int>(rows[0].size() / 2);
    const int height = tileSize * static_cast<int>(rows.size());
    const auto cellAt = [&](int x, int y) {
        if (x < 0 || y < 0 || x >= width || y >= height)
            return std::string_view(" .");
        const std::string_view row = rows[static_cast<std::size_t>(y / tileSize)];
        return row.substr(2 * static_cast<std::size_t>(x / tileSize), 2);
    };
    return {width, height, [&](int x, int y) -> std::uint32_t {
                const char mark = cellAt(x, y)[0];
                const char digit = cellAt(x, y)[1];
                if (digit == '.')
                    return 0;
                for (int corner = 0; mark == '*' && corner < 4; ++corner) {
                    if (cellAt(x - 2 + corner % 2 * 4, y - 2 + corner / 2 * 4)[0] != '*')
                        return white;
                }
                const int tile = digit <= '9' ? digit - '0' : digit - 'a' + 10;
                const auto veil = mark == '~' ? sheet.at(x % tileSize, tileSize + y % tileSize) : white;
                return veil & sheet.at(tile * tileSize + x % tileSize, y % tileSize);
            }};
}

Picture drawGauge(const Picture& sheet, int percentage) {
    return {30, 241,
            [&](int x, int y) { return sheet.at(x + (100 * y < 241 * percentage ? 274 : 246), y + 29); }};
}

std::string base64(const std::vector<unsigned char>& bytes) {
    constexpr std::string_view digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    std::string text;
    for (std::size_t i = 0; i < bytes.size(); i += 3) {
        std::uint32_t group = 0;
        for (std::size_t k = i; k < i + 3; ++k)
            group = group << 8 | (k < bytes.size() ? static_cast<unsigned char>(bytes[k]) : 0U);
        for (std::size_t k = 0; k < 4; ++k)
            text += i + k <= bytes.size() ? digits[group >> (18 - 6 * k) & 63] : '=';
    }
    return text;
}

std::vector<unsigned char> bytesOf(const Picture& picture) {
    std::vector<unsigned char> bytes(4 * picture.pixels.size());
    std::memcpy(bytes.data(), picture.pixels.data(), bytes.size());
    return bytes;
}

std::string attributesOf(const Picture& picture) {
    const auto png = smallestPng(bytesOf(picture), picture.width, picture.height);
    std::ostringstream text;
    text << "width=\"" << picture.width << "\" height=\"" << picture.height
         << "\" style=\"--w:" << picture.width << ";--h:" << picture.height
         << "\" src=\"data:image/png;base64," << base64(png) << '"';
    return text.str();
}

std::string fill(const std::string& page, const Picture& sheet) {
    static const std::regex placeholder("\\{\\{([^}\n]*)(\\}\\})?");
    static const std::regex gauge("gauge (\\d\\d?|100)");
    std::string filled;
    std::string rest;
    for (std::sregex_iterator match(page.begin(), page.end(), placeholder), end; match != end; ++match) {
        const std::string wanted = match->str(1);
        try {
            require((*match)[2].matched, "does not end on its line");
            const bool isGauge = std::regex_match(wanted, gauge);
            require(isGauge || wanted.starts_with("board "), "is neither a board nor a gauge of 0 to 100");
            filled += match->prefix().str();
            filled += attributesOf(isGauge ? drawGauge(sheet, std::stoi(wanted.substr(6)))
                                           : drawBoard(sheet, wanted.substr(6)));
        } catch (const std::runtime_error& error) {
            throw std::runtime_error("the picture " + match->str() + " " + error.what());
        }
        rest = match->suffix();
    }
    require(!filled.empty(), "the template cannot be read, or asks for no picture");
    return filled + rest;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        require(argc == 4, "wanted are three files: SHEET TEMPLATE OUT");
        const Picture sheet = readSheet(argv[1]);
        std::ifstream in(argv[2], std::ios::binary);
        const std::string page = fill({std::istreambuf_iterator<char>(in), {}}, sheet);
        std::ofstream out(argv[3], std::ios::binary);
        require(static_cast<bool>((out << page).flush()), std::string("cannot write ") + argv[3]);
    } catch (const std::runtime_error& error) {
        std::fprintf(stderr, "fill_help_page: %s\n", error.what());
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
