#include "hosts/desktop/program_folder.hpp"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

namespace quabble {
namespace {

constexpr off_t largestFile = 64 << 20;  // bytes

std::filesystem::path pathOf(std::string_view name) {
    return std::filesystem::path(programFolder()) / name;
}

}  // namespace

std::string programFolder() {
    std::error_code unknown;
    return std::filesystem::read_symlink("/proc/self/exe", unknown).parent_path().string();
}

FileBytes readProgramFile(std::string_view name) {
    FileBytes bytes;
    const int file =
        ::open(pathOf(name).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);  // a pipe is not waited for
    if (file < 0)
        return bytes;
    struct stat status{};
    if (::fstat(file, &status) == 0 && S_ISREG(status.st_mode) && status.st_size <= largestFile) {
        bytes.resize(static_cast<std::size_t>(status.st_size));
        if (::read(file, bytes.data(), bytes.size()) != status.st_size)
            bytes.clear();
    }
    ::close(file);
    return bytes;
}

std::string pathOrAddress(std::string_view document) {
    const bool isAddress = document.find("://") != std::string_view::npos;
    return isAddress ? std::string(document) : pathOf(document).string();
}

}  // namespace quabble
