#include "hosts/desktop/registry/registry_file.hpp"

#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <filesystem>

namespace quabble {
namespace {

constexpr mode_t userOnlyFolder = 0700;
constexpr mode_t userOnlyFile = 0600;

// More than a registry of ours ever takes, and little enough to be read through at every start.
constexpr off_t largestFile = off_t{8} << 20;
// Room for the endings that SQLite adds to the names it can take.
constexpr std::size_t longestPath = 500;

// True when nothing lies at the path, or a file that can be opened without waiting for anybody.
bool isFileOrNothing(const std::string& path) {
    struct stat status{};
    if (::stat(path.c_str(), &status) != 0)
        return errno == ENOENT;
    return S_ISREG(status.st_mode) && status.st_size <= largestFile;
}

// The database and the files that SQLite looks for beside it.
bool areFilesOrNothing(const std::string& database) {
    return database.size() <= longestPath &&
           std::ranges::all_of(std::array{"", "-journal", "-wal", "-shm"},
                               [&](const char* ending) { return isFileOrNothing(database + ending); });
}

std::string homeFolder() {
    if (const char* home = std::getenv("HOME"); home != nullptr && *home == '/')
        return home;
    const passwd* user = ::getpwuid(::getuid());
    return user != nullptr && user->pw_dir != nullptr ? user->pw_dir : "/";
}

}  // namespace

// A folder or a file that could not be made shows when the file is opened.
bool prepareRegistryFile(const std::string& path) {
    if (!areFilesOrNothing(path))
        return false;
    const std::filesystem::path above = std::filesystem::path(path).parent_path();
    std::filesystem::path folder;
    for (const auto& part : above) {
        folder /= part;
        ::mkdir(folder.c_str(), userOnlyFolder);
    }
    ::close(::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, userOnlyFile));
    return ::access(above.c_str(), W_OK) == 0;  // a change needs files beside it
}

std::string userRegistryPath(std::string_view programName) {
    const char* dataHome = std::getenv("XDG_DATA_HOME");
    const bool isGiven = dataHome != nullptr && *dataHome == '/';
    const std::string base = isGiven ? dataHome : homeFolder() + "/.local/share";
    return base + "/" + std::string(programName) + "/registry.db";
}

}  // namespace quabble
