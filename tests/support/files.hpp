#pragma once

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

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

}  // namespace quabble
