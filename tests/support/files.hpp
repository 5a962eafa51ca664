#pragma once

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <span>
#include <stdexcept>
#include <string>
#include <vector>

#include "draw/bitmap_file.hpp"

namespace quabble {

// A new, empty folder that nobody else has, whatever an earlier run has left; it goes with the object.
struct TemporaryFolder {
    std::filesystem::path path;

    TemporaryFolder() {
        std::string name = (std::filesystem::temp_directory_path() / "quabble_XXXXXX").string();
        if (mkdtemp(name.data()) == nullptr)
            throw std::runtime_error("There is no folder for temporary files.");
        path = name;
    }
    ~TemporaryFolder() { std::filesystem::remove_all(path); }
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;
};

// What is in a file; nothing when it is none.
inline std::string bytesOf(const std::filesystem::path& file) {
    if (!std::filesystem::is_regular_file(file))
        return {};
    std::ifstream stream(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

// A 24-bit BMP file; empty when it is none.
inline Surface readPicture(const std::filesystem::path& file) {
    const std::string bytes = bytesOf(file);
    return decodeBitmap(std::as_bytes(std::span(bytes))).value_or(Surface());
}

// The pictures that a built program lies beside, as a machine without a screen takes its files.
inline std::map<std::string, std::vector<std::byte>, std::less<>> picturesIn(
    const std::filesystem::path& folder) {
    std::map<std::string, std::vector<std::byte>, std::less<>> pictures;
    for (const char* name : {"ALLPICDATA.BMP", "ALLPICDATA.BIG", "BGIMG.BMP", "BGIMG.BIG"}) {
        const std::string file = bytesOf(folder / name);
        const auto bytes = std::as_bytes(std::span(file));
        pictures[name].assign(bytes.begin(), bytes.end());
    }
    return pictures;
}

}  // namespace quabble
