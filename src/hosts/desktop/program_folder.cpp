#include "hosts/desktop/program_folder.hpp"

#include <filesystem>
#include <fstream>

namespace quabble {
namespace {

constexpr std::uintmax_t largestFile = 64 << 20;  // bytes

std::filesystem::path pathOf(std::string_view name) {
    return std::filesystem::path(programFolder()) / name;
}

}  // namespace

std::string programFolder() {
    std::error_code unknown;
    return std::filesystem::read_symlink("/proc/self/exe", unknown).parent_path().string();
}

std::vector<std::byte> readProgramFile(std::string_view name) {
    const std::filesystem::path path = pathOf(name);
    std::error_code unknown;
    if (!std::filesystem::is_regular_file(path, unknown))  // a pipe would be waited for
        return {};
    const std::uintmax_t size = std::filesystem::file_size(path, unknown);
    if (unknown || size > largestFile)
        return {};
    std::vector<std::byte> bytes(size);
    std::ifstream stream(path, std::ios::binary);
    if (!stream.read(reinterpret_cast<char*>(bytes.data()), static_cast<std::streamsize>(size)))
        return {};
    return bytes;
}

std::string pathOrAddress(std::string_view document) {
    const bool isAddress = document.find("://") != std::string_view::npos;
    return isAddress ? std::string(document) : pathOf(document).string();
}

}  // namespace quabble
